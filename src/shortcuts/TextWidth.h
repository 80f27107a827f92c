// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QFontMetrics>
#include <QString>

#include <array>

/**
 * Estimates how wide texts are, a hundred times as fast as by laying them out.
 *
 * The widths of the characters are summed up, without kerning and ligatures: good enough to
 * tell which few of many texts may be the widest.
 */
class TextWidth
{
public:
    explicit TextWidth(const QFont &font);

    /// The estimated width of \a text in pixels.
    int of(const QString &text);

private:
    const QFontMetrics m_metrics;
    std::array<int, 256> m_widths; // of the first characters; -1 while unknown
};
