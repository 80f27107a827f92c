// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CommandWords.h"

#include <ShellQuoting.h>

using ShellQuoting::Kind;

std::optional<QStringList> commandWords(const QString &line)
{
    QStringList words;
    bool isInWord = false;
    ShellQuoting::Scanner scanner(line);
    while (!scanner.atEnd()) {
        const ShellQuoting::Piece piece = scanner.next();
        if (piece.kind == Kind::OpenEscape)
            return {};
        if (piece.kind == Kind::Blank) {
            isInWord = false;
            continue;
        }
        if (!isInWord)
            words.append(QString());
        isInWord = true;
        ShellQuoting::append(words.last(), piece.meant);
    }
    if (scanner.quote() != ShellQuoting::Quote::None)
        return {};
    return words;
}
