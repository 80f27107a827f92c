// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

#include <cstdint>
#include <mutex>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

/**
 * The bytes of one desktop entry file and the places of its groups and keys.
 *
 * Immutable, so any number of records and threads may share one; the index is made when it is
 * first asked for. Nothing of the file is lost or judged: lines that are neither key, header,
 * comment nor blank simply have no place in the index. Values stay as they stand in the file
 * (see DesktopEntryValue).
 */
class DesktopEntryText
{
public:
    /// One "key=value" line; offsets into bytes().
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

    /// One group; a line that begins with "[" but is no header begins a group without a name.
    struct Group
    {
        std::uint32_t line; ///< first byte of the header line
        std::uint32_t name; ///< first byte of the name
        std::uint32_t nameLength;
        std::uint32_t lineEnd; ///< begin of the line after the header
        std::uint32_t firstKey; ///< index of the first key
        std::uint32_t endKey; ///< index behind the last key
    };

    static constexpr int NoGroup = -1;

    explicit DesktopEntryText(QByteArray bytes = {});
    DesktopEntryText(const DesktopEntryText &) = delete;
    DesktopEntryText &operator=(const DesktopEntryText &) = delete;

    std::string_view bytes() const { return {m_bytes.constData(), std::size_t(m_bytes.size())}; }
    const std::vector<Group> &groups() const
    {
        makeIndex();
        return m_groups;
    }
    const std::vector<Key> &keys() const
    {
        makeIndex();
        return m_keys;
    }

    std::string_view groupName(const Group &group) const { return view(group.name, group.nameLength); }
    std::string_view keyName(const Key &key) const { return view(key.key, key.keyLength); }
    std::string_view locale(const Key &key) const
    {
        return key.localeLength ? view(key.key + key.keyLength + 1, key.localeLength) : std::string_view();
    }
    std::string_view value(const Key &key) const { return view(key.value, key.valueEnd - key.value); }

    /// The index of the group that counts: the last one of that name, or NoGroup.
    int group(std::string_view name) const;

    /// The key line that counts: the last one of that name in the group, or null.
    const Key *key(int group, std::string_view name, std::string_view locale = {}) const;

    /// Calls \a visit(Key) for each line of \a name in the group that has a language, in the
    /// file's order; only those whose language begins like \a language, if that is given.
    template <typename Visitor>
    void forEachVariant(int group, std::string_view name, Visitor visit, std::string_view language = {}) const
    {
        if (group == NoGroup)
            return;
        makeIndex();
        const bool anyLanguage = language.size() < 2;
        const Tag mask = anyLanguage ? NameBits : ~Tag(0);
        const Tag wanted = tag(name, language) & mask;
        const Group &place = m_groups[std::size_t(group)];
        for (std::uint32_t i = place.firstKey; i < place.endKey; ++i) {
            if ((m_tags[i] & mask) == wanted && m_keys[i].localeLength && keyName(m_keys[i]) == name)
                visit(m_keys[i]);
        }
    }

    /// The memory this object takes, in bytes.
    std::size_t cost() const;

private:
    // A few bits that nearly always tell two keys apart, so that a look-up is a walk over one
    // short array of numbers: length, first and last byte of the name, begin of the language.
    using Tag = std::uint64_t;
    static constexpr Tag NameBits = 0xffffffffU;

    static Tag tag(std::string_view name, std::string_view locale)
    {
        const auto byte = [](char c) { return Tag(static_cast<unsigned char>(c)); };
        Tag tag = Tag(name.size() & 0xffff) << 16 | byte(name.front()) << 8 | byte(name.back());
        if (!locale.empty())
            tag |= byte(locale[0]) << 40 | (locale.size() > 1 ? byte(locale[1]) << 32 : 0);
        return tag;
    }

    std::string_view view(std::uint32_t at, std::uint32_t length) const
    {
        return {m_bytes.constData() + at, length};
    }

    void makeIndex() const
    {
        std::call_once(m_indexed, [this] { const_cast<DesktopEntryText *>(this)->index(); });
    }
    void index();
    void addLine(std::uint32_t begin, std::uint32_t end, std::uint32_t next);
    void addHeader(std::uint32_t begin, std::uint32_t open, std::uint32_t end, std::uint32_t next);
    void addKey(std::uint32_t begin, std::uint32_t name, std::uint32_t end, std::uint32_t next);
    void indexGroups();

    const QByteArray m_bytes;
    mutable std::once_flag m_indexed;
    std::vector<Group> m_groups;
    std::vector<Key> m_keys;
    std::vector<Tag> m_tags;
    std::unordered_map<std::string_view, int> m_groupByName; ///< only where there are many
};
