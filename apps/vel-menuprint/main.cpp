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

struct Options
{
    QString format;
    QString dir;
    QString error; ///< what is wrong with the command line; empty when nothing is
};

Options parse()
{
    QCommandLineParser parser;
    parser.setApplicationDescription(
        QCoreApplication::translate("vel-menuprint", "Prints a menu directory in its order."));
    parser.addHelpOption();
    parser.addVersionOption();
    const QCommandLineOption format(
        QStringLiteral("format"),
        QCoreApplication::translate("vel-menuprint", "openbox (a pipe menu), json or text (the default)."),
        QStringLiteral("FORMAT"), QStringLiteral("text"));
    parser.addOption(format);
    parser.addPositionalArgument(
        QStringLiteral("DIR"),
        QCoreApplication::translate("vel-menuprint",
                                    "The menu directory; the start menu when none is given."),
        QStringLiteral("[DIR]"));

    Options options;
    options.error = Program::parse(parser);
    if (!options.error.isEmpty())
        return options;
    options.format = parser.value(format);
    options.dir = parser.positionalArguments().value(0, QString::fromStdString(GetVelDir(VelDir::StartMenu)));
    if (!QStringList({QStringLiteral("openbox"), QStringLiteral("json"), QStringLiteral("text")})
             .contains(options.format))
        options.error =
            QCoreApplication::translate("vel-menuprint", "unknown format: %1").arg(options.format);
    else if (parser.positionalArguments().size() > 1)
        options.error = QCoreApplication::translate("vel-menuprint", "more than one directory");
    return options;
}

// Whether the directory can be printed; the reason if not.
QString obstacle(const QFileInfo &directory)
{
    if (!directory.isDir())
        return QCoreApplication::translate("vel-menuprint", "no such directory: %1")
            .arg(directory.filePath());
    if (!directory.isReadable() || !directory.isExecutable())
        return QCoreApplication::translate("vel-menuprint", "cannot read the directory %1")
            .arg(directory.filePath());
    return {};
}

QByteArray printed(const QString &format, const MenuItem &menu)
{
    if (format == QLatin1String("openbox"))
        return MenuFormat::openbox(menu);
    if (format == QLatin1String("json"))
        return MenuFormat::json(menu);
    return MenuFormat::text(menu);
}

int run(const Options &options)
{
    const QFileInfo directory(options.dir);
    const QString why = obstacle(directory);
    if (!why.isEmpty())
        return Program::fail(why, CannotStart);
    bool isWhole = true;
    const QByteArray out = printed(options.format, MenuTree::read(directory.absoluteFilePath(), &isWhole));
    if (!isWhole)
        Program::printError(
            QCoreApplication::translate("vel-menuprint",
                                        "The menu has more than %1 items or %2 levels, and the rest of it is "
                                        "left out. Look for links that lead into the same folders again.")
                .arg(MenuTree::MostItems)
                .arg(MenuTree::MostLevels));
    const bool written = std::fwrite(out.constData(), 1, size_t(out.size()), stdout) == size_t(out.size())
        && std::fflush(stdout) == 0;
    return written ? Done : Program::fail(qt_error_string(errno), CannotWrite);
}

} // namespace

int main(int argc, char **argv)
{
    return Program::runWithoutWindows(argc, argv, QStringLiteral("vel-menuprint"), CannotStart, parse, run);
}
