// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QLineEdit>
#include <QString>

#include <climits>
#include <type_traits>

namespace VelUI {

/// Makes a field under an object name. A line for a value takes values of any length, which
/// it would cut off otherwise.
template <typename Field>
Field *makeField(const char *objectName, QWidget *parent)
{
    auto *field = new Field(parent);
    field->setObjectName(QLatin1String(objectName));
    if constexpr (std::is_same_v<Field, QLineEdit>)
        field->setMaxLength(INT_MAX);
    return field;
}

} // namespace VelUI
