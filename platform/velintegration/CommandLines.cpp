// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CommandLines.h"

#include <velintegration/wmcommand.h>

void CommandLines::append(const char *bytes, std::size_t count)
{
    m_bytes.append(bytes, count);
}

bool CommandLines::take(std::string *line)
{
    std::size_t end = 0;
    while ((end = m_bytes.find('\n', m_begin)) != std::string::npos) {
        const std::size_t begin = m_begin;
        const bool isWhole = !m_skipping && end - begin <= VelWmCommand::LongestLine;
        m_begin = end + 1;
        m_skipping = false;
        if (isWhole) {
            line->assign(m_bytes, begin, end - begin);
            return true;
        }
    }
    keepHalf();
    return false;
}

void CommandLines::keepHalf()
{
    m_bytes.erase(0, m_begin);
    m_begin = 0;
    if (m_bytes.size() > VelWmCommand::LongestLine)
        m_skipping = true;
    if (m_skipping)
        m_bytes.clear();
    m_bytes.shrink_to_fit();
}

void CommandLines::dropHalf()
{
    const std::size_t lastEnd = m_bytes.rfind('\n');
    const bool hasWholeLine = lastEnd != std::string::npos && lastEnd >= m_begin;
    m_bytes.resize(hasWholeLine ? lastEnd + 1 : m_begin);
    if (!hasWholeLine)
        m_skipping = false;
}

void CommandLines::clear()
{
    *this = CommandLines();
}
