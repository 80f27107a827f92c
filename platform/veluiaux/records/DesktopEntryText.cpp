// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopEntryText.h"

#include <cstring>
#include <utility>

namespace {

constexpr std::string_view ByteOrderMark = "\xEF\xBB\xBF";
constexpr std::size_t ManyGroups = 16;
// Rough bytes a key line takes; a guess that saves the index from growing step by step.
constexpr std::size_t UsualLine = 32;

bool isBlank(char c)
{
    return c == ' ' || c == '\t';
}

} // namespace

DesktopEntryText::DesktopEntryText(QByteArray bytes)
    : m_bytes(std::move(bytes))
{
}

void DesktopEntryText::index()
{
    const auto size = std::size_t(m_bytes.size());
    m_keys.reserve(size / UsualLine + 1);
    m_tags.reserve(size / UsualLine + 1);
    m_groups.reserve(4);

    const char *const data = m_bytes.constData();
    std::size_t begin = bytes().substr(0, ByteOrderMark.size()) == ByteOrderMark ? ByteOrderMark.size() : 0;
    while (begin < size) {
        const auto *const feed = static_cast<const char *>(std::memchr(data + begin, '\n', size - begin));
        std::size_t end = feed ? std::size_t(feed - data) : size;
        const std::size_t next = feed ? end + 1 : size;
        if (end > begin && data[end - 1] == '\r')
            --end;
        addLine(std::uint32_t(begin), std::uint32_t(end), std::uint32_t(next));
        begin = next;
    }
    if (!m_groups.empty())
        m_groups.back().endKey = std::uint32_t(m_keys.size());
    indexGroups();
}

void DesktopEntryText::addLine(std::uint32_t begin, std::uint32_t end, std::uint32_t next)
{
    const char *const data = m_bytes.constData();
    std::uint32_t first = begin;
    while (first < end && isBlank(data[first]))
        ++first;
    if (first == end || data[first] == '#')
        return;
    if (data[first] == '[')
        addHeader(begin, first, end, next);
    else if (!m_groups.empty())
        addKey(begin, first, end, next);
}

void DesktopEntryText::addHeader(std::uint32_t begin, std::uint32_t open, std::uint32_t end,
                                 std::uint32_t next)
{
    if (!m_groups.empty())
        m_groups.back().endKey = std::uint32_t(m_keys.size());

    const char *const data = m_bytes.constData();
    std::uint32_t close = end;
    while (close > open && isBlank(data[close - 1]))
        --close;
    const std::uint32_t name = open + 1;
    std::uint32_t length = 0;
    if (data[close - 1] == ']' && close - 1 > name)
        length = close - 1 - name;
    // A bracket inside makes the line unclear: it still ends the group above it.
    if (std::memchr(data + name, ']', length))
        length = 0;
    const auto keys = std::uint32_t(m_keys.size());
    m_groups.push_back({begin, name, length, next, keys, keys});
}

void DesktopEntryText::addKey(std::uint32_t begin, std::uint32_t name, std::uint32_t end, std::uint32_t next)
{
    const char *const data = m_bytes.constData();
    const auto *const equals = static_cast<const char *>(std::memchr(data + name, '=', end - name));
    if (!equals || equals == data + name)
        return;
    const auto equalsAt = std::uint32_t(equals - data);
    std::uint32_t nameEnd = equalsAt;
    while (isBlank(data[nameEnd - 1]))
        --nameEnd;
    std::uint32_t value = equalsAt + 1;
    while (value < end && isBlank(data[value]))
        ++value;

    Key key{begin, name, nameEnd - name, 0, value, end, next};
    if (data[nameEnd - 1] == ']') {
        const auto *const open = static_cast<const char *>(std::memchr(data + name, '[', key.keyLength));
        const auto openAt = open ? std::uint32_t(open - data) : name;
        if (openAt > name && nameEnd - openAt > 2) {
            key.keyLength = openAt - name;
            key.localeLength = nameEnd - openAt - 2;
        }
    }
    m_keys.push_back(key);
    m_tags.push_back(tag(keyName(key), locale(key)));
}

void DesktopEntryText::indexGroups()
{
    if (m_groups.size() < ManyGroups)
        return;
    for (std::size_t i = 0; i < m_groups.size(); ++i) {
        if (m_groups[i].nameLength)
            m_groupByName[groupName(m_groups[i])] = int(i);
    }
}

int DesktopEntryText::group(std::string_view name) const
{
    if (name.empty())
        return NoGroup;
    makeIndex();
    if (!m_groupByName.empty()) {
        const auto found = m_groupByName.find(name);
        return found == m_groupByName.end() ? NoGroup : found->second;
    }
    for (int i = int(m_groups.size()) - 1; i >= 0; --i) {
        if (groupName(m_groups[std::size_t(i)]) == name)
            return i;
    }
    return NoGroup;
}

const DesktopEntryText::Key *DesktopEntryText::key(int group, std::string_view name,
                                                   std::string_view locale) const
{
    if (group == NoGroup || name.empty())
        return nullptr;
    makeIndex();
    const Tag wanted = tag(name, locale);
    const Group &place = m_groups[std::size_t(group)];
    for (std::uint32_t i = place.endKey; i > place.firstKey; --i) {
        if (m_tags[i - 1] != wanted)
            continue;
        const Key &key = m_keys[i - 1];
        if (keyName(key) == name && this->locale(key) == locale)
            return &key;
    }
    return nullptr;
}

std::size_t DesktopEntryText::cost() const
{
    makeIndex();
    return sizeof(*this) + std::size_t(m_bytes.size()) + m_groups.capacity() * sizeof(Group)
        + m_keys.capacity() * sizeof(Key) + m_tags.capacity() * sizeof(std::uint32_t)
        + m_groupByName.size() * 4 * sizeof(void *);
}
