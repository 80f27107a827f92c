// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Prints a menu directory in its order.

#include "MenuFormat.h"
#include "MenuTree.h"

#include <support/Program.h>
#include <velcore/dirs.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QFileInfo>

#include <cerrno>
#include <cstdio>

namespace {

enum ExitStatus { Done = 0, CannotWrite = 1, CannotStart = 2 };

int fail(const QString &text)
{
    Program::printError(text);
    return CannotStart;
}

QByteArray printed(const QString &format, const MenuItem &menu)
{
    if (format == QLatin1String("openbox"))
        return MenuFormat::openbox(menu);
    if (format == QLatin1String("json"))
        return MenuFormat::json(menu);
    return MenuFormat::text(menu);
}

} // namespace

int main(int argc, char **argv)
{
    Program::describe(QStringLiteral("vel-menuprint"));
    QCoreApplication application(argc, argv);
    Program::loadCatalogues();

    QCommandLineParser parser;
    parser.setApplicationDescription(
        QCoreApplication::translate("vel-menuprint", "Prints a menu directory in its order."));
    parser.addHelpOption();
    parser.addVersionOption();
    const QCommandLineOption formatOption(
        QStringLiteral("format"),
        QCoreApplication::translate("vel-menuprint", "openbox (a pipe menu), json or text (the default)."),
        QStringLiteral("FORMAT"), QStringLiteral("text"));
    parser.addOption(formatOption);
    parser.addPositionalArgument(
        QStringLiteral("DIR"),
        QCoreApplication::translate("vel-menuprint",
                                    "The menu directory; the start menu when none is given."),
        QStringLiteral("[DIR]"));
    const QString error = Program::parse(parser);
    if (!error.isEmpty())
        return fail(error);

    const QString format = parser.value(formatOption);
    if (!QStringList({QStringLiteral("openbox"), QStringLiteral("json"), QStringLiteral("text")})
             .contains(format))
        return fail(QCoreApplication::translate("vel-menuprint", "unknown format: %1").arg(format));
    if (parser.positionalArguments().size() > 1)
        return fail(QCoreApplication::translate("vel-menuprint", "more than one directory"));
    const QFileInfo directory(
        parser.positionalArguments().value(0, QString::fromStdString(GetVelDir(VelDir::StartMenu))));
    if (!directory.isDir())
        return fail(
            QCoreApplication::translate("vel-menuprint", "no such directory: %1").arg(directory.filePath()));
    if (!directory.isReadable() || !directory.isExecutable())
        return fail(QCoreApplication::translate("vel-menuprint", "cannot read the directory %1")
                        .arg(directory.filePath()));

    const QByteArray out = printed(format, MenuTree::read(directory.absoluteFilePath()));
    const bool written = std::fwrite(out.constData(), 1, size_t(out.size()), stdout) == size_t(out.size())
        && std::fflush(stdout) == 0;
    if (!written)
        Program::printError(qt_error_string(errno));
    return written ? Done : CannotWrite;
}
