// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QPersistentModelIndex>

/**
 * The row before which something is to be listed in a folder, whatever rows come and go meanwhile.
 */
class MeantRow
{
public:
    /// The \a row as it is now in \a folder of \a model; -1 for no row.
    MeantRow(const QAbstractItemModel &model, int row, const QModelIndex &folder);

    /// Where it is by now; -1 where there was no row, or the child that stood there is gone.
    int in(const QAbstractItemModel &model, const QModelIndex &folder) const;

private:
    const int m_row;
    const bool m_isLast;
    const QPersistentModelIndex m_following;
};
