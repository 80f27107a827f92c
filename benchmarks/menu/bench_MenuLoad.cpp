// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Opening menu directories, each time in a process of its own: how long the window stands still, what
// that takes where the files are not in memory, how it grows, and what memory it adds.
// Needs a display; "not in memory" needs the right to drop the system's cache.

#include "Comparison.h"
#include "MenuFiles.h"
#include "MenuOpening.h"

#include <QApplication>
#include <QDirIterator>
#include <QElapsedTimer>
#include <QFile>
#include <QIcon>
#include <QProcess>

#include <algorithm>
#include <cstdio>
#include <map>

#include <fcntl.h>
#include <unistd.h>

namespace {

using MenuOpening::Directory;

constexpr int Rounds = 9;

struct Result
{
    double done = 0; // microseconds
    double longestFreeze = 0; // microseconds
    double memory = 0; // KiB
};

MenuOpening::Times readAll(const QString &path)
{
    QElapsedTimer timer;
    timer.start();
    QDirIterator it(path, QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
    while (it.hasNext()) {
        const QByteArray name = QFile::encodeName(it.next());
        char bytes[65536];
        const int file = ::open(name.constData(), O_RDONLY | O_CLOEXEC);
        while (file >= 0 && ::read(file, bytes, sizeof bytes) > 0) { }
        ::close(file);
    }
    const double time = double(timer.nsecsElapsed()) / 1000;
    return {time, time, 0};
}

MenuOpening::Times open(const QString &how, const Directory &directory)
{
    if (how == QLatin1String("menu"))
        return MenuOpening::menu(directory);
    return how == QLatin1String("plain") ? MenuOpening::plain(directory) : readAll(directory.path);
}

// What the first folder needs for good, such as fonts, plugins and the icons, is not of its rows.
int measureHere(const QStringList &arguments)
{
    const QString &how = arguments.at(2);
    open(how, {arguments.at(6), arguments.at(7).toInt(), 0});
    const double before = MenuOpening::ownMemory();
    const bool isCold = arguments.value(8) == QLatin1String("cold");
    if (isCold) {
        ::sync();
        QFile cache(QStringLiteral("/proc/sys/vm/drop_caches"));
        if (!cache.open(QIODevice::WriteOnly) || cache.write("3") != 1 || !cache.flush())
            return 1;
    }
    const MenuOpening::Times times =
        open(how, {arguments.at(3), arguments.at(4).toInt(), arguments.at(5).toInt()});
    std::printf("%.0f %.0f %.0f\n", times.done, times.longestFreeze, times.memory - before);
    return 0;
}

class Runner
{
public:
    explicit Runner(MenuFiles *files)
        : m_few(files->flat(Few, false))
    {
    }

    Result run(const char *how, const Directory &directory, bool isCold = false) const
    {
        QProcess child;
        child.setProcessChannelMode(QProcess::ForwardedErrorChannel);
        QStringList arguments{QStringLiteral("--here"),
                              QLatin1String(how),
                              directory.path,
                              QString::number(directory.rows),
                              QString::number(directory.rowsOfEach),
                              m_few,
                              QString::number(Few)};
        if (isCold)
            arguments.append(QStringLiteral("cold"));
        child.start(QCoreApplication::applicationFilePath(), arguments);
        if (!child.waitForFinished(120000) || child.exitCode() != 0)
            qFatal("no result from the process of its own");
        const QList<QByteArray> numbers = child.readAllStandardOutput().simplified().split(' ');
        return {numbers.value(0).toDouble(), numbers.value(1).toDouble(), numbers.value(2).toDouble()};
    }

    Comparison::TimedWork measure(const char *how, const Directory &directory, double Result::*what,
                                  double share = 1) const
    {
        return [=] { return run(how, directory).*what / share; };
    }

private:
    static constexpr int Few = 20;
    const QString m_few;
};

bool mayDropCache()
{
    return ::access("/proc/sys/vm/drop_caches", W_OK) == 0;
}

bool compareFreeze(const Runner &runner, const Directory &flat)
{
    Comparison comparison("folder of 5,000 entries in memory: longest freeze");
    comparison.addTimed("VelMenuModel and proxy", runner.measure("menu", flat, &Result::longestFreeze));
    comparison.addTimed("plain QFileSystemModel, done", runner.measure("plain", flat, &Result::done), 1.0);
    // What Qt does by itself in that one go, and what it takes to look at each file once.
    comparison.addTimed("plain QFileSystemModel, longest freeze",
                        runner.measure("plain", flat, &Result::longestFreeze));
    comparison.addTimed("reading all of them one after another", runner.measure("read", flat, &Result::done));
    return comparison.run(Rounds);
}

bool compareCold(const Runner &runner, const Directory &flat)
{
    if (!mayDropCache()) {
        std::printf("folder of 5,000 entries not in memory: not measured, the cache cannot be dropped\n");
        return true;
    }
    const auto cold = [&](const char *how, double Result::*what) {
        return [&runner, &flat, how, what] { return runner.run(how, flat, true).*what; };
    };
    Comparison done("folder of 5,000 entries not in memory: done");
    done.addTimed("VelMenuModel and proxy", cold("menu", &Result::done));
    done.addTimed("reading all of them one after another", cold("read", &Result::done), 0.6);
    Comparison freeze("folder of 5,000 entries not in memory: longest freeze");
    freeze.addTimed("VelMenuModel and proxy", cold("menu", &Result::longestFreeze));
    freeze.addTimed("reading all of them one after another", cold("read", &Result::done), 0.4);
    const bool doneKept = done.run(Rounds);
    return freeze.run(Rounds) && doneKept;
}

bool compareFolders(const Runner &runner, const Directory &folders)
{
    Comparison comparison("tree of 2,000 folders, expanded");
    comparison.addTimed("VelMenuModel and proxy", runner.measure("menu", folders, &Result::done));
    comparison.addTimed("plain QFileSystemModel", runner.measure("plain", folders, &Result::done), 1.3);
    comparison.addTimed("reading all of them one after another",
                        runner.measure("read", folders, &Result::done));
    return comparison.run(Rounds);
}

bool compareGrowth(const Runner &runner, const Directory &large, const Directory &flat)
{
    Comparison comparison("folder of 50,000 entries, a row");
    comparison.addTimed("VelMenuModel and proxy", runner.measure("menu", large, &Result::done, large.rows));
    comparison.addTimed("of 5,000, a row", runner.measure("menu", flat, &Result::done, flat.rows), 1.3);
    return comparison.run(Rounds);
}

bool compareMemory(const Runner &runner, const Directory &flat)
{
    Comparison comparison("memory that 5,000 rows add, in KiB");
    comparison.addTimed("VelMenuModel and proxy", runner.measure("menu", flat, &Result::memory));
    comparison.addTimed("plain QFileSystemModel", runner.measure("plain", flat, &Result::memory), 1.6);
    return comparison.run(Rounds);
}

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
    const QStringList arguments = application.arguments();
    if (arguments.value(1) == QLatin1String("--here"))
        return measureHere(arguments);
    MenuFiles files;
    const Runner runner(&files);
    const Directory flat{files.flat(5000, false), 5000, 0};
    bool kept = compareFreeze(runner, flat);
    kept = compareCold(runner, flat) && kept;
    kept = compareFolders(runner, {files.nested(2000, 5), 2000, 5}) && kept;
    kept = compareGrowth(runner, {files.flat(50000, false), 50000, 0}, flat) && kept;
    return compareMemory(runner, flat) && kept ? 0 : 1;
}
