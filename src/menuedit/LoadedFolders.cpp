// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LoadedFolders.h"

#include "VelMenuModel.h"

namespace {

void collect(const VelMenuModel &model, const QModelIndex &folder, QSet<QString> *paths)
{
    const int count = model.rowCount(folder);
    for (int row = 0; row < count; ++row) {
        const QModelIndex child = model.index(row, 0, folder);
        if (!model.isDir(child) || model.canFetchMore(child))
            continue;
        paths->insert(model.filePath(child));
        collect(model, child, paths);
    }
}

} // namespace

QSet<QString> LoadedFolders::in(const VelMenuModel &model)
{
    QSet<QString> paths;
    const QModelIndex root = model.index(model.menuDirectory());
    if (root.isValid())
        collect(model, root, &paths);
    return paths;
}
