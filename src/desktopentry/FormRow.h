// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryTypeRules.h"

#include <QString>

class QWidget;

namespace VelUI {

/// A row of the properties form, as those see it who add something to the form.
struct FormRow
{
    QString key; ///< of the entry: "Name"
    QString label; ///< as it is shown, without a colon
    EntryTypeRules::ShownFor shownFor = EntryTypeRules::ShownFor::All;
    /// What the label says beside the language; empty in a row without one.
    QString translated;
    int number = 0; ///< in the FormLayout
    /// A QLineEdit, QCheckBox, PathEdit, IconEdit, StringListEdit, ActionListEdit, or the
    /// QComboBox of the type.
    QWidget *field = nullptr;

    bool isTranslation() const { return !translated.isEmpty(); }
};

} // namespace VelUI
