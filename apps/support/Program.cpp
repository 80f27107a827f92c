// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Program.h"

#include "QtMajor.h"
#include "TerminalText.h"

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QDir>
#include <QLocale>
#include <QTranslator>

#include <algorithm>
#include <cstdio>
#include <memory>

#include <pwd.h>
#include <unistd.h>

namespace {

bool loadCatalog(const QString &name, const QString &directory)
{
    // Without a directory Qt would look in the working directory.
    if (directory.isEmpty())
        return false;
    auto translator = std::make_unique<QTranslator>(QCoreApplication::instance());
    if (!translator->load(QLocale::system(), name, QStringLiteral("_"), directory))
        return false;
    QCoreApplication::installTranslator(translator.release()); // the application's now
    return true;
}

QString besideProgram(const QString &relative)
{
    return QDir::cleanPath(QCoreApplication::applicationDirPath() + QLatin1Char('/') + relative);
}

// Without HOME Qt looks for the user's files in the root of the file system, and not where the
// desktop's own libraries look.
void provideHome()
{
    if (qgetenv("HOME").startsWith('/'))
        return;
    const passwd *const user = getpwuid(getuid());
    if (user && user->pw_dir && *user->pw_dir == '/')
        qputenv("HOME", user->pw_dir);
}

} // namespace

void Program::describe(const QString &name)
{
    provideHome();
    QCoreApplication::setOrganizationName(QStringLiteral("vel"));
    QCoreApplication::setApplicationName(name);
    QCoreApplication::setApplicationVersion(QStringLiteral(VEL_VERSION));
}

void Program::loadCatalogs()
{
    // The buttons of message boxes and what the command line's parser says.
    loadCatalog(QStringLiteral("qtbase"), QtMajor::translationsPath());

    const QString name = QStringLiteral("veluiextra-tools");
    if (!loadCatalog(name, besideProgram(QStringLiteral(VEL_DATA_FROM_PROGRAM "/translations"))))
        loadCatalog(name, QStringLiteral(VEL_TRANSLATIONS_DIR));
}

bool Program::mayWantNoWindow(int argc, char **argv)
{
    return std::any_of(argv + 1, argv + argc, [](const char *argument) {
        const QByteArray text(argument);
        return text == "--help" || text == "--help-all" || text == "-h" || text == "--version"
            || text == "-v";
    });
}

QString Program::parse(QCommandLineParser &parser)
{
    if (!parser.parse(QCoreApplication::arguments()))
        return parser.errorText();
    if (parser.isSet(QStringLiteral("help")) || parser.isSet(QStringLiteral("help-all")))
        parser.showHelp();
    if (parser.isSet(QStringLiteral("version")))
        parser.showVersion();
    return {};
}

void Program::printError(const QString &text)
{
    std::fprintf(stderr, "%s: %s\n", QCoreApplication::applicationName().toLocal8Bit().constData(),
                 TerminalText::plain(text).toLocal8Bit().constData());
}

int Program::fail(const QString &text, int status)
{
    printError(text);
    return status;
}
