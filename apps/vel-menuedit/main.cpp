// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Options.h"

#include <VelMenuDialog.h>
#include <support/Program.h>

#include <velintegration/startmenu.h>

#include <QApplication>
#include <QFile>
#include <QFileInfo>
#include <QShortcut>
#include <QStandardPaths>

#include <cstdio>

namespace {

enum ExitStatus { Done = 0, NothingPicked = 1, CannotStart = 2 };

int fail(const QString &text)
{
    Program::printError(text);
    return CannotStart;
}

// Whether the directory can be shown; the reason if not.
QString obstacle(const Options &options)
{
    if (options.isStartMenu && !QFileInfo::exists(options.dir)
        && !CreateStartMenu(QFile::encodeName(options.dir).constData(), nullptr))
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
void findNeighbours()
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

int run(const Options &options)
{
    VelMenuDialog dialog(options.dir, options.iconSize, options.editable, !options.pick, nullptr, Qt::Window);
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

} // namespace

int main(int argc, char **argv)
{
    Program::describe(QStringLiteral("vel-menuedit"));
    QGuiApplication::setDesktopFileName(QStringLiteral("vel-menuedit"));
    if (Program::mayWantNoWindow(argc, argv)) {
        QCoreApplication application(argc, argv);
        Program::loadCatalogues();
        const Options options = Options::parse();
        if (!options.error.isEmpty())
            return fail(options.error);
        // What looked like it was the value of another option.
    }

    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps);
    QApplication application(argc, argv);
    Program::loadCatalogues();
    // The message box that may follow the dialog would end before it is seen.
    QGuiApplication::setQuitOnLastWindowClosed(false);
    const Options options = Options::parse();
    if (!options.error.isEmpty())
        return fail(options.error);
    const QString why = obstacle(options);
    if (!why.isEmpty())
        return fail(why);
    findNeighbours();
    return run(options);
}
