// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Owns the window manager's command channel and runs a command for each kind of update.

#include "Bridge.h"
#include "SystemSignal.h"
#include "WindowManagers.h"

#include <support/Program.h>

#include <QCommandLineParser>
#include <QCoreApplication>

#include <csignal>

namespace {

enum ExitStatus { Done = 0, ChannelTaken = 1, CannotStart = 2 };

struct Options
{
    BridgeCommands commands;
    bool replace = false;
    bool updatesAtStart = false;
    QString error; ///< what is wrong with the command line; empty when nothing is
};

// A command that was given counts more than the one of the window manager.
void takeSettings(const QString &manager, Options *options)
{
    const WindowManagers::Settings *const settings = WindowManagers::find(manager);
    if (!settings) {
        options->error =
            QCoreApplication::translate("vel-wmbridge", "unknown window manager: %1 (known are %2)")
                .arg(manager, WindowManagers::names().join(QLatin1String(", ")));
        return;
    }
    if (options->commands.startMenu.isEmpty())
        options->commands.startMenu = QString::fromLatin1(settings->startMenu);
    options->updatesAtStart = settings->runsAtStart;
}

QCommandLineOption commandOption(const char *name, const QString &description)
{
    return {QLatin1String(name), description, QStringLiteral("COMMAND")};
}

/// The options that the parser knows.
struct Switches
{
    QCommandLineOption startMenu = commandOption(
        "startmenu", QCoreApplication::translate("vel-wmbridge", "Run when the start menu has changed."));
    QCommandLineOption toolBar = commandOption(
        "toolbar", QCoreApplication::translate("vel-wmbridge", "Run when the tool bar has changed."));
    QCommandLineOption shortcut = commandOption(
        "shortcut",
        QCoreApplication::translate("vel-wmbridge", "Run when the desktop's entries have changed."));
    QCommandLineOption other =
        commandOption("other", QCoreApplication::translate("vel-wmbridge", "Run for every other line."));
    QCommandLineOption manager{
        QStringLiteral("for"),
        QCoreApplication::translate("vel-wmbridge",
                                    "Do what this window manager needs to show the start menu as it is: %1.")
            .arg(WindowManagers::names().join(QLatin1String(", "))),
        QStringLiteral("NAME")};
    QCommandLineOption replace{
        QStringLiteral("replace"),
        QCoreApplication::translate("vel-wmbridge", "Take the channel from the program that has it.")};
};

Options parse()
{
    QCommandLineParser parser;
    parser.setApplicationDescription(QCoreApplication::translate(
        "vel-wmbridge",
        "Owns the window manager's command channel on a desktop that has none, and runs a command of the "
        "shell for each kind of update. The variable VEL_COMMAND holds the line that came."));
    parser.addHelpOption();
    parser.addVersionOption();
    const Switches switches;
    parser.addOptions({switches.startMenu, switches.toolBar, switches.shortcut, switches.other,
                       switches.manager, switches.replace});

    Options options;
    options.error = Program::parse(parser);
    if (options.error.isEmpty() && !parser.positionalArguments().isEmpty())
        options.error = QCoreApplication::translate("vel-wmbridge", "unexpected argument: %1")
                            .arg(parser.positionalArguments().constFirst());
    options.commands = {parser.value(switches.startMenu), parser.value(switches.toolBar),
                        parser.value(switches.shortcut), parser.value(switches.other)};
    options.replace = parser.isSet(switches.replace);
    if (parser.isSet(switches.manager) && options.error.isEmpty())
        takeSettings(parser.value(switches.manager), &options);
    return options;
}

// Tells of what goes wrong while the bridge runs.
void report(const Bridge *bridge)
{
    QObject::connect(bridge, &Bridge::failed, qApp, [](const QString &line) {
        Program::printError(
            QCoreApplication::translate("vel-wmbridge", "cannot run the command for %1").arg(line));
    });
    QObject::connect(bridge, &Bridge::lost, qApp, [] {
        Program::printError(
            QCoreApplication::translate("vel-wmbridge", "another program has taken the channel"));
        QCoreApplication::exit(ChannelTaken);
    });
}

int run(const Options &options)
{
    Bridge bridge(options.commands);
    report(&bridge);
    if (!bridge.start(options.replace))
        return Program::fail(
            QCoreApplication::translate(
                "vel-wmbridge", "cannot take the channel: there is no display, or another program has it"),
            ChannelTaken);
    if (options.updatesAtStart)
        bridge.updateStartMenu();
    const SystemSignal termination({SIGTERM, SIGINT});
    QObject::connect(&termination, &SystemSignal::caught, qApp, &QCoreApplication::quit);
    const int status = QCoreApplication::exec();
    bridge.stop();
    return status;
}

} // namespace

int main(int argc, char **argv)
{
    return Program::runWithoutWindows(argc, argv, QStringLiteral("vel-wmbridge"), CannotStart, parse, run);
}
