// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <cstddef>
#include <deque>
#include <optional>
#include <set>
#include <string>

/**
 * The lines whose commands wait for their turn.
 *
 * A line that waits already is not taken in again: one run shows the state for all of them. The
 * command of a line never runs twice at a time, so that two runs do not write one file.
 */
class LineQueue
{
public:
    /// The most lines that wait.
    static constexpr std::size_t Longest = 256;
    /// The most commands that run at a time; one that stays does not hold the others up.
    static constexpr std::size_t MostRunning = 4;

    /// Takes \a line in; false when too many wait already.
    bool add(const std::string &line);

    /// The next line whose command may run; counts as running from now on.
    std::optional<std::string> start();

    /// The command of \a line has ended.
    void end(const std::string &line);

    /// Whether no line waits.
    bool isEmpty() const { return m_waiting.empty(); }

private:
    std::deque<std::string> m_waiting;
    std::set<std::string> m_running;
};
