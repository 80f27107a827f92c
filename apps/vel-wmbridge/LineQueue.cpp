// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LineQueue.h"

#include <algorithm>

bool LineQueue::add(const std::string &line)
{
    if (std::find(m_waiting.begin(), m_waiting.end(), line) != m_waiting.end())
        return true;
    if (m_waiting.size() >= Longest)
        return false;
    m_waiting.push_back(line);
    return true;
}

std::optional<std::string> LineQueue::start()
{
    if (m_running.size() >= MostRunning)
        return std::nullopt;
    const auto next = std::find_if(m_waiting.begin(), m_waiting.end(),
                                   [this](const std::string &line) { return m_running.count(line) == 0; });
    if (next == m_waiting.end())
        return std::nullopt;
    const std::string line = *next;
    m_waiting.erase(next);
    m_running.insert(line);
    return line;
}

void LineQueue::end(const std::string &line)
{
    m_running.erase(line);
}
