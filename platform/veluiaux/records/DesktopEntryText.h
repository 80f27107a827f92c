// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

#include <atomic>
#include <cstdint>
#include <cstring>
#include <mutex>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

/**
 * The bytes of one desktop entry file and the places of its groups and keys.
 *
 * Immutable, so any number of records and threads may share one; the index is made when it is
 * first asked for. It knows of each key line no more than where it begins, so it stays small;
 * a line is taken apart when it is asked for. Nothing of the file is lost or judged: lines that
 * are neither key, header, comment nor blank simply have no place in the index. Values stay as
 * they stand in the file (see DesktopEntryValue).
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
        std::uint32_t firstRun;
        std::uint32_t endRun;
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
    /// The key line of that index.
    Key keyAt(std::uint32_t index) const;

    std::string_view groupName(const Group &group) const { return view(group.name, group.nameLength); }
    std::string_view keyName(const Key &key) const { return view(key.key, key.keyLength); }
    std::string_view locale(const Key &key) const
    {
        return key.localeLength ? view(key.key + key.keyLength + 1, key.localeLength) : std::string_view();
    }
    std::string_view value(const Key &key) const { return view(key.value, key.valueEnd - key.value); }

    /// The index of the group that counts: the last one of that name, or NoGroup.
    int group(std::string_view name) const;

    /// The key line that counts: the last one of that name in the group, or none.
    std::optional<Key> key(int group, std::string_view name, std::string_view locale = {}) const;

    /// Calls \a visit(Key) for each line of \a name in the group, with a language or without,
    /// in the file's order.
    template <typename Visitor>
    void forEachLine(int group, std::string_view name, Visitor visit) const
    {
        forEachRun(group, name, [this, &visit](const Run &run) {
            for (std::uint32_t i = run.firstKey; i < run.endKey; ++i)
                visit(keyAt(i));
        });
    }

    /// The same for the lines with a language; only those whose language begins with the same
    /// two letters as \a language, if that is given.
    template <typename Visitor>
    void forEachVariant(int group, std::string_view name, Visitor visit, std::string_view language = {}) const
    {
        const bool anyLanguage = language.size() < 2;
        const std::uint32_t wanted = tag(language);
        forEachRun(group, name, [&](const Run &run) {
            for (std::uint32_t i = run.firstKey; i < run.endKey; ++i) {
                if (m_lines[i].tag != wanted && !anyLanguage)
                    continue;
                const Key key = keyAt(i);
                if (key.localeLength)
                    visit(key);
            }
        });
    }

    /// The memory this object takes, in bytes.
    std::size_t cost() const;

private:
    // Where a key line begins, and the first two bytes of its language.
    struct Line
    {
        std::uint32_t begin;
        std::uint32_t tag;
    };

    // Lines of one key that follow each other: mostly the key and all its languages. A look-up
    // walks over these few instead of over all lines.
    struct Run
    {
        std::uint32_t name;
        std::uint32_t nameLength;
        std::uint32_t firstKey;
        std::uint32_t endKey;
        bool isPlain; // no bracket in the name
    };

    static std::uint32_t tag(std::string_view locale)
    {
        const auto byte = [locale](std::size_t i) {
            return i < locale.size() ? std::uint32_t(static_cast<unsigned char>(locale[i])) : 0U;
        };
        return byte(0) << 8 | byte(1);
    }

    bool isOf(const Run &run, std::string_view name) const
    {
        return run.nameLength == name.size()
            && std::memcmp(m_bytes.constData() + run.name, name.data(), name.size()) == 0;
    }

    template <typename Visitor>
    void forEachRun(int group, std::string_view name, Visitor visit) const
    {
        if (group == NoGroup)
            return;
        makeIndex();
        const Group &place = m_groups[std::size_t(group)];
        for (std::uint32_t i = place.firstRun; i < place.endRun; ++i) {
            if (isOf(m_runs[i], name))
                visit(m_runs[i]);
        }
    }

    std::string_view view(std::uint32_t at, std::uint32_t length) const
    {
        return {m_bytes.constData() + at, length};
    }

    void makeIndex() const
    {
        // std::call_once alone costs more than most of the look-ups that come here.
        if (!m_isIndexed.load(std::memory_order_acquire))
            std::call_once(m_indexing, [this] { const_cast<DesktopEntryText *>(this)->index(); });
    }
    void index();
    void addLine(std::uint32_t begin, std::uint32_t end);
    std::size_t addVariants(std::size_t begin);
    void addHeader(std::uint32_t begin, std::uint32_t open, std::uint32_t end);
    bool parse(std::uint32_t begin, std::uint32_t end, Key *key) const;
    void addKey(const Key &key);
    void endGroup();
    void indexGroups();

    const QByteArray m_bytes;
    mutable std::once_flag m_indexing;
    std::atomic<bool> m_isIndexed{false};
    std::vector<Group> m_groups;
    std::vector<Run> m_runs;
    std::vector<Line> m_lines;
    std::unordered_map<std::string_view, int> m_groupByName; ///< only where there are many
};
