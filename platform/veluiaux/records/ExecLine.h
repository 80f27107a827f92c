// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

#include <optional>

/**
 * The Exec value of an entry: a command line of a POSIX shell with field codes in it.
 */
namespace ExecLine {

/// What the field codes stand for; what is empty is not given.
struct Arguments
{
    QString filePath;
    QString url;
    QString appName;
    QString icon;
    QString desktopFilePath;
    QStringList filePaths;
    QStringList urls;
};

/**
 * The command line with its field codes filled in.
 *
 * Each argument is quoted for the place where its code stands, so that a shell gives it back
 * as it is; everything else is copied. Empty when \a exec has an unknown field code.
 */
QString expand(const QString &exec, const Arguments &arguments);

/// The program that \a exec starts, without quoting; none if \a exec is no command line
/// (an open quote, an unknown field code, a program that is a field code, or a "#", ";", "|", "&",
/// "<" or ">" outside of quotes before a field code).
std::optional<QString> program(const QString &exec);

} // namespace ExecLine
