// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DesktopEntryIndex.h"

#include <QByteArray>

#include <atomic>
#include <cstdint>
#include <cstring>
#include <mutex>
#include <optional>
#include <string_view>
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
    using Group = DesktopEntryIndex::Group;
    /// Offsets into bytes().
    using Key = DesktopEntryIndex::Key;

    static constexpr int NoGroup = DesktopEntryIndex::NoGroup;

    explicit DesktopEntryText(QByteArray bytes = {});
    /// With an index that was made before, see DesktopEntryIndex.
    DesktopEntryText(QByteArray bytes, DesktopEntryIndex::Tag language, DesktopEntryIndex::Places places);
    DesktopEntryText(const DesktopEntryText &) = delete;
    DesktopEntryText &operator=(const DesktopEntryText &) = delete;

    std::string_view bytes() const { return {m_bytes.constData(), std::size_t(m_bytes.size())}; }
    const std::vector<Group> &groups() const { return index().groups(); }

    std::string_view groupName(const Group &group) const { return view(group.name, group.nameLength); }
    std::string_view keyName(const Key &key) const { return view(key.key, key.keyLength); }
    std::string_view locale(const Key &key) const
    {
        return key.localeLength ? view(key.key + key.keyLength + 1, key.localeLength) : std::string_view();
    }
    std::string_view value(const Key &key) const { return view(key.value, key.valueEnd - key.value); }

    /// The index of the group that counts: the last one of that name, or NoGroup.
    int group(std::string_view name) const { return index().group(name); }

    /// The place for one more key at the end of the group.
    std::uint32_t keysEnd(const Group &group) const;

    /// The key line that counts: the last one of that name in the group, or none.
    std::optional<Key> key(int group, std::string_view name, std::string_view locale = {}) const;

    /// Calls \a visit(Key) for each key line of the group, in the file's order.
    template <typename Visitor>
    void forEachKey(const Group &group, Visitor visit) const
    {
        for (std::uint32_t i = group.firstRun; i < group.endRun; ++i)
            walk(linesOf(index().runs()[i], {}), visit);
    }

    /// The same for the lines of \a name alone, with a language or without.
    template <typename Visitor>
    void forEachLine(int group, std::string_view name, Visitor visit) const
    {
        forEachRun(group, name, [&](const Run &run) { walk(linesOf(run, {}), visit); });
    }

    /// The same for the lines with a language; only those whose language begins with the same
    /// two letters as \a language, if that is given.
    template <typename Visitor>
    void forEachVariant(int group, std::string_view name, Visitor visit, std::string_view language = {}) const
    {
        const auto tag = DesktopEntryIndex::tag(language);
        forEachRun(group, name, [&](const Run &run) {
            walk(linesOf(run, language), [&](const Key &key) {
                if (key.localeLength && (!tag || DesktopEntryIndex::tag(locale(key).data()) == tag))
                    visit(key);
            });
        });
    }

    /// Makes it, if it was never asked for, for the user of now.
    const DesktopEntryIndex &index() const
    {
        if (!m_isIndexed.load(std::memory_order_acquire))
            makeIndexNow();
        return m_index;
    }
    /// Makes the index now, for a user of that \a language, unless there is one.
    void makeIndex(std::string_view language) const;

    /// The memory this object takes, in bytes.
    std::size_t cost() const { return sizeof(*this) + std::size_t(m_bytes.size()) + index().cost(); }

private:
    using Run = DesktopEntryIndex::Run;

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
        const Group &place = groups()[std::size_t(group)];
        for (std::uint32_t i = place.firstRun; i < place.endRun; ++i) {
            const Run &run = index().runs()[i];
            if (isOf(run, name))
                visit(run);
        }
    }

    struct Range
    {
        std::uint32_t begin;
        std::uint32_t end;
    };

    template <typename Visitor>
    void walk(Range lines, Visitor visit) const
    {
        Key key;
        while (findKey(&lines, &key))
            visit(key);
    }
    Range linesOf(const Run &run, std::string_view language) const;
    bool findKey(Range *rest, Key *key) const;

    std::string_view view(std::uint32_t at, std::uint32_t length) const
    {
        return {m_bytes.constData() + at, length};
    }

    void makeIndexNow() const;

    const QByteArray m_bytes;
    // Not std::call_once, which asks the kernel to wake other threads though none waits.
    mutable std::mutex m_indexing;
    mutable std::atomic<bool> m_isIndexed{false};
    mutable DesktopEntryIndex m_index;
};
