// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuReordering.h"

#include "BlockMove.h"
#include "FolderOrder.h"
#include "MenuVoice.h"
#include "ShownMenu.h"
#include "ShownOrder.h"
#include "SortOrder.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <algorithm>

namespace {

// The source row of what follows the \a shown item, where a filter leaves that out, too.
int rowBelow(const ShownMenu &menu, const QModelIndex &shown, const QModelIndex &sourceFolder)
{
    const QVector<QModelIndex> children = menu.proxy().allInOrder(sourceFolder);
    const int place = children.indexOf(menu.proxy().mapToSource(shown));
    return place >= 0 && place + 1 < children.size() ? children.at(place + 1).row()
                                                     : menu.files().rowCount(sourceFolder);
}

} // namespace

bool MenuReordering::list(const ShownMenu &menu, MenuVoice &voice, const QString &name, int row,
                          const QModelIndex &folder)
{
    const QString path = folder.isValid() ? menu.files().filePath(folder) : QString();
    if (path.isEmpty())
        return false;
    write(menu, voice, path, ShownOrder::with(menu.proxy(), name, row, folder));
    return true;
}

void MenuReordering::write(const ShownMenu &menu, MenuVoice &voice, const QString &folder,
                           const QStringList &list)
{
    const bool isSaved = FolderOrder::write(folder, list);
    menu.files().noteRecordFile(folder);
    if (!isSaved)
        voice.tell(FolderOrder::notSaved(folder), MenuVoice::Failure);
}

void MenuReordering::move(const ShownMenu &menu, MenuVoice &voice, const QModelIndex &item, bool up)
{
    if (!item.isValid())
        return;
    const QModelIndex shown = menu.proxy().mapFromSource(item);
    const QModelIndex folder = shown.parent();
    const QModelIndex sourceFolder = item.parent();
    const int target = up ? shown.row() - 1 : shown.row() + 2;
    int row = menu.files().rowCount(sourceFolder);
    if (!up && menu.proxy().isFiltered())
        row = rowBelow(menu, menu.proxy().index(shown.row() + 1, 0, folder), sourceFolder);
    else if (target < menu.proxy().rowCount(folder))
        row = menu.proxy().mapToSource(menu.proxy().index(std::max(target, 0), 0, folder)).row();
    list(menu, voice, item.data(QFileSystemModel::FileNameRole).toString(), row, sourceFolder);
    menu.proxy().invalidateSortOrder(menu.files().filePath(sourceFolder));
}

void MenuReordering::moveAll(const ShownMenu &menu, MenuVoice &voice, const QModelIndexList &items, bool up)
{
    const QModelIndex folder = items.isEmpty() ? QModelIndex() : items.constFirst().parent();
    if (!folder.isValid())
        return;
    const auto nameOf = [](const QModelIndex &index) {
        return index.data(QFileSystemModel::FileNameRole).toString();
    };
    QSet<QString> moved;
    for (const QModelIndex &item : items)
        moved.insert(nameOf(item));
    QStringList shown;
    const QModelIndex shownFolder = menu.proxy().mapFromSource(folder);
    for (int row = 0; row < menu.proxy().rowCount(shownFolder); ++row)
        shown.append(nameOf(menu.proxy().index(row, 0, shownFolder)));
    const QStringList all = ShownOrder::of(menu.proxy(), folder);
    const QStringList order = BlockMove::byOne(all, shown, moved, up);
    if (order == all)
        return;
    const QString path = menu.files().filePath(folder);
    write(menu, voice, path, SortOrder::rewritten(order, QString(), -1));
    menu.proxy().invalidateSortOrder(path);
}
