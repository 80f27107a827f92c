// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <cstddef>
#include <string>

/**
 * Cuts the bytes of the command channel into lines, in time that grows with their number alone.
 *
 * A line above VelWmCommand::LongestLine is dropped, also when it comes in pieces; no more than
 * that is kept of a line whose end has not come.
 */
class CommandLines
{
public:
    /// Adds what has arrived.
    void append(const char *bytes, std::size_t count);

    /// Takes the next whole line, without its line feed; false when there is none.
    bool take(std::string *line);

    /// Forgets the line whose end has not come; the next byte begins another one.
    void dropHalf();

    /// Forgets all bytes.
    void clear();

private:
    void keepHalf();

    std::string m_bytes;
    std::size_t m_begin = 0; // of what was not taken
    bool m_skipping = false; // up to the end of a line that is too long
};
