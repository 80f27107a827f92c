// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <array>
#include <string>
#include <string_view>

/**
 * The user's message locale and how well the language of a localized key fits it.
 *
 * Read from LC_ALL, LC_MESSAGES and LANG, the first that is set and not empty, without
 * encoding. "C", "POSIX" and no locale at all stand for "en". The object points into the
 * environment: it is for use at once, not for keeping.
 */
class MessageLocale
{
public:
    /// The ranks of a match run from 1, the language alone, to this, all three parts.
    static constexpr int BestRank = 4;

    /// The locale of the running process. Worked out once for each thread, and anew when variables
    /// were set or removed, or the text of one of these three was changed where it stands.
    static MessageLocale current();
    /// The locale written as "lang_COUNTRY.ENCODING@MODIFIER", all but the first optional.
    explicit MessageLocale(std::string_view text);

    /// The language without country and modifier.
    std::string_view language() const { return m_language; }

    /// How well \a keyLocale fits: lang_COUNTRY@MODIFIER 4, lang_COUNTRY 3, lang@MODIFIER 2, lang 1, else 0.
    int rank(std::string_view keyLocale) const;

    /// The key locale of that rank; empty if this locale lacks a part that it needs.
    std::string keyLocale(int rank) const;

private:
    std::string_view m_language;
    std::string_view m_country; ///< with its "_"
    std::string_view m_modifier; ///< with its "@"
};
