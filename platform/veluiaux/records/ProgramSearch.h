// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// Finds programs the way a shell does.
namespace ProgramSearch {

enum class Result { Found, Missing, NotExecutable };

/// Whether the program names a place rather than a name to be looked up in PATH.
bool isPath(const QString &program);

/// Looks for \a program; a relative path counts from \a folder, if that is given.
Result find(const QString &program, const QString &folder = QString());

} // namespace ProgramSearch
