// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopEntryChanges.h"

#include <algorithm>
#include <iterator>
#include <utility>

std::string DesktopEntryChanges::place(std::string_view group, std::string_view key, std::string_view locale)
{
    // A line feed stands in none of the three.
    std::string place;
    place.reserve(group.size() + key.size() + locale.size() + 2);
    place.append(group).append(1, '\n').append(key).append(1, '\n').append(locale);
    return place;
}

const DesktopEntryChanges::Change *DesktopEntryChanges::find(std::string_view group, std::string_view key,
                                                             std::string_view locale) const
{
    if (m_changes.empty())
        return nullptr;
    const auto found = m_index.find(place(group, key, locale));
    return found == m_index.end() ? nullptr : &m_changes[found->second];
}

void DesktopEntryChanges::set(Change change)
{
    const auto [found, isNew] =
        m_index.emplace(place(change.group, change.key, change.locale), m_changes.size());
    if (isNew)
        m_changes.push_back(std::move(change));
    else
        m_changes[found->second].value = std::move(change.value);
}

void DesktopEntryChanges::drop(std::string_view group, std::string_view key, std::string_view locale)
{
    if (m_changes.empty())
        return;
    const auto found = m_index.find(place(group, key, locale));
    if (found == m_index.end())
        return;
    m_changes.erase(m_changes.begin() + std::ptrdiff_t(found->second));
    reindex();
}

void DesktopEntryChanges::removeGroups(const std::unordered_set<std::string> &groups)
{
    if (groups.empty())
        return;
    m_removedGroups.insert(groups.begin(), groups.end());
    const auto gone =
        std::stable_partition(m_changes.begin(), m_changes.end(),
                              [&groups](const Change &change) { return groups.count(change.group) == 0; });
    std::move(gone, m_changes.end(), std::back_inserter(m_goneWithGroups));
    m_changes.erase(gone, m_changes.end());
    reindex();
}

void DesktopEntryChanges::restoreGroup(const std::string &group)
{
    if (m_removedGroups.erase(group) == 0)
        return;
    const auto back = std::stable_partition(m_goneWithGroups.begin(), m_goneWithGroups.end(),
                                            [&group](const Change &change) { return change.group != group; });
    for (auto change = back; change != m_goneWithGroups.end(); ++change) {
        if (!find(change->group, change->key, change->locale))
            set(std::move(*change));
    }
    m_goneWithGroups.erase(back, m_goneWithGroups.end());
}

bool DesktopEntryChanges::isRemoved(std::string_view group) const
{
    return !m_removedGroups.empty() && m_removedGroups.count(std::string(group)) != 0;
}

void DesktopEntryChanges::reindex()
{
    m_index.clear();
    for (std::size_t i = 0; i < m_changes.size(); ++i)
        m_index.emplace(place(m_changes[i].group, m_changes[i].key, m_changes[i].locale), i);
}
