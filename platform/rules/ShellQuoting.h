// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringView>

/**
 * How words are quoted in a command line, as a POSIX shell and the Exec key of a desktop entry
 * have it.
 *
 * In double quotes a backslash protects a double quote, a backtick, a dollar sign and a
 * backslash, and is plain before anything else; in single quotes everything is plain; outside a
 * backslash protects whatever follows. Nothing is expanded.
 */
namespace ShellQuoting {

/// The quotes that a place of a line lies in.
enum class Quote { None, Single, Double };

/// What one step over a line meets.
enum class Kind {
    Character, ///< one that stands for itself
    Escape, ///< a backslash and the character behind it
    OpenEscape, ///< a backslash that ends the line
    Mark, ///< a quote that begins or ends quoting
    Blank ///< a blank, tab or line feed outside of quotes
};

/// One step over a line; good as long as the line.
struct Piece
{
    Kind kind;
    QStringView written; ///< as it stands in the line
    QStringView meant; ///< what a word gets of it

    /// The character itself, of an escape the protected one.
    QChar character() const { return written.back(); }
};

/// Adds \a part to \a text.
inline void append(QString &text, QStringView part)
{
    if (part.size() == 1)
        text += part.front(); // most parts, and much cheaper
    else
        text.append(part.data(), int(part.size()));
}

/// Walks over a line, which has to outlive it. Judges nothing: quotes may stay open.
class Scanner
{
public:
    explicit Scanner(const QString &line)
        : m_line(line)
    {
    }

    bool atEnd() const { return m_position >= m_line.size(); }
    /// The quotes that the next piece lies in.
    Quote quote() const { return m_quote; }
    /// Steps over one piece; not at the end.
    Piece next();
    /// Steps over one character whatever it is, as over the letter of a field code; a null
    /// character at the end.
    QChar take();

private:
    Piece piece(Kind kind, int length, int meantLength);
    Piece escape();

    const QStringView m_line;
    int m_position = 0;
    Quote m_quote = Quote::None;
};

/// \a word as it has to be written inside \a quote (outside: inside single quotes that are to
/// be put around it), so that a shell reads it as it is.
QString escaped(const QString &word, Quote quote);

} // namespace ShellQuoting
