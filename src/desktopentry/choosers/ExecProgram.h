// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// The program of a command, its first word, as the Exec key of a desktop entry writes it.
namespace VelUI::ExecProgram {

/// \a word as a command has to write it: in double quotes where it holds a reserved character.
QString quoted(const QString &word);

/// \a command with its program replaced by \a program; its arguments stay as they are written.
QString replaced(const QString &command, const QString &program);

} // namespace VelUI::ExecProgram
