// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuReordering.h"

#include "FolderOrder.h"
#include "MenuVoice.h"
#include "ShownMenu.h"
#include "ShownOrder.h"
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
    const bool isSaved = FolderOrder::write(path, ShownOrder::with(menu.proxy(), name, row, folder));
    menu.files().noteRecordFile(path);
    if (!isSaved)
        voice.tell(FolderOrder::notSaved(path), MenuVoice::Failure);
    return true;
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
