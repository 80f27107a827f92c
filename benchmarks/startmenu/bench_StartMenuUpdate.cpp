// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// An update of a start menu of 500 applications that has nothing to do, as every start of a program that
// shows the menu begins with it. It may take 2 ms; making the menu is for comparison.

#include "Comparison.h"

#include <velintegration/startmenu.h>
#include <velintegration/startmenufollowing.h>

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QThread>

namespace {

constexpr int Applications = 500;
constexpr double Allowed = 2000; // microseconds

void install(const QString &folder)
{
    static const char *const categories[] = {"Game", "Office", "Network", "System", "Utility"};
    QDir().mkpath(folder);
    for (int i = 0; i < Applications; ++i) {
        QFile file(folder + QStringLiteral("/app%1.desktop").arg(i));
        if (!file.open(QIODevice::WriteOnly))
            qFatal("cannot write %s", qPrintable(file.fileName()));
        file.write("[Desktop Entry]\nType=Application\nName=Application " + QByteArray::number(i)
                   + "\nExec=true\nCategories=" + categories[i % 5] + ";\n");
    }
}

bool compare(const char *title, const QByteArray &menu, const QByteArray &other = {})
{
    Comparison comparison(title);
    comparison.add("UpdateStartMenu", [&menu] {
        if (!UpdateStartMenu(menu.constData(), nullptr))
            qFatal("the update failed");
    });
    comparison.addTimed(
        "what it may take", [] { return Allowed; }, 1);
    if (!other.isEmpty())
        comparison.add("CreateStartMenu", [&other] { CreateStartMenu(other.constData(), nullptr); });
    return comparison.run();
}

} // namespace

int main(int argc, char **argv)
{
    QCoreApplication application(argc, argv);
    const QTemporaryDir folder;
    qputenv("XDG_DATA_HOME", QFile::encodeName(folder.filePath(QStringLiteral("data"))));
    qputenv("XDG_DATA_DIRS", "/nowhere");
    install(folder.filePath(QStringLiteral("data/applications")));
    const QByteArray menu = QFile::encodeName(folder.filePath(QStringLiteral("menu")));
    const QByteArray other = QFile::encodeName(folder.filePath(QStringLiteral("other")));
    if (!UpdateStartMenu(menu.constData(), nullptr))
        return 1;

    QThread::sleep(4);
    UpdateStartMenu(menu.constData(), nullptr); // sees that all is quiet
    const bool isKept = compare("start menu of 500 applications: nothing to do", menu, other);

    // Just after the applications came, their files are looked at, but not read.
    QFile::remove(folder.filePath(QStringLiteral("data/applications/app0.desktop")));
    UpdateStartMenu(menu.constData(), nullptr);
    return compare("start menu of 500 applications: nothing to do, an application just went", menu) && isKept
        ? 0
        : 1;
}
