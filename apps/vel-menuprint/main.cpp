// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Prints a menu directory in its order, in the forms that window managers and launchers read.

#include "IconFiles.h"
#include "ListedMenu.h"
#include "MenuFormat.h"
#include "MenuLines.h"
#include "MenuTree.h"

#include <support/Program.h>
#include <velcore/dirs.h>
#include <velintegration/startmenu.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <cerrno>
#include <cstdio>

#include <unistd.h>

namespace {

enum ExitStatus { Done = 0, CannotWrite = 1, CannotStart = 2, NotInMenu = 3 };

constexpr int LargestIcon = 1024; // pixels

struct Options
{
    QString format;
    QString dir;
    QString iconTheme;
    int iconSize = 0;
    bool isToRun = false;
    bool isStartMenu = false;
    QString error; ///< what is wrong with the command line; empty when nothing is
};

/// The options that the parser knows.
struct Switches
{
    QCommandLineOption format{
        QStringLiteral("format"),
        QCoreApplication::translate("vel-menuprint", "What to print: %1. The default is text.")
            .arg(MenuFormat::names().join(QLatin1String(", "))),
        QStringLiteral("FORMAT"), QStringLiteral("text")};
    QCommandLineOption iconTheme{
        QStringLiteral("icon-theme"),
        QCoreApplication::translate("vel-menuprint",
                                    "The icon theme to take the files of icons from; the user's own when "
                                    "none is given."),
        QStringLiteral("NAME")};
    QCommandLineOption iconSize{
        QStringLiteral("icon-size"),
        QCoreApplication::translate("vel-menuprint", "The edge of the icons in pixels, 24 by default."),
        QStringLiteral("PIXELS"), QStringLiteral("24")};
    QCommandLineOption run{
        QStringLiteral("run"),
        QCoreApplication::translate("vel-menuprint",
                                    "Reads one of the lines that rofi or dmenu was given from standard "
                                    "input and starts its entry.")};
};

QString problemOf(const Options &options, const QStringList &arguments)
{
    if (!MenuFormat::find(options.format))
        return QCoreApplication::translate("vel-menuprint", "unknown format: %1").arg(options.format);
    if (options.iconSize < 1 || options.iconSize > LargestIcon)
        return QCoreApplication::translate("vel-menuprint", "the size of icons is not between 1 and %1")
            .arg(LargestIcon);
    if (arguments.size() > 1)
        return QCoreApplication::translate("vel-menuprint", "more than one directory");
    return {};
}

Options parse()
{
    QCommandLineParser parser;
    parser.setApplicationDescription(
        QCoreApplication::translate("vel-menuprint", "Prints a menu directory in its order."));
    parser.addHelpOption();
    parser.addVersionOption();
    const Switches switches;
    parser.addOptions({switches.format, switches.iconTheme, switches.iconSize, switches.run});
    parser.addPositionalArgument(
        QStringLiteral("DIR"),
        QCoreApplication::translate("vel-menuprint",
                                    "The menu directory; the start menu when none is given."),
        QStringLiteral("[DIR]"));

    Options options;
    options.error = Program::parse(parser);
    if (!options.error.isEmpty())
        return options;
    const QStringList arguments = parser.positionalArguments();
    options.format = parser.value(switches.format);
    const QString startMenu = QFile::decodeName(GetVelDir(VelDir::StartMenu).c_str());
    options.dir = arguments.value(0, startMenu);
    options.isStartMenu = QDir::cleanPath(QDir().absoluteFilePath(options.dir)) == startMenu;
    options.iconTheme = parser.value(switches.iconTheme);
    options.iconSize = parser.value(switches.iconSize).toInt();
    options.isToRun = parser.isSet(switches.run);
    options.error = problemOf(options, arguments);
    return options;
}

QString noApplication()
{
    return QCoreApplication::translate("vel-menuprint",
                                       "The start menu is empty: no application is installed.");
}

// Has the start menu follow what is installed, also one that is not there yet. The reason if it is
// empty because of that.
QString followApplications(const Options &options)
{
    if (!options.isStartMenu || UpdateStartMenu(QFile::encodeName(options.dir).constData(), nullptr))
        return {};
    const int reason = errno;
    if (reason == ENODATA)
        return noApplication();
    if (QFileInfo::exists(options.dir))
        return {};
    return QCoreApplication::translate("vel-menuprint", "The start menu %1 cannot be made: %2")
        .arg(options.dir, qt_error_string(reason));
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

MenuItem readMenu(const QFileInfo &directory)
{
    bool isWhole = true;
    const MenuItem menu = MenuTree::read(directory.absoluteFilePath(), &isWhole);
    if (!isWhole)
        Program::printError(
            QCoreApplication::translate("vel-menuprint",
                                        "The menu has more than %1 items or %2 levels, and the rest of it is "
                                        "left out. Look for links that lead into the same folders again.")
                .arg(MenuTree::MostItems)
                .arg(MenuTree::MostLevels));
    return menu;
}

// As the format wants it.
MenuItem prepared(const MenuItem &menu, const MenuFormat::Format &format, const Options &options)
{
    if (!format.isForStarting && !format.hasIconFiles)
        return menu;
    IconFiles::setTheme(options.iconTheme.isEmpty() ? IconFiles::userTheme() : options.iconTheme);
    const auto iconFile = [&](const QString &name) {
        return IconFiles::find(name, options.iconSize, format.hasPicturesOnly);
    };
    if (format.isForStarting)
        return ListedMenu::of(menu, iconFile);
    MenuItem whole = menu;
    ListedMenu::addIconFiles(&whole, iconFile);
    return whole;
}

void tellOfLongPaths(const MenuItem &menu)
{
    if (menu.path.contains(QLatin1Char('\n')))
        Program::printError(
            QCoreApplication::translate("vel-menuprint",
                                        "%1 is left out, as the line end in its name cannot be written in "
                                        "this format. Rename it.")
                .arg(menu.path));
    for (const MenuItem &child : menu.children)
        tellOfLongPaths(child);
}

bool write(const QByteArray &out)
{
    return std::fwrite(out.constData(), 1, size_t(out.size()), stdout) == size_t(out.size())
        && std::fflush(stdout) == 0;
}

// Who opens a menu and finds nothing in it has to see why.
int failToStart(const Options &options, const QString &why)
{
    const MenuFormat::Format &format = *MenuFormat::find(options.format);
    if (options.isStartMenu && !options.isToRun && format.printText)
        write(format.printText(why));
    return Program::fail(why, CannotStart);
}

QByteArray printedEmpty(const MenuFormat::Format &format, const Options &options, const MenuItem &menu,
                        const QString &whyEmpty)
{
    const QString text = whyEmpty.isEmpty()
        ? QCoreApplication::translate("vel-menuprint", "The start menu is empty: nothing in %1 is shown.")
              .arg(options.dir)
        : whyEmpty;
    Program::printError(text);
    return format.printText ? format.printText(text) : format.print(menu);
}

int print(const MenuItem &menu, const Options &options, const QString &whyEmpty)
{
    const MenuFormat::Format &format = *MenuFormat::find(options.format);
    const MenuItem shown = prepared(menu, format, options);
    if (format.hasLines)
        tellOfLongPaths(shown);
    const bool isToBeExplained = options.isStartMenu && shown.children.isEmpty();
    const bool isWritten =
        write(isToBeExplained ? printedEmpty(format, options, shown, whyEmpty) : format.print(shown));
    return isWritten ? Done : Program::fail(qt_error_string(errno), CannotWrite);
}

// The chosen line, without its end; empty when nothing was chosen.
QString readLine()
{
    QByteArray line;
    for (int c = std::getchar(); c != EOF && c != '\n'; c = std::getchar())
        line += char(c);
    return QString::fromUtf8(line);
}

// Goes on as vel-open, the one beside this program if there is one.
int open(const QString &path)
{
    const QByteArray file = QFile::encodeName(path);
    const QByteArray beside = QFile::encodeName(QCoreApplication::applicationDirPath()) + "/vel-open";
    ::execl(beside.constData(), "vel-open", "--exec", file.constData(), nullptr);
    ::execlp("vel-open", "vel-open", "--exec", file.constData(), nullptr);
    return Program::fail(
        QCoreApplication::translate("vel-menuprint", "cannot run vel-open: %1").arg(qt_error_string(errno)),
        CannotStart);
}

int runChosen(const MenuItem &menu)
{
    const QString chosen = readLine();
    if (chosen.isEmpty())
        return Done;
    const auto lines = MenuLines::of(ListedMenu::of(menu, nullptr));
    const auto line = std::find_if(lines.cbegin(), lines.cend(),
                                   [&](const MenuLines::Line &each) { return each.text == chosen; });
    if (line != lines.cend())
        return open(line->path);
    return Program::fail(
        QCoreApplication::translate("vel-menuprint", "There is no \"%1\" in the menu.").arg(chosen),
        NotInMenu);
}

int run(const Options &options)
{
    const QString whyEmpty = followApplications(options);
    const QFileInfo directory(options.dir);
    const QString why = directory.exists() || whyEmpty.isEmpty() ? obstacle(directory) : whyEmpty;
    if (!why.isEmpty())
        return failToStart(options, why);
    const MenuItem menu = readMenu(directory);
    return options.isToRun ? runChosen(menu) : print(menu, options, whyEmpty);
}

} // namespace

int main(int argc, char **argv)
{
    return Program::runWithoutWindows(argc, argv, QStringLiteral("vel-menuprint"), CannotStart, parse, run);
}
