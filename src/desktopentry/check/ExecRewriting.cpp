// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExecRewriting.h"

#include <algorithm>

namespace {

using ExecRewriting::Word;

bool isBlank(QChar c)
{
    return c == QLatin1Char(' ') || c == QLatin1Char('\t') || c == QLatin1Char('\n');
}

bool isOneOf(const char *set, QChar c)
{
    return QLatin1String(set).contains(c);
}

// Steps over one word.
class WordReader
{
public:
    WordReader(const QString &exec, int begin)
        : m_exec(exec)
        , m_at(begin)
    {
        m_word.begin = begin;
    }

    Word read()
    {
        while (m_at < m_exec.size() && (!m_quote.isNull() || !isBlank(m_exec.at(m_at)))) {
            step(m_exec.at(m_at));
            ++m_at;
        }
        m_word.isPlain = m_word.isPlain && m_quote.isNull();
        m_word.end = m_at;
        return m_word;
    }

private:
    void step(QChar c)
    {
        if (c == QLatin1Char('%') && m_at + 1 < m_exec.size() && m_quote.isNull()) {
            m_word.meant += c;
            take(m_exec.at(++m_at));
        } else if (c == m_quote) {
            m_quote = QChar();
        } else if (m_quote.isNull() && (c == QLatin1Char('"') || isClosedSingle(c))) {
            m_quote = c;
            m_word.isPlain = m_word.isPlain && c == QLatin1Char('"');
        } else if (c == QLatin1Char('\\') && m_quote != QLatin1Char('\'')) {
            escape();
        } else {
            plain(c);
        }
    }

    // What stands behind a "%" ends no word, unless it is the blank that does.
    void take(QChar c)
    {
        if (isBlank(c) || c == QLatin1Char('"'))
            --m_at;
        else
            m_word.meant += c;
    }

    bool isClosedSingle(QChar c) const { return c == QLatin1Char('\'') && m_exec.indexOf(c, m_at + 1) > 0; }

    void escape()
    {
        const QChar next = m_at + 1 < m_exec.size() ? m_exec.at(m_at + 1) : QChar();
        const bool protects = m_quote.isNull() ? !next.isNull() : isOneOf("\"`$\\", next);
        m_word.isPlain = m_word.isPlain && protects && !m_quote.isNull();
        m_word.meant += protects ? next : m_exec.at(m_at);
        m_at += protects ? 1 : 0;
    }

    void plain(QChar c)
    {
        const bool isReserved =
            m_quote.isNull() ? isOneOf("'`$<>~|&;*?#()", c) : m_quote == QLatin1Char('"') && isOneOf("`$", c);
        m_word.isPlain = m_word.isPlain && !isReserved;
        m_word.needsShell = m_word.needsShell || (isReserved && isForShell(c));
        m_word.meant += c;
    }

    // An address has "&" and ";", too, so what stands between two letters means itself.
    bool isForShell(QChar c) const
    {
        const QChar before = m_at > 0 ? m_exec.at(m_at - 1) : QLatin1Char(' ');
        const QChar after = m_at + 1 < m_exec.size() ? m_exec.at(m_at + 1) : QLatin1Char(' ');
        if (c == QLatin1Char('`'))
            return true;
        if (c == QLatin1Char('$'))
            return after.isLetter() || isOneOf("_{(", after);
        return isOneOf("<>|&;()", c) && !(before.isLetterOrNumber() && after.isLetterOrNumber());
    }

