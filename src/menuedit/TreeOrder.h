// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QItemSelection>
#include <QModelIndexList>

/**
 * Where items stand in a tree, whichever they are.
 */
namespace TreeOrder {

/// The \a items of one model in the order of the tree: each before those below it, siblings from the
/// top to the bottom.
QModelIndexList fromTop(const QModelIndexList &items);

/// The same, without those that lie in others of them.
QModelIndexList outermost(const QModelIndexList &items);

/// The same as fromTop(), neighbors together.
QItemSelection ranges(const QModelIndexList &items);

} // namespace TreeOrder
