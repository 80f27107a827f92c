// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShellQuoting.h"

using ShellQuoting::Kind;
using ShellQuoting::Piece;
using ShellQuoting::Quote;
using ShellQuoting::Scanner;

namespace {

constexpr QChar Backslash = QLatin1Char('\\');
constexpr QChar SingleQuote = QLatin1Char('\'');
constexpr QChar DoubleQuote = QLatin1Char('"');

bool isBlank(QChar c)
{
    return c == QLatin1Char(' ') || c == QLatin1Char('\t') || c == QLatin1Char('\n');
}

// In double quotes a backslash counts before these alone.
bool isProtectedInDoubleQuotes(QChar c)
{
    return QLatin1String("\\\"`$").contains(c);
}

// The quoting behind a character that no backslash stands before.
Quote after(Quote quote, QChar c)
{
    if (c == SingleQuote && quote != Quote::Double)
        return quote == Quote::Single ? Quote::None : Quote::Single;
    if (c == DoubleQuote && quote != Quote::Single)
        return quote == Quote::Double ? Quote::None : Quote::Double;
    return quote;
}

} // namespace

Piece Scanner::next()
{
    const QChar c = m_line.at(m_position);
    if (c == Backslash && m_quote != Quote::Single)
        return escape();
    if (m_quote == Quote::None && isBlank(c))
        return piece(Kind::Blank, 1, 0);
    const Quote quote = after(m_quote, c);
    if (quote == m_quote)
        return piece(Kind::Character, 1, 1);
    m_quote = quote;
    return piece(Kind::Mark, 1, 0);
}

QChar Scanner::take()
{
    return atEnd() ? QChar() : m_line.at(m_position++);
}

Piece Scanner::escape()
{
    if (m_position + 1 == m_line.size())
        return piece(Kind::OpenEscape, 1, 0);
    const bool isPlain = m_quote == Quote::Double && !isProtectedInDoubleQuotes(m_line.at(m_position + 1));
    return isPlain ? piece(Kind::Escape, 2, 2) : piece(Kind::Escape, 2, 1);
}

// The next piece of that length, of which the end is meant.
Piece Scanner::piece(Kind kind, int length, int meantLength)
{
    const QStringView written = m_line.mid(m_position, length);
    m_position += length;
    return {kind, written, written.right(meantLength)};
}

QString ShellQuoting::escaped(const QString &word, Quote quote)
{
    QString text;
    text.reserve(word.size() + 2);
    for (const QChar c : word) {
        if (quote == Quote::Double && isProtectedInDoubleQuotes(c))
            text += Backslash;
        if (quote != Quote::Double && c == SingleQuote)
            text += QLatin1String("'\\''");
        else
            text += c;
    }
    return text;
}
