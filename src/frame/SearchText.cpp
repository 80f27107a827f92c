// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SearchText.h"

#include <algorithm>

namespace {

// Letters that Unicode does not take apart, as they are typed without them.
void appendPlain(QString *text, QChar c)
{
    switch (c.unicode()) {
    case 0x00df:
        text->append(QLatin1String("ss"));
        break;
    case 0x00e6:
        text->append(QLatin1String("ae"));
        break;
    case 0x0153:
        text->append(QLatin1String("oe"));
        break;
    case 0x00f8:
        text->append(QLatin1Char('o'));
        break;
    case 0x0111:
        text->append(QLatin1Char('d'));
        break;
    case 0x0127:
        text->append(QLatin1Char('h'));
        break;
    case 0x0131:
        text->append(QLatin1Char('i'));
        break;
    case 0x0142:
        text->append(QLatin1Char('l'));
        break;
    default:
        text->append(c);
    }
}

bool isAscii(const QString &text)
{
    return std::all_of(text.begin(), text.end(), [](QChar c) { return c.unicode() < 0x80; });
}

} // namespace

QString SearchText::folded(const QString &text)
{
    if (isAscii(text))
        return text.toLower();
    QString result;
    result.reserve(text.size());
    const QString apart = text.normalized(QString::NormalizationForm_KD).toCaseFolded();
    for (const QChar c : apart) {
        if (c.category() != QChar::Mark_NonSpacing)
            appendPlain(&result, c);
    }
    return result;
}

QStringList SearchText::words(const QString &typed)
{
    QStringList words = folded(typed).simplified().split(QLatin1Char(' '), Qt::SkipEmptyParts);
    words.removeDuplicates();
    std::stable_sort(words.begin(), words.end(),
                     [](const QString &left, const QString &right) { return left.size() > right.size(); });
    return words;
}
