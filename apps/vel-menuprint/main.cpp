// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Prints a menu directory in its order.

#include "MenuFormat.h"
#include "MenuTree.h"

#include <velcore/dirs.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QFileInfo>
#include <QLocale>

#include <clocale>
#include <cstdio>

namespace {

enum ExitStatus { Done = 0, CannotWrite = 1, CannotStart = 2 };

int fail(const QString &text)
{
    std::fprintf(stderr, "vel-menuprint: %s\n", text.toLocal8Bit().constData());
    return CannotStart;
}

QString tr(const char *text)
{
    return QCoreApplication::translate("vel-menuprint", text);
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
    QCoreApplication application(argc, argv);
    std::setlocale(LC_ALL, ""); // names are ordered as the user's language orders them
    QCoreApplication::setOrganizationName(QStringLiteral("vel"));
    QCoreApplication::setApplicationName(QStringLiteral("vel-menuprint"));
    QCoreApplication::setApplicationVersion(QStringLiteral(VEL_VERSION));

    QCommandLineParser parser;
    parser.setApplicationDescription(tr("Prints a menu directory in its order."));
    parser.addHelpOption();
    parser.addVersionOption();
    const QCommandLineOption formatOption(QStringLiteral("format"),
                                          tr("openbox (a pipe menu), json or text (the default)."),
                                          QStringLiteral("FORMAT"), QStringLiteral("text"));
    parser.addOption(formatOption);
    parser.addPositionalArgument(QStringLiteral("DIR"),
                                 tr("The menu directory; the start menu when none is given."),
                                 QStringLiteral("[DIR]"));
    parser.process(application);

    const QString format = parser.value(formatOption);
    if (!QStringList({QStringLiteral("openbox"), QStringLiteral("json"), QStringLiteral("text")})
             .contains(format))
        return fail(tr("unknown format: %1").arg(format));
    if (parser.positionalArguments().size() > 1)
        return fail(tr("more than one directory"));
    const QFileInfo directory(
        parser.positionalArguments().value(0, QString::fromStdString(GetVelDir(VelDir::StartMenu))));
    if (!directory.isDir())
        return fail(tr("no such directory: %1").arg(directory.filePath()));
    if (!directory.isReadable() || !directory.isExecutable())
        return fail(tr("cannot read the directory %1").arg(directory.filePath()));

    const QByteArray out = printed(format, MenuTree::read(directory.absoluteFilePath()));
    const bool written = std::fwrite(out.constData(), 1, size_t(out.size()), stdout) == size_t(out.size())
        && std::fflush(stdout) == 0;
    return written ? Done : CannotWrite;
}
