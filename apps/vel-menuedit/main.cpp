// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Options.h"

#include <VelMenuDialog.h>
#include <support/WindowProgram.h>

#include <velintegration/startmenu.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QGuiApplication>
#include <QShortcut>
#include <QStandardPaths>

#include <cstdio>

namespace {

enum ExitStatus { Done = 0, NothingPicked = 1, CannotStart = 2 };

// Whether the directory can be shown; the reason if not.
QString obstacle(const Options &options)
{
    // Where no application is installed, the menu begins empty.
    if (options.isStartMenu && !UpdateStartMenu(QFile::encodeName(options.dir).constData(), nullptr)
        && !QFileInfo::exists(options.dir) && !QDir().mkpath(options.dir))
        return QCoreApplication::translate("vel-menuedit", "cannot create the start menu %1")
            .arg(options.dir);
    const QFileInfo info(options.dir);
    if (!info.exists())
        return QCoreApplication::translate("vel-menuedit", "no such directory: %1").arg(options.dir);
    if (!info.isDir())
        return QCoreApplication::translate("vel-menuedit", "not a directory: %1").arg(options.dir);
    if (!info.isReadable() || !info.isExecutable())
        return QCoreApplication::translate("vel-menuedit", "cannot read the directory %1").arg(options.dir);
    return {};
}

// Programs that were built or installed beside this one are found without being in PATH.
void findNeighbors()
{
    const QString program = QStringLiteral("vel-open");
    const QString ownDir = QCoreApplication::applicationDirPath();
    if (QStandardPaths::findExecutable(program).isEmpty()
        && !QStandardPaths::findExecutable(program, {ownDir}).isEmpty())
        qputenv("PATH", qgetenv("PATH") + ':' + QFile::encodeName(ownDir));
}

void print(const QString &line)
{
    const QByteArray bytes = QFile::encodeName(line);
    std::fwrite(bytes.constData(), 1, size_t(bytes.size()), stdout);
    if (!bytes.endsWith('\n'))
        std::fputc('\n', stdout);
}

int showDialog(const Options &options)
{
    VelMenuDialog dialog(options.dir, options.iconSize, options.editable, !options.pick, nullptr, Qt::Window);
    dialog.setAssistance(true);
    QObject::connect(new QShortcut(QKeySequence(Qt::Key_F1), &dialog), &QShortcut::activated, &dialog,
                     &VelMenuDialog::helpSlot);
    const bool accepted = dialog.exec() == QDialog::Accepted;
    if (!options.pick)
        return Done;
    if (!accepted || dialog.selectedItemPath().isEmpty())
        return NothingPicked;
    print(dialog.selectedItemPath());
    print(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr));
    std::fflush(stdout);
    return Done;
}

int run(const Options &options)
{
    // The message box that may follow the dialog would end before it is seen.
    QGuiApplication::setQuitOnLastWindowClosed(false);
    const QString why = obstacle(options);
    if (!why.isEmpty())
        return Program::fail(why, CannotStart);
    findNeighbors();
    return showDialog(options);
}

} // namespace

int main(int argc, char **argv)
{
    return Program::runWithWindows(argc, argv, QStringLiteral("vel-menuedit"), CannotStart, Options::parse,
                                   run);
}
