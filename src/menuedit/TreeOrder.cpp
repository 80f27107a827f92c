// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeOrder.h"

#include <QHash>
#include <QPair>
#include <QVector>

#include <algorithm>

namespace {

// The rows that lead to an item, from the outside in.
using Place = QVector<int>;
using PlacedItem = QPair<Place, QModelIndex>;

Place placeOf(const QModelIndex &item)
{
    Place place;
    for (QModelIndex index = item; index.isValid(); index = index.parent())
        place.prepend(index.row());
    return place;
}

// What has been selected by thousands lies in few folders.
QVector<PlacedItem> placed(const QModelIndexList &items)
{
    QVector<PlacedItem> result;
    result.reserve(items.size());
    QHash<QModelIndex, Place> folders;
    for (const QModelIndex &item : items) {
        const QModelIndex folder = item.parent();
        auto place = folders.find(folder);
        if (place == folders.end())
            place = folders.insert(folder, placeOf(folder));
        result.append({*place + Place{item.row()}, item});
    }
    std::sort(result.begin(), result.end(), [](const PlacedItem &left, const PlacedItem &right) {
        return std::lexicographical_compare(left.first.begin(), left.first.end(), right.first.begin(),
                                            right.first.end());
    });
    return result;
}

bool liesIn(const Place &inner, const Place &outer)
{
    return inner.size() > outer.size() && std::equal(outer.begin(), outer.end(), inner.begin());
}

} // namespace

QModelIndexList TreeOrder::fromTop(const QModelIndexList &items)
{
    QModelIndexList result;
    for (const PlacedItem &item : placed(items))
        result.append(item.second);
    return result;
}

QItemSelection TreeOrder::ranges(const QModelIndexList &items)
{
    QItemSelection result;
    for (const PlacedItem &placedItem : placed(items)) {
        const QModelIndex &item = placedItem.second;
        const QModelIndex above =
            result.isEmpty() ? QModelIndex() : QModelIndex(result.constLast().bottomRight());
        if (above.isValid() && above.parent() == item.parent() && above.row() + 1 == item.row())
            result.last() = QItemSelectionRange(result.constLast().topLeft(), item);
        else
            result.append(QItemSelectionRange(item));
    }
    return result;
}

// What lies in an item follows it at once.
QModelIndexList TreeOrder::outermost(const QModelIndexList &items)
{
    QModelIndexList result;
    Place outer;
    for (const PlacedItem &item : placed(items)) {
        if (!result.isEmpty() && liesIn(item.first, outer))
            continue;
        outer = item.first;
        result.append(item.second);
    }
    return result;
}
