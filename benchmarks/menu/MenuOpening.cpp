// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuOpening.h"

#include "ShownTree.h"

#include <menuedit/VelMenuModel.h>
#include <menuedit/VelMenuProxyModel.h>

#include <KDirLister>
#include <KDirModel>
#include <KDirSortFilterProxyModel>

#include <QFile>
#include <QFileSystemModel>

#include <functional>

namespace {

bool isComplete(const QAbstractItemModel &model, const QModelIndex &root,
                const MenuOpening::Directory &directory)
{
    if (model.rowCount(root) != directory.rows)
        return false;
    for (int row = 0; directory.rowsOfEach > 0 && row < directory.rows; ++row) {
        if (model.rowCount(model.index(row, 0, root)) != directory.rowsOfEach)
            return false;
    }
    return true;
}

// Shows the tree until it has settled; opens the folders as soon as they are all there.
MenuOpening::Times measure(ShownTree &tree, const QAbstractItemModel &model,
                           const std::function<QModelIndex()> &root, const MenuOpening::Directory &directory)
{
    tree.watch(&model);
    tree.show();
    if (directory.rowsOfEach > 0) {
        tree.settleUntil([&] { return model.rowCount(root()) == directory.rows; });
        for (int row = 0; row < directory.rows; ++row)
            tree.expand(model.index(row, 0, root()));
    }
    const double time = tree.settle([&] { return isComplete(model, root(), directory); });
    const double memory = MenuOpening::ownMemory();
    tree.setModel(nullptr);
    return {time, tree.longestFreeze(), memory};
}

void showNamesAlone(ShownTree &tree, const QAbstractItemModel &model)
{
    for (int column = 1; column < model.columnCount(); ++column)
        tree.hideColumn(column);
}

} // namespace

double MenuOpening::ownMemory()
{
    QFile status(QStringLiteral("/proc/self/status"));
    if (!status.open(QIODevice::ReadOnly))
        return 0;
    const QByteArray text = status.readAll();
    const int at = text.indexOf("RssAnon:");
    return at < 0 ? 0 : text.mid(at + 8, 20).simplified().split(' ').value(0).toDouble();
}

MenuOpening::Times MenuOpening::menu(const Directory &directory)
{
    ShownTree tree;
    tree.start();
    VelMenuModel model(directory.path, nullptr, nullptr);
    VelMenuProxyModel proxy(nullptr);
    proxy.setSourceModel(&model);
    tree.setModel(&proxy);
    const auto root = [&] { return proxy.mapFromSource(model.index(directory.path)); };
    tree.setRootIndex(root());
    tree.setSortingEnabled(true);
    return measure(tree, proxy, root, directory);
}

MenuOpening::Times MenuOpening::plain(const Directory &directory)
{
    ShownTree tree;
    tree.start();
    QFileSystemModel model;
    model.setRootPath(directory.path);
    tree.setModel(&model);
    const auto root = [&] { return model.index(directory.path); };
    tree.setRootIndex(root());
    showNamesAlone(tree, model);
    return measure(tree, model, root, directory);
}

MenuOpening::Times MenuOpening::kDirModel(const Directory &directory)
{
    ShownTree tree;
    tree.start();
    KDirModel model;
    model.dirLister()->setAutoErrorHandlingEnabled(false);
    KDirSortFilterProxyModel proxy;
    proxy.setSourceModel(&model);
    proxy.sort(0);
    tree.setModel(&proxy);
    showNamesAlone(tree, proxy);
    // Without Reload it would show what it has kept from the round before.
    model.openUrl(QUrl::fromLocalFile(directory.path), KDirModel::Reload);
    return measure(
        tree, proxy, [] { return QModelIndex(); }, directory);
}
