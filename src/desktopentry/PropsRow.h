// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryTypeRules.h"

#include <frame/DesktopEntryRecord.h>

#include <QString>

#include <functional>

class QWidget;
class VelDesktopEntryPropsWidgetPrivate;

namespace VelUI {

/// One row of the properties form: one key of an entry.
struct PropsRow
{
    using Form = VelDesktopEntryPropsWidgetPrivate;

    enum class Label { Plain, Required, Localized };
    using ShownFor = EntryTypeRules::ShownFor;

    Label kind;
    const char *label; ///< an English text in the context of the form
    ShownFor shownFor;
    int Form::*number; ///< where the row number is kept; null where the field is the whole row

    /// Makes the field and appends the row; gives the row number.
    std::function<int(Form &, const QString &label)> add;
    std::function<QWidget *(const Form &)> field;
    std::function<void(Form &, const VelUIDesktopEntry &)> load;
    std::function<void(const Form &, VelUIDesktopEntry *)> save;
    std::function<void(Form &)> clear;
};

} // namespace VelUI
