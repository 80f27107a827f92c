// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MeantRow.h"

MeantRow::MeantRow(const QAbstractItemModel &model, int row, const QModelIndex &folder)
    : m_row(row)
    , m_isLast(row == model.rowCount(folder))
    , m_following(row >= 0 && !m_isLast ? model.index(row, 0, folder) : QModelIndex())
{
}

int MeantRow::in(const QAbstractItemModel &model, const QModelIndex &folder) const
{
    return m_row == -1 ? -1 : m_isLast ? model.rowCount(folder) : m_following.row();
}
