// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryTypeRules.h"

#include <frame/DesktopEntryRecord.h>

namespace VelUI {

class FormLayout;

/// One row of the properties form: where the form has it, and the key of an entry that it shows.
class PropsRow
{
public:
    using ShownFor = EntryTypeRules::ShownFor;

    /// The row \a number of \a layout.
    PropsRow(ShownFor shownFor, FormLayout *layout, int number);
    virtual ~PropsRow();

    ShownFor shownFor() const;
    virtual void setVisible(bool visible);

    virtual void load(const VelUIDesktopEntry &entry) = 0;
    virtual void save(VelUIDesktopEntry *entry) const = 0;
    /// Empties the row; what it showed is kept until restore() or forget().
    virtual void putAway() = 0;
    /// Shows again what was put away.
    virtual void restore() = 0;
    /// Forgets what was put away.
    virtual void forget() = 0;

private:
    Q_DISABLE_COPY(PropsRow)
    const ShownFor m_shownFor;
    FormLayout *const m_layout;
    const int m_number;
};

} // namespace VelUI
