// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutFilter.h"

#include <algorithm>

QString ShortcutFilter::folded(const QString &text)
{
    const auto isAscii = [](QChar character) { return character.unicode() < 0x80; };
    if (std::all_of(text.begin(), text.end(), isAscii))
        return text.toLower();
    QString folded;
    const QString decomposed = text.normalized(QString::NormalizationForm_KD);
    for (const QChar character : decomposed) {
        if (character.category() != QChar::Mark_NonSpacing)
            folded += character;
    }
    return folded.toCaseFolded();
}

void ShortcutFilter::setText(const QString &text)
{
    m_words = folded(text).simplified().split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

bool ShortcutFilter::matches(const Row &row) const
{
    if (m_changedOnly && !row.isChanged)
        return false;
    const auto hasKey = [this](const QKeySequence &key) {
        return m_key.matches(key) != QKeySequence::NoMatch;
    };
    if (!m_key.isEmpty() && std::none_of(row.keys.begin(), row.keys.end(), hasKey))
        return false;
    return std::all_of(m_words.begin(), m_words.end(),
                       [&row](const QString &word) { return row.text.contains(word); });
}
