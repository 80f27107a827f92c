// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShownOrder.h"

#include "SortOrder.h"
#include "VelMenuProxyModel.h"

#include <frame/FolderListing.h>

#include <QFileSystemModel>
#include <QSortFilterProxyModel>

namespace {

// What a filter leaves out keeps its place.
QVector<QModelIndex> childrenOf(const QSortFilterProxyModel &proxy, const QModelIndex &folder)
{
    const auto *menu = qobject_cast<const VelMenuProxyModel *>(&proxy);
    if (menu && menu->isFiltered())
        return menu->allInOrder(folder);
    const QModelIndex shown = proxy.mapFromSource(folder);
    QVector<QModelIndex> children;
    for (int i = 0; i < proxy.rowCount(shown); ++i)
        children.append(proxy.mapToSource(proxy.index(i, 0, shown)));
    return children;
}

} // namespace

QStringList ShownOrder::of(const QSortFilterProxyModel &proxy, const QModelIndex &folder)
{
    // With none in a place of its own; the first in the list stands for children that come later.
    return with(proxy, QString(), -1, folder).mid(1);
}

QStringList ShownOrder::with(const QSortFilterProxyModel &proxy, const QString &name, int row,
                             const QModelIndex &folder)
{
    return with(proxy, QStringList(name), row, folder);
}

QStringList ShownOrder::with(const QSortFilterProxyModel &proxy, const QStringList &names, int row,
                             const QModelIndex &folder)
{
    // The row of a file that went stands for a moment longer.
    const std::optional<QSet<QString>> present =
        FolderListing::namesIn(folder.data(QFileSystemModel::FilePathRole).toString());
    QStringList children;
    int place = -1;
    for (const QModelIndex &child : childrenOf(proxy, folder)) {
        if (child.row() == row)
            place = children.size();
        const QString childName = child.data(QFileSystemModel::FileNameRole).toString();
        if (!present || present->contains(childName))
            children.append(childName);
    }
    if (row == proxy.sourceModel()->rowCount(folder))
        place = children.size();
    return SortOrder::rewritten(children, names, place);
}
