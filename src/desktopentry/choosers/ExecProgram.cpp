// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExecProgram.h"

#include <algorithm>

namespace VelUI {

namespace {

bool isBlank(QChar c)
{
    return c == QLatin1Char(' ') || c == QLatin1Char('\t') || c == QLatin1Char('\n');
}

bool isReserved(QChar c)
{
    return QStringLiteral(" \t\n\"'\\><~|&;$*?#()`").contains(c);
}

// Behind the program that begins at \a start.
int endOfProgram(const QString &command, int start)
{
    QChar quote;
    for (int i = start; i < command.size(); ++i) {
        const QChar c = command.at(i);
        if (c == QLatin1Char('\\') && quote != QLatin1Char('\''))
            ++i;
        else if (!quote.isNull() && c == quote)
            quote = QChar();
        else if (quote.isNull() && (c == QLatin1Char('"') || c == QLatin1Char('\'')))
            quote = c;
        else if (quote.isNull() && isBlank(c))
            return i;
    }
    return command.size();
}

} // namespace

QString ExecProgram::quoted(const QString &word)
{
    QString text = word;
    text.replace(QLatin1Char('%'), QLatin1String("%%"));
    if (std::none_of(text.cbegin(), text.cend(), isReserved))
        return text;
    QString result(QLatin1Char('"'));
    for (const QChar c : qAsConst(text)) {
        if (QStringLiteral("\"`$\\").contains(c))
            result += QLatin1Char('\\');
        result += c;
    }
    return result + QLatin1Char('"');
}

QString ExecProgram::replaced(const QString &command, const QString &program)
{
    const auto first = std::find_if_not(command.cbegin(), command.cend(), isBlank);
    const int start = int(first - command.cbegin());
    return command.left(start) + quoted(program) + command.mid(endOfProgram(command, start));
}

} // namespace VelUI
