// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// The program of a command, its first word, as the Exec key of a desktop entry writes it.
namespace VelUI::ExecProgram {

/// \a command with its program replaced by \a program, which is quoted where it has to be; the
/// arguments stay as they are written.
QString replaced(const QString &command, const QString &program);

} // namespace VelUI::ExecProgram
