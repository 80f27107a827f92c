// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "NeighborRow.h"

#include <QAbstractItemModel>

QModelIndex NeighborRow::whenGone(const QAbstractItemModel &model, const QModelIndex &parent, int first,
                                  int last, const QModelIndex &ifNone)
{
    const QModelIndex below = model.index(last + 1, 0, parent);
    if (below.isValid())
        return below;
    return first > 0 ? model.index(first - 1, 0, parent) : ifNone;
}
