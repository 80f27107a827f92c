// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Terminal.h"

#include "CommandWords.h"
#include "ProgramStart.h"

#include <QString>

QStringList terminalWords()
{
    const QString preferred = QString::fromLocal8Bit(qgetenv("TERMINAL"));
    for (const QString &terminal :
         {preferred, QStringLiteral("x-terminal-emulator"), QStringLiteral("xterm")}) {
        const QStringList words = commandWords(terminal).value_or(QStringList());
        if (!words.isEmpty() && whyNotExecutable(words.first(), QString()).isEmpty())
            return words + QStringList(QStringLiteral("-e"));
    }
    return {};
}
