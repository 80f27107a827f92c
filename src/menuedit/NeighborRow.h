// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QModelIndex>

/**
 * Which row becomes the current one when others go.
 */
namespace NeighborRow {

/**
 * The row of column 0 that the keyboard goes on from when the rows \a first to \a last of
 * \a parent go: the one below them, else the one above, else \a ifNone.
 */
QModelIndex whenGone(const QAbstractItemModel &model, const QModelIndex &parent, int first, int last,
                     const QModelIndex &ifNone);

} // namespace NeighborRow
