// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Opening menu directories: from making the models until every row is there with its name and
// icon, sorted and painted, and nothing changes any more. Needs a display.

#include "Comparison.h"
#include "MenuFiles.h"
#include "ShownTree.h"

#include <menuedit/VelMenuModel.h>
#include <menuedit/VelMenuProxyModel.h>

#include <KDirLister>
#include <KDirModel>
#include <KDirSortFilterProxyModel>

#include <QApplication>
#include <QDirIterator>
#include <QElapsedTimer>
#include <QFileSystemModel>

#include <algorithm>
#include <cstdio>
#include <memory>

#include <sys/stat.h>

namespace {

struct Directory
{
    QString path;
    int rows; // of the folder itself
    int rowsOfEach; // of its folders, when they are all opened
};

std::vector<double> freezes;

// KDE's lister goes on watching what it has shown, and looks at what changed half a second later.
void letWatchersFinish()
{
    QElapsedTimer timer;
    for (timer.start(); timer.elapsed() < 700;)
        QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
}

// Marks every file as changed: nobody may know it from the round before.
void changeAll(const QString &path)
{
    QDirIterator it(path, QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
    while (it.hasNext()) {
        const QByteArray name = QFile::encodeName(it.next());
        struct stat status = {};
        if (stat(name.constData(), &status) == 0)
            chmod(name.constData(), status.st_mode & 07777);
    }
    letWatchersFinish();
}

bool isComplete(const QAbstractItemModel &model, const QModelIndex &root, const Directory &directory)
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
double settle(ShownTree &tree, const QAbstractItemModel &model, const std::function<QModelIndex()> &root,
              const Directory &directory)
{
    tree.watch(&model);
    tree.show();
    if (directory.rowsOfEach > 0) {
        tree.settleUntil([&] { return model.rowCount(root()) == directory.rows; });
        for (int row = 0; row < directory.rows; ++row)
            tree.expand(model.index(row, 0, root()));
    }
    return tree.settle([&] { return isComplete(model, root(), directory); });
}

double openMenu(const Directory &directory)
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
    const double time = settle(tree, proxy, root, directory);
    freezes.push_back(tree.longestFreeze());
    tree.setModel(nullptr);
    return time;
}

double openPlain(const Directory &directory)
{
    ShownTree tree;
    tree.start();
    QFileSystemModel model;
    model.setRootPath(directory.path);
    tree.setModel(&model);
    const auto root = [&] { return model.index(directory.path); };
    tree.setRootIndex(root());
    for (int column = 1; column < model.columnCount(); ++column)
        tree.hideColumn(column);
    const double time = settle(tree, model, root, directory);
    tree.setModel(nullptr);
    return time;
}

double openKDirModel(const Directory &directory)
{
    ShownTree tree;
    tree.start();
    KDirModel model;
    model.dirLister()->setAutoErrorHandlingEnabled(false);
    KDirSortFilterProxyModel proxy;
    proxy.setSourceModel(&model);
    proxy.sort(0);
    tree.setModel(&proxy);
    for (int column = 1; column < proxy.columnCount(); ++column)
        tree.hideColumn(column);
    // Without Reload it would show what it has kept from the round before.
    model.openUrl(QUrl::fromLocalFile(directory.path), KDirModel::Reload);
    const double time = settle(
        tree, proxy, [] { return QModelIndex(); }, directory);
    tree.setModel(nullptr);
    return time;
}

void reportFreeze()
{
    std::sort(freezes.begin(), freezes.end());
    std::printf("  longest freeze of ours: median %.1f ms\n", freezes.at(freezes.size() / 2) / 1000);
    freezes.clear();
}

bool compare(const std::string &title, const Directory &directory, double plainLimit)
{
    Comparison comparison(title);
    comparison.setPreparation([&] { changeAll(directory.path); });
    comparison.addTimed("VelMenuModel and proxy", [&] { return openMenu(directory); });
    comparison.addTimed(
        "KDirModel", [&] { return openKDirModel(directory); }, plainLimit > 0 ? 0.65 : 0.75);
    comparison.addTimed(
        "plain QFileSystemModel", [&] { return openPlain(directory); }, plainLimit);
    const bool kept = comparison.run(9);
    if (!freezes.empty())
        reportFreeze();
    return kept;
}

bool compareOrders(const Directory &sorted, const Directory &unsorted)
{
    Comparison comparison("folder of 5,000 entries with a SortOrder of all names");
    comparison.setPreparation([&] {
        changeAll(sorted.path);
        changeAll(unsorted.path);
    });
    comparison.addTimed("with the list", [&] { return openMenu(sorted); });
    comparison.addTimed(
        "without", [&] { return openMenu(unsorted); }, 1.2);
    const bool kept = comparison.run(9);
    freezes.clear();
    return kept;
}

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
    MenuFiles files;
    const Directory flat{files.flat(5000, false), 5000, 0};
    bool kept = compare("folder of 5,000 entries", flat, 2.5);
    if (application.arguments().contains(QStringLiteral("--flat")))
        return kept ? 0 : 1;
    kept = compareOrders({files.flat(5000, true), 5000, 0}, flat) && kept;
    const QString nested = files.nested(200, 50);
    kept = compare("tree of 200 folders with 50 entries each, opened", {nested, 200, 0}, 0) && kept;
    kept = compare("tree of 200 folders with 50 entries each, expanded", {nested, 200, 50}, 0) && kept;
    return kept ? 0 : 1;
}
