// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QVector>

/// A command read leniently, with all that users write, and written as the standard has it.
namespace ExecRewriting {

/// A word of a command.
struct Word
{
    int begin = 0; ///< where it stands in the command
    int end = 0;
    QString meant; ///< without its quoting; field codes stay as they are
    bool isPlain = true; ///< what it is made of needs no other quoting
    bool needsShell = false; ///< only a shell makes of it what the user seems to mean
};

/// The words of \a exec, a command without the escapes of the file.
QVector<Word> words(const QString &exec);

/// \a text as one word, in quotes where it needs them.
QString quoted(const QString &text);

/// \a exec with every word quoted as it has to be; all else stays as it is. A folder "~" becomes
/// \a home.
QString requoted(const QString &exec, const QString &home);

/// Whether \a exec is meant for a shell: a pipe, a variable, a command in a command...
bool needsShell(const QString &exec);
/// A command that has a shell run \a exec; empty where that cannot be: field codes are no matter for
/// a shell.
QString throughShell(const QString &exec);

/// \a exec with another character before each "%" that begins no field code, so that it is a plain one.
QString withPlainPercents(const QString &exec);
/// \a exec without the field codes \a codes ("dDnN"); of those in \a once, without all but the first
/// of them all. A word that was nothing else goes.
QString withoutCodes(const QString &exec, const QString &codes, const QString &once = QString());

} // namespace ExecRewriting
