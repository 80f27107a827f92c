// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CommandWords.h"

namespace {

bool isBlank(QChar c)
{
    return c == QLatin1Char(' ') || c == QLatin1Char('\t') || c == QLatin1Char('\n');
}

bool isProtectedInQuotes(QChar c)
{
    return QStringLiteral("\"`$\\").contains(c);
}

// Reads the line from left to right; each step takes one word or one piece of it.
class Reader
{
public:
    explicit Reader(const QString &line)
        : m_line(line)
    {
    }

    std::optional<QStringList> words()
    {
        QStringList words;
        for (skipBlanks(); !atEnd(); skipBlanks()) {
            QString word;
            if (!readWord(&word))
                return {};
            words.append(word);
        }
        return words;
    }

private:
    bool atEnd() const { return m_position >= m_line.size(); }

    void skipBlanks()
    {
        while (!atEnd() && isBlank(m_line.at(m_position)))
            ++m_position;
    }

    bool readWord(QString *word)
    {
        bool good = true;
        while (good && !atEnd() && !isBlank(m_line.at(m_position))) {
            const QChar c = m_line.at(m_position++);
            if (c == QLatin1Char('"'))
                good = readDoubleQuotes(word);
            else if (c == QLatin1Char('\''))
                good = readSingleQuotes(word);
            else if (c != QLatin1Char('\\'))
                *word += c;
            else if ((good = !atEnd()))
                *word += m_line.at(m_position++);
        }
        return good;
    }

    bool readDoubleQuotes(QString *word)
    {
        while (!atEnd()) {
            const QChar c = m_line.at(m_position++);
            if (c == QLatin1Char('"'))
                return true;
            const bool isProtecting =
                c == QLatin1Char('\\') && !atEnd() && isProtectedInQuotes(m_line.at(m_position));
            *word += isProtecting ? m_line.at(m_position++) : c;
        }
        return false;
    }

    bool readSingleQuotes(QString *word)
    {
        const int end = m_line.indexOf(QLatin1Char('\''), m_position);
        if (end < 0)
            return false;
        *word += m_line.midRef(m_position, end - m_position);
        m_position = end + 1;
        return true;
    }

    const QString m_line;
    int m_position = 0;
};

} // namespace

std::optional<QStringList> commandWords(const QString &line)
{
    return Reader(line).words();
}
