// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "GroupValues.h"

#include <string>
#include <string_view>
#include <unordered_set>

/**
 * Which keys an entry takes over from another one: those that it lacks itself.
 *
 * Keys come with their languages in a row, so what holds for all of a key is worked out once. For use at
 * once, not for keeping: both entries have to stay as they are.
 */
class InheritedKeys
{
public:
    /// The text and the changes of an entry.
    struct Entry
    {
        const DesktopEntryText &text;
        const DesktopEntryChanges &changes;

        GroupValues group(std::string_view name) const { return {text, changes, name}; }
    };

    InheritedKeys(const Entry &own, const Entry &other);

    /// Whether the key, which stands in the other entry, is taken over; the views have to stay valid.
    bool has(std::string_view group, std::string_view key, std::string_view locale);

private:
    void turnTo(std::string_view group, std::string_view key);

    const Entry m_own;
    const Entry m_other;
    const bool m_isOwnEmpty;
    std::unordered_set<std::string> m_actionGroups; // of theirs, that come along with their list
    std::string_view m_group;
    std::string_view m_key;
    bool m_hasKey = false;
    bool m_hasLanguages = false; // which are worth nothing without the key itself
};
