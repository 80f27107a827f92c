// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class QCommandLineParser;

/// What the programs have in common.
namespace Program {

/// Names the organisation, the program \a name and its version; goes before the application object.
void describe(const QString &name);

/**
 * Makes the programs' and Qt's own texts speak the user's language; goes after the application object,
 * which owns the translators.
 *
 * The programs' catalogue is taken from the directory "../share/vel/translations" beside the program,
 * so that a program works from any prefix, else from the library's fixed directory. Without a
 * catalogue the texts stay English.
 */
void loadCatalogues();

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

/// Prints \a text on standard error as one line, after the program's name.
void printError(const QString &text);

} // namespace Program
