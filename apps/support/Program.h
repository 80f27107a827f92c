// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QString>

class QCommandLineParser;

/**
 * What the programs have in common.
 *
 * Each program has a struct for its options, with a member `error` that says what is wrong with the
 * command line and is empty when nothing is; a function that reads the command line into it; and a
 * function that does the work and returns the exit status. runWithoutWindows() calls both;
 * WindowProgram.h has its counterpart for a program that opens windows.
 */
namespace Program {

/// Names the organization, the program \a name and its version, and has HOME set to the user's home;
/// goes before the application object.
void describe(const QString &name);

/**
 * Makes the programs' and Qt's own texts speak the user's language; goes after the application object,
 * which owns the translators.
 *
 * The programs' catalog is taken from the prefix that the program itself lies in, wherever that was
 * moved to, else from the library's fixed directory. Without a
 * catalog the texts stay English.
 */
void loadCatalogs();

/// Whether help or the version may be asked for, which are to be had without a display.
bool mayWantNoWindow(int argc, char **argv);

/**
 * Reads the application's command line; prints help or the version and ends the program when it
 * asks for them.
 *
 * @param parser knows all options, --help and --version among them
 * @return what is wrong with the command line; empty when nothing is
 */
QString parse(QCommandLineParser &parser);

/// Prints \a text on standard error as one line, after the program's name; "?" stands for every
/// control character in it.
void printError(const QString &text);

/// Prints \a text like printError() and returns the exit status \a status.
int fail(const QString &text, int status);

/**
 * Makes an application object, reads the command line and goes on with \a run.
 *
 * @param wrongUsage the exit status when something is wrong with the command line, not 0
 * @param parse returns the options
 * @param run is given the options and returns the exit status
 */
template <typename Application, typename Parse, typename Run>
int runAs(int &argc, char **argv, int wrongUsage, Parse parse, Run run)
{
    Application application(argc, argv);
    loadCatalogs();
    const auto options = parse();
    return options.error.isEmpty() ? run(options) : fail(options.error, wrongUsage);
}

/// The whole main() of the program \a name, which never opens a window; the rest as in runAs().
template <typename Parse, typename Run>
int runWithoutWindows(int &argc, char **argv, const QString &name, int wrongUsage, Parse parse, Run run)
{
    describe(name);
    return runAs<QCoreApplication>(argc, argv, wrongUsage, parse, run);
}

} // namespace Program
