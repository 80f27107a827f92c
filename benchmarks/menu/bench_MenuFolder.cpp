// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Opening menu directories: from making the models until every row is there with its name and
// icon, sorted and painted, and nothing changes any more. Needs a display.

#include "Comparison.h"
#include "MenuFiles.h"
#include "MenuOpening.h"

#include <QApplication>
#include <QDirIterator>
#include <QElapsedTimer>
#include <QIcon>

#include <algorithm>
#include <cstdio>
#include <vector>

#include <sys/stat.h>

namespace {

using MenuOpening::Directory;

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

double openMenu(const Directory &directory)
{
    const MenuOpening::Times times = MenuOpening::menu(directory);
    freezes.push_back(times.longestFreeze);
    return times.done;
}

void reportFreeze()
{
    std::sort(freezes.begin(), freezes.end());
    std::printf("  longest freeze of ours: median %.1f ms\n", freezes.at(freezes.size() / 2) / 1000);
    freezes.clear();
}

bool compare(const std::string &title, const Directory &directory, double kdeLimit, double plainLimit)
{
    Comparison comparison(title);
    comparison.setPreparation([&] { changeAll(directory.path); });
    comparison.addTimed("VelMenuModel and proxy", [&] { return openMenu(directory); });
    comparison.addTimed(
        "KDirModel", [&] { return MenuOpening::kDirModel(directory).done; }, kdeLimit);
    comparison.addTimed(
        "plain QFileSystemModel", [&] { return MenuOpening::plain(directory).done; }, plainLimit);
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
    bool kept = compare("folder of 5,000 entries", flat, 0.50, 2.5);
    if (application.arguments().contains(QStringLiteral("--flat")))
        return kept ? 0 : 1;
    kept = compareOrders({files.flat(5000, true), 5000, 0}, flat) && kept;
    const QString nested = files.nested(200, 50);
    kept = compare("tree of 200 folders with 50 entries each, opened", {nested, 200, 0}, 0.65, 1.7) && kept;
    kept = compare("tree of 200 folders with 50 entries each, expanded", {nested, 200, 50}, 0.75, 0) && kept;
    return kept ? 0 : 1;
}
