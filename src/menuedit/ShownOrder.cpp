// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShownOrder.h"

#include "OnDisk.h"
#include "SortOrder.h"

#include <QFileSystemModel>
#include <QSortFilterProxyModel>

QStringList ShownOrder::with(const QSortFilterProxyModel &proxy, const QString &name, int row,
                             const QModelIndex &folder)
{
    // The row of a file that went stands for a moment longer.
    const std::optional<QSet<QString>> present =
        OnDisk::namesIn(folder.data(QFileSystemModel::FilePathRole).toString());
    const QModelIndex shown = proxy.mapFromSource(folder);
    QStringList children;
    int place = -1;
    for (int i = 0; i < proxy.rowCount(shown); ++i) {
        const QModelIndex child = proxy.mapToSource(proxy.index(i, 0, shown));
        if (child.row() == row)
            place = children.size();
        const QString childName = child.data(QFileSystemModel::FileNameRole).toString();
        if (!present || present->contains(childName))
            children.append(childName);
    }
    if (row == proxy.sourceModel()->rowCount(folder))
        place = children.size();
    return SortOrder::rewritten(children, name, place);
}
