// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopEntryChanges.h"

#include <cstring>
#include <iterator>
#include <utility>

namespace {

constexpr std::size_t LeastSlots = 16;

// Eight bytes at a time and in place: three calls for each key took as long as reading it.
std::uint64_t hashOn(std::uint64_t hash, std::string_view text)
{
    const auto mix = [&hash](std::uint64_t word) {
        hash = (hash ^ word) * 0x9E3779B97F4A7C15U;
        hash ^= hash >> 32;
    };
    const char *at = text.data();
    std::size_t left = text.size();
    for (std::uint64_t word = 0; left >= sizeof word; at += sizeof word, left -= sizeof word) {
        std::memcpy(&word, at, sizeof word);
        mix(word);
    }
    std::uint64_t rest = text.size();
    for (; left > 0; --left)
        rest = rest << 8 | static_cast<unsigned char>(*at++);
    mix(rest);
    return hash;
}

std::size_t hashOf(std::string_view group, std::string_view key, std::string_view locale)
{
    return std::size_t(hashOn(hashOn(hashOn(0, group), key), locale));
}

} // namespace

const DesktopEntryChanges::Change *DesktopEntryChanges::find(std::string_view group, std::string_view key,
                                                             std::string_view locale) const
{
    if (m_changes.empty())
        return nullptr;
    const Slot slot = slotOf(group, key, locale);
    return slot ? &m_changes[slot - 1] : nullptr;
}

void DesktopEntryChanges::set(Change change)
{
    if (m_slots.size() < 2 * (m_changes.size() + 1))
        makeSlots(m_changes.size() + 1);
    Slot &slot = slotOf(change.group(), change.key, change.locale);
    if (slot) {
        m_changes[slot - 1].value = std::move(change.value);
        return;
    }
    m_changes.push_back(std::move(change));
    slot = Slot(m_changes.size());
}

void DesktopEntryChanges::set(std::string_view group, std::string_view key, std::string_view locale,
                              std::string_view value)
{
    if (m_slots.size() < 2 * (m_changes.size() + 1))
        makeSlots(m_changes.size() + 1);
    Slot &slot = slotOf(group, key, locale);
    if (slot) {
        m_changes[slot - 1].value = value;
        return;
    }
    // Keys come group by group, so one name serves many.
    const bool isSameGroup = !m_changes.empty() && m_changes.back().group() == group;
    m_changes.emplace_back(isSameGroup ? m_changes.back().sharedGroup : Change::makeGroup(group), key, locale,
                           value);
    slot = Slot(m_changes.size());
}

void DesktopEntryChanges::reserve(std::size_t count)
{
    m_changes.reserve(count);
    makeSlots(count);
}

void DesktopEntryChanges::add(DesktopEntryChanges others)
{
    if (isEmpty()) {
        *this = std::move(others);
        return;
    }
    for (Change &change : others.m_changes)
        set(std::move(change));
}

void DesktopEntryChanges::drop(std::string_view group, std::string_view key, std::string_view locale)
{
    if (!find(group, key, locale))
        return;
    m_changes.erase(m_changes.begin() + (slotOf(group, key, locale) - 1));
    reindex();
}

void DesktopEntryChanges::removeGroups(const std::unordered_set<std::string> &groups)
{
    if (groups.empty())
        return;
    m_removedGroups.insert(groups.begin(), groups.end());
    const auto gone =
        std::stable_partition(m_changes.begin(), m_changes.end(),
                              [&groups](const Change &change) { return groups.count(change.group()) == 0; });
    std::move(gone, m_changes.end(), std::back_inserter(m_goneWithGroups));
    m_changes.erase(gone, m_changes.end());
    reindex();
}

void DesktopEntryChanges::restoreGroup(const std::string &group)
{
    if (m_removedGroups.erase(group) == 0)
        return;
    const auto back =
        std::stable_partition(m_goneWithGroups.begin(), m_goneWithGroups.end(),
                              [&group](const Change &change) { return change.group() != group; });
    for (auto change = back; change != m_goneWithGroups.end(); ++change) {
        if (!find(change->group(), change->key, change->locale))
            set(std::move(*change));
    }
    m_goneWithGroups.erase(back, m_goneWithGroups.end());
}

bool DesktopEntryChanges::isRemoved(std::string_view group) const
{
    return !m_removedGroups.empty() && m_removedGroups.count(std::string(group)) != 0;
}

// The slot that has the change, or the empty one that is to have it. There are slots, and empty ones.
DesktopEntryChanges::Slot &DesktopEntryChanges::slotOf(std::string_view group, std::string_view key,
                                                       std::string_view locale) const
{
    const std::size_t mask = m_slots.size() - 1; // their number is a power of two
    for (std::size_t i = hashOf(group, key, locale) & mask;; i = (i + 1) & mask) {
        Slot &slot = m_slots[i];
        if (!slot)
            return slot;
        const Change &change = m_changes[slot - 1];
        if (change.locale == locale && change.key == key && change.group() == group)
            return slot;
    }
}

void DesktopEntryChanges::makeSlots(std::size_t count)
{
    std::size_t size = std::max(LeastSlots, m_slots.size());
    while (size < 2 * count)
        size *= 2;
    if (size == m_slots.size())
        return;
    m_slots.resize(size);
    reindex();
}

void DesktopEntryChanges::reindex()
{
    std::fill(m_slots.begin(), m_slots.end(), 0);
    for (std::size_t i = 0; i < m_changes.size(); ++i) {
        const Change &change = m_changes[i];
        slotOf(change.group(), change.key, change.locale) = Slot(i + 1);
    }
}
