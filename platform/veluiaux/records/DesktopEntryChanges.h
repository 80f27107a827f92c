// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <algorithm>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_set>
#include <utility>
#include <vector>

/**
 * What a record did to its file and has not saved yet, by group, key and language.
 *
 * Kept apart from the text, so that it can be applied to whatever stands in the file when
 * it is saved. In the order in which the keys were first set.
 */
class DesktopEntryChanges
{
public:
    struct Change
    {
        using Group = std::shared_ptr<const std::string>;

        Group sharedGroup; ///< never null
        std::string key;
        std::string locale; ///< empty for the key without a language
        std::optional<std::string> value; ///< as it is to stand in the file; none: the key goes

        Change(Group inGroup, std::string_view ofKey, std::string_view inLocale,
               std::optional<std::string_view> toValue)
            : sharedGroup(std::move(inGroup))
            , key(ofKey)
            , locale(inLocale)
            , value(toValue)
        {
        }
        Change(std::string_view inGroup, std::string_view ofKey, std::string_view inLocale,
               std::optional<std::string_view> toValue)
            : Change(makeGroup(inGroup), ofKey, inLocale, toValue)
        {
        }

        static Group makeGroup(std::string_view name) { return std::make_shared<const std::string>(name); }
        const std::string &group() const { return *sharedGroup; }
    };

    bool isEmpty() const { return m_changes.empty() && m_removedGroups.empty(); }
    const std::vector<Change> &all() const { return m_changes; }

    const Change *find(std::string_view group, std::string_view key, std::string_view locale) const;
    void set(Change change);
    /// The same, made in its place; what is handed over may not lie in these changes.
    void set(std::string_view group, std::string_view key, std::string_view locale, std::string_view value);
    /// Makes room for so many changes at once.
    void reserve(std::size_t count);
    /// Sets all that \a others has; they have no removed groups.
    void add(DesktopEntryChanges others);
    /// Forgets what was done to the key: it is again as it stands in the file.
    void drop(std::string_view group, std::string_view key, std::string_view locale);
    /// The same for all changes of which \a isMeant tells so.
    template <typename Predicate>
    void dropIf(Predicate isMeant)
    {
        const auto gone = std::remove_if(m_changes.begin(), m_changes.end(), isMeant);
        if (gone == m_changes.end())
            return;
        m_changes.erase(gone, m_changes.end());
        reindex();
    }

    /// The groups go, and with them the changes made in them.
    void removeGroups(const std::unordered_set<std::string> &groups);
    /// A group that went comes back as it was then, under what was changed in it since.
    void restoreGroup(const std::string &group);
    bool isRemoved(std::string_view group) const;

private:
    using Slot = std::uint32_t;

    Slot &slotOf(std::string_view group, std::string_view key, std::string_view locale) const;
    void makeSlots(std::size_t count);
    void reindex();

    std::vector<Change> m_changes;
    // A hash table whose slots hold the number of a change, counted from 1, or 0; at most half of them are
    // taken. A record may take over hundreds of keys, and a node for each would take longer than reading
    // them.
    mutable std::vector<Slot> m_slots;
    std::unordered_set<std::string> m_removedGroups;
    std::vector<Change> m_goneWithGroups;
};
