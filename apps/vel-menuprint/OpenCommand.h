// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// The commands that menus run.
namespace OpenCommand {

/// The command line of a shell that opens \a path, whatever characters it holds. It has no backslash
/// but those of the path: menu files have a meaning of their own for them.
inline QString of(const QString &path)
{
    return QStringLiteral("vel-open --exec '")
        + QString(path).replace(QLatin1Char('\''), QStringLiteral("'\"'\"'")) + QLatin1Char('\'');
}

} // namespace OpenCommand