    const QString &m_exec;
    int m_at;
    QChar m_quote;
    Word m_word;
};

bool endsInSinglePercent(const QString &text)
{
    int count = 0;
    while (count < text.size() && text.at(text.size() - 1 - count) == QLatin1Char('%'))
        ++count;
    return count % 2 == 1;
}

// Walks over the field codes; calls visit(position, letter) with where a "%" stands.
template <typename Visit>
void forEachCode(const QString &exec, Visit visit)
{
    for (int i = 0; i < exec.size(); ++i) {
        if (exec.at(i) != QLatin1Char('%'))
            continue;
        visit(i, i + 1 < exec.size() ? exec.at(i + 1) : QChar());
        ++i;
    }
}

struct Part
{
    int begin;
    int end;
};

// The code at a place, with the blank before it where it is a word of its own.
Part partOf(const QString &exec, int code)
{
    Part part{code, code + 2};
    bool isQuoted = part.begin > 0 && part.end < exec.size() && exec.at(part.begin - 1) == QLatin1Char('"')
        && exec.at(part.end) == QLatin1Char('"');
    if (isQuoted)
        part = {part.begin - 1, part.end + 1};
    const bool begins = part.begin == 0 || isBlank(exec.at(part.begin - 1));
    const bool ends = part.end == exec.size() || isBlank(exec.at(part.end));
    if (isQuoted && !(begins && ends))
        return {code, code + 2};
    return begins && ends && part.begin > 0 ? Part{part.begin - 1, part.end} : part;
}

} // namespace

QVector<ExecRewriting::Word> ExecRewriting::words(const QString &exec)
{
    QVector<Word> words;
    for (int at = 0; at < exec.size();) {
        if (isBlank(exec.at(at))) {
            ++at;
            continue;
        }
        words.append(WordReader(exec, at).read());
        at = words.constLast().end;
    }
    return words;
}

QString ExecRewriting::quoted(const QString &text)
{
    QString inside;
    bool isPlain = !text.isEmpty();
    for (const QChar c : text) {
        isPlain = isPlain && !isBlank(c) && !isOneOf("\"'\\`$<>~|&;*?#()", c);
        if (isOneOf("\"`$\\", c))
            inside += QLatin1Char('\\');
        inside += c;
    }
    // With a single one the quote behind it would be taken for a field code.
    if (endsInSinglePercent(text))
        inside += QLatin1Char('%');
    return isPlain ? text : QLatin1Char('"') + inside + QLatin1Char('"');
}

QString ExecRewriting::requoted(const QString &exec, const QString &home)
{
    QString result;
    int at = 0;
    const QVector<Word> all = words(exec);
    for (const Word &word : all) {
        result += exec.mid(at, word.begin - at);
        const QString written = exec.mid(word.begin, word.end - word.begin);
        const bool isInHome = written == QLatin1String("~") || written.startsWith(QLatin1String("~/"));
        result += word.isPlain ? written : quoted(isInHome ? home + word.meant.mid(1) : word.meant);
        at = word.end;
    }
    return result + exec.mid(at);
}

bool ExecRewriting::needsShell(const QString &exec)
{
    const QVector<Word> all = words(exec);
    return std::any_of(all.cbegin(), all.cend(), [](const Word &word) { return word.needsShell; });
}

QString ExecRewriting::throughShell(const QString &exec)
{
    if (exec.contains(QLatin1Char('%')))
        return {};
    return QLatin1String("sh -c ") + quoted(exec.trimmed());
}

QString ExecRewriting::withPlainPercents(const QString &exec)
{
    QString result;
    int kept = 0;
    forEachCode(exec, [&](int at, QChar code) {
        if (!code.isNull() && isOneOf("%fFuUickdDnNvm", code))
            return;
        result += exec.mid(kept, at - kept) + QLatin1Char('%');
        kept = at;
    });
    return result + exec.mid(kept);
}

QString ExecRewriting::withoutCodes(const QString &exec, const QString &codes, const QString &once)
{
    QString result;
    int kept = 0;
    bool wasMet = false;
    forEachCode(exec, [&](int at, QChar code) {
        const bool goes = codes.contains(code) || (once.contains(code) && wasMet);
        wasMet = wasMet || once.contains(code);
        if (!goes || code.isNull())
            return;
        const Part part = partOf(exec, at);
        result += exec.mid(kept, part.begin - kept);
        kept = part.end;
    });
    return result + exec.mid(kept);
}
