// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TextWidth.h"

TextWidth::TextWidth(const QFont &font)
    : m_metrics(font)
{
    m_widths.fill(-1);
}

int TextWidth::of(const QString &text)
{
    int sum = 0;
    for (const QChar character : text) {
        const ushort code = character.unicode();
        if (code >= m_widths.size()) {
            sum += m_metrics.horizontalAdvance(character);
            continue;
        }
        int &width = m_widths[code];
        if (width < 0)
            width = m_metrics.horizontalAdvance(character);
        sum += width;
    }
    return sum;
}
