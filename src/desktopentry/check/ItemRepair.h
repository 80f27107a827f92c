// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryText.h"

#include <QStringList>

/// Other values for a list.
namespace ItemRepair {

/// The items of \a key with \a items in the place of each \a item; none of them stands twice then.
QStringList replaced(const EntryText::Key &key, const QByteArray &item, const QStringList &items);

/// The one of \a names that \a item is but for the case of letters and blanks around it; empty when it
/// is none.
QString meant(const QByteArray &item, const QStringList &names);

/// Whether \a item stands in \a key more than once and this is not the first time, \a index.
bool isRepeated(const QByteArrayList &items, int index);

} // namespace ItemRepair
