// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LineScan.h"

LineScan::LineScan(std::string_view text)
    : m_text(text)
    , m_begin(text.substr(0, 3) == "\xEF\xBB\xBF" ? 3 : 0)
{
}

std::size_t LineScan::lineAbove(std::size_t line) const
{
    if (line < m_begin + 2)
        return m_begin;
    const std::size_t feed = m_text.rfind('\n', line - 2);
    return feed == std::string_view::npos || feed + 1 < m_begin ? m_begin : feed + 1;
}

LineScan::Kind LineScan::kind(std::size_t line, std::size_t end) const
{
    const std::size_t first = m_text.find_first_not_of(" \t\r\n", line);
    if (first == std::string_view::npos || first >= end)
        return Kind::Blank;
    return m_text[first] == '#' ? Kind::Comment : Kind::Other;
}

std::size_t LineScan::commentsAbove(std::size_t line) const
{
    while (line > m_begin) {
        const std::size_t above = lineAbove(line);
        if (kind(above, line) != Kind::Comment)
            break;
        line = above;
    }
    return line;
}

std::size_t LineScan::contentEnd(std::size_t end) const
{
    while (end > m_begin) {
        const std::size_t above = lineAbove(end);
        if (kind(above, end) != Kind::Blank)
            break;
        end = above;
    }
    return end;
}

std::string LineScan::lineEndAt(std::size_t at) const
{
    std::size_t feed = at > 0 ? m_text.rfind('\n', at - 1) : std::string_view::npos;
    if (feed == std::string_view::npos)
        feed = m_text.find('\n');
    if (feed == std::string_view::npos)
        return "\n";
    return feed > 0 && m_text[feed - 1] == '\r' ? "\r\n" : "\n";
}
