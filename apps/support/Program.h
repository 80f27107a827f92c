// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

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

/// Prints \a text on standard error as one line, after the program's name.
void printError(const QString &text);

} // namespace Program
