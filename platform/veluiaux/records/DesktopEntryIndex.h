// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <memory>
#include <string_view>
#include <unordered_map>
#include <vector>

/**
 * The places of groups and keys in the bytes of a desktop entry file.
 *
 * It knows no single line but runs of them: most of a file is one key in all languages, and of
 * those a user needs one. So a run knows where the lines of one language stand, the user's, and
 * is walked over when another one is asked for.
 */
class DesktopEntryIndex
{
public:
    /// One group; a line that begins with "[" but is no header begins a group without a name.
    struct Group
    {
        std::uint32_t line; ///< first byte of the header line
        std::uint32_t name; ///< first byte of the name
        std::uint32_t nameLength;
        std::uint32_t lineEnd; ///< begin of the line after the header
        std::uint32_t firstRun; ///< index of the first run
        std::uint32_t endRun; ///< index behind the last run
    };

    /// Key lines of one key, with a language or without, and no line of another key among them.
    struct Run
    {
        std::uint32_t begin; ///< first byte of the first line
        std::uint32_t end; ///< end of the last line
        std::uint32_t plain; ///< begin of the last line without a language, or NoLine
        std::uint32_t localBegin; ///< begin of the first line in the user's language, or NoLine
        std::uint32_t localEnd; ///< end of the last one
        std::uint32_t name; ///< first byte of the key
        std::uint32_t nameLength; ///< without the language
    };

    /// One "key=value" line.
    struct Key
    {
        std::uint32_t line; ///< first byte of the line
        std::uint32_t key; ///< first byte of the key
        std::uint32_t keyLength; ///< without the language
        std::uint32_t localeLength; ///< 0 without a language
        std::uint32_t value; ///< first byte of the value, after the blanks before it
        std::uint32_t valueEnd; ///< end of the value, without the line end
        std::uint32_t lineEnd; ///< begin of the next line
    };

    /// The first two letters of a language, which tell most languages apart; 0 for a shorter one.
    using Tag = std::uint16_t;
    static Tag tag(std::string_view locale) { return locale.size() < 2 ? Tag(0) : tag(locale.data()); }
    static Tag tag(const char *locale)
    {
        Tag tag;
        std::memcpy(&tag, locale, sizeof tag);
        return tag;
    }

    static constexpr std::uint32_t NoLine = UINT32_MAX;
    static constexpr int NoGroup = -1;

    DesktopEntryIndex() = default;
    /// \a bytes have to outlive this object and to have a zero behind their end. The user's
    /// language is \a language; for any other the index only takes longer.
    DesktopEntryIndex(std::string_view bytes, std::string_view language);

    /// What was found in the bytes.
    struct Places
    {
        std::vector<Group> groups;
        std::vector<Run> runs;
    };
    /// The same without a look at the \a bytes: the \a places were found in such bytes, for that \a language.
    DesktopEntryIndex(std::string_view bytes, Tag language, Places places);

    const std::vector<Group> &groups() const { return m_groups; }
    const std::vector<Run> &runs() const { return m_runs; }
    /// The user's language, or 0.
    Tag language() const { return m_language; }

    /// The last group of that name, or NoGroup.
    int group(std::string_view name) const;

    /// Takes the line apart that begins at \a begin; false if it is no key line. \a key then
    /// still has the end of the line.
    static bool parse(std::string_view bytes, std::uint32_t begin, Key *key);

    /// The memory taken beside the object itself, in bytes.
    std::size_t cost() const;

private:
    std::string_view groupName(const Group &group) const
    {
        return m_bytes.substr(group.name, group.nameLength);
    }
    void nameGroups();

    std::string_view m_bytes;
    Tag m_language = 0;
    std::vector<Group> m_groups;
    std::vector<Run> m_runs;
    std::unique_ptr<std::unordered_map<std::string_view, int>> m_groupByName; ///< only where there are many
};
