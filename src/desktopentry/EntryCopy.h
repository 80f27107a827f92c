// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

class VelDesktopEntryPropsWidgetPrivate;

namespace VelUI {

/// Fills the properties form from another entry, as an edit of the user's.
class EntryCopy
{
public:
    explicit EntryCopy(VelDesktopEntryPropsWidgetPrivate &form);

    /// \a loaded is what the form was loaded from. With assistance, the texts of all languages are taken.
    void take(VelUIDesktopEntry entry, const VelUIDesktopEntry &loaded);

private:
    void takeTranslations(const VelUIDesktopEntry &entry);

    VelDesktopEntryPropsWidgetPrivate &m_form;
};

} // namespace VelUI
