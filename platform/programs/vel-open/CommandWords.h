// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

#include <optional>

/**
 * The words of a command line whose field codes are filled in.
 *
 * Words are quoted as in the Exec key of a desktop entry. Single quotes and backslashes outside
 * of quotes count as in a shell, because filled-in arguments come that way (see ShellQuoting).
 * Nothing is expanded.
 *
 * @return nothing when a quote is left open or the line ends with a backslash
 */
std::optional<QStringList> commandWords(const QString &line);
