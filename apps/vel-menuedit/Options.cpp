// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Options.h"

#include <support/Program.h>
#include <velcore/dirs.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QDir>

namespace {

QString standardDir(VelDir kind)
{
    return QString::fromStdString(GetVelDir(kind));
}

} // namespace

Options Options::parse()
{
    QCommandLineParser parser;
    parser.setApplicationDescription(
        QCoreApplication::translate("vel-menuedit", "Edits the start menu, or picks an entry of it."));
    parser.addHelpOption();
    parser.addVersionOption();
    parser.addOptions({
        {QStringLiteral("dir"),
         QCoreApplication::translate("vel-menuedit",
                                     "Show the menu directory <dir> instead of the start menu."),
         QStringLiteral("dir")},
        {QStringLiteral("desktop"), QCoreApplication::translate("vel-menuedit", "Show the desktop folder.")},
        {QStringLiteral("toolbar"), QCoreApplication::translate("vel-menuedit", "Show the tool bar.")},
        {QStringLiteral("read-only"),
         QCoreApplication::translate("vel-menuedit", "Look only, change nothing.")},
        {QStringLiteral("icon-size"),
         QCoreApplication::translate("vel-menuedit", "Show icons of <pixels> pixels."),
         QStringLiteral("pixels")},
        {QStringLiteral("pick"),
         QCoreApplication::translate("vel-menuedit",
                                     "Pick an entry and print its path and its command line.")},
    });

    Options options;
    options.error = Program::parse(parser);
    if (!options.error.isEmpty())
        return options;
    if (!parser.positionalArguments().isEmpty())
        options.error = QCoreApplication::translate("vel-menuedit", "unexpected argument: %1")
                            .arg(parser.positionalArguments().constFirst());
    options.pick = parser.isSet(QStringLiteral("pick"));
    options.editable = !options.pick && !parser.isSet(QStringLiteral("read-only"));
    options.chooseDir(parser);
    if (parser.isSet(QStringLiteral("icon-size")))
        options.chooseIconSize(parser.value(QStringLiteral("icon-size")));
    return options;
}

void Options::chooseDir(const QCommandLineParser &parser)
{
    const bool isDir = parser.isSet(QStringLiteral("dir"));
    const bool isDesktop = parser.isSet(QStringLiteral("desktop"));
    const bool isToolBar = parser.isSet(QStringLiteral("toolbar"));
    if (int(isDir) + int(isDesktop) + int(isToolBar) > 1)
        error = QCoreApplication::translate("vel-menuedit",
                                            "only one of --dir, --desktop and --toolbar can be given");
    const QString startMenu = standardDir(VelDir::StartMenu);
    dir = startMenu;
    if (isDir) {
        const QString given = parser.value(QStringLiteral("dir"));
        // Without a trailing "/", so that a standard directory is recognized.
        dir = given.isEmpty() ? given : QDir::cleanPath(QDir().absoluteFilePath(given));
    } else if (isDesktop) {
        dir = standardDir(VelDir::Desktop);
    } else if (isToolBar) {
        dir = standardDir(VelDir::ToolBar);
    }
    isStartMenu = dir == startMenu;
}

void Options::chooseIconSize(const QString &text)
{
    bool isNumber = false;
    iconSize = text.toInt(&isNumber);
    if (!isNumber || iconSize < 1 || iconSize > 512)
        error = QCoreApplication::translate("vel-menuedit",
                                            "--icon-size needs a number of pixels from 1 to 512, not \"%1\"")
                    .arg(text);
}
