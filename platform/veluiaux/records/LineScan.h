// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <cstddef>
#include <string>
#include <string_view>

/// Answers about the lines of a text that no index keeps, because only writing asks for them.
class LineScan
{
public:
    /// The bytes of \a text have to outlive this object.
    explicit LineScan(std::string_view text);

    /// The first byte behind a byte order mark.
    std::size_t begin() const { return m_begin; }

    /// The begin of the unbroken run of comment lines right above the line at \a line, else \a line.
    std::size_t commentsAbove(std::size_t line) const;

    /// The end of the last line before \a end that is not blank.
    std::size_t contentEnd(std::size_t end) const;

    /// The line end for a new line at \a at: the nearest one above, else the first in the text.
    std::string lineEndAt(std::size_t at) const;

private:
    enum class Kind { Blank, Comment, Other };
    std::size_t lineAbove(std::size_t line) const;
    Kind kind(std::size_t line, std::size_t end) const;

    std::string_view m_text;
    std::size_t m_begin;
};
