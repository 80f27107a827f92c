// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

#include <QStringList>

/// Other values for a list.
namespace ItemRepair {

/// The items of \a value with \a items in the place of each \a item; none of them stands twice then. Empty
/// where the value is too long to be repaired.
QStringList replaced(const CheckedValue &value, const QByteArray &item, const QStringList &items);

/// The one of \a names that \a item is but for the case of letters and blanks around it; empty when it
/// is none.
QString meant(const QByteArray &item, const QStringList &names);

} // namespace ItemRepair
