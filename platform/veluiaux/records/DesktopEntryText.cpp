// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopEntryText.h"

#include <algorithm>
#include <utility>

namespace {

constexpr std::string_view ByteOrderMark = "\xEF\xBB\xBF";
constexpr std::size_t ManyGroups = 16;
// Rough bytes that a key line and a key with all its languages take; guesses that save the
// index from growing step by step.
constexpr std::size_t UsualLine = 40;
constexpr std::size_t UsualRun = 256;

bool isBlank(char c)
{
    return c == ' ' || c == '\t';
}

std::uint32_t withoutReturn(const char *data, std::uint32_t begin, std::uint32_t end)
{
    return end > begin && data[end - 1] == '\r' ? end - 1 : end;
}

} // namespace

DesktopEntryText::DesktopEntryText(QByteArray bytes)
    : m_bytes(std::move(bytes))
{
}

void DesktopEntryText::index()
{
    const auto size = std::size_t(m_bytes.size());
    m_lines.reserve(size / UsualLine + 8);
    m_runs.reserve(size / UsualRun + 8);
    m_groups.reserve(4);

    const char *const data = m_bytes.constData();
    std::size_t begin = bytes().substr(0, ByteOrderMark.size()) == ByteOrderMark ? ByteOrderMark.size() : 0;
    while (begin < size) {
        const auto *const feed = static_cast<const char *>(std::memchr(data + begin, '\n', size - begin));
        const std::size_t end = feed ? std::size_t(feed - data) : size;
        addLine(std::uint32_t(begin), std::uint32_t(end));
        begin = addVariants(std::min(end + 1, size));
    }
    endGroup();
    indexGroups();
    m_isIndexed.store(true, std::memory_order_release);
}

void DesktopEntryText::addLine(std::uint32_t begin, std::uint32_t end)
{
    const char *const data = m_bytes.constData();
    std::uint32_t first = begin;
    while (first < end && isBlank(data[first]))
        ++first;
    if (first == end || data[first] == '#')
        return;
    Key key;
    if (data[first] == '[')
        addHeader(begin, first, end);
    else if (!m_groups.empty() && parse(begin, end, &key))
        addKey(key);
}

// The short way for most lines of most files: the key of the line above in other languages.
// Returns the begin of the first line that is not so, or not surely so.
std::size_t DesktopEntryText::addVariants(std::size_t begin)
{
    if (m_groups.empty() || m_runs.size() == m_groups.back().firstRun || !m_runs.back().isPlain)
        return begin;
    const char *const data = m_bytes.constData();
    const auto size = std::size_t(m_bytes.size());
    const char *const name = data + m_runs.back().name;
    const std::size_t length = m_runs.back().nameLength;
    while (size - begin > length && data[begin + length] == '['
           && std::memcmp(data + begin, name, length) == 0) {
        // The bytes end with a zero, which ends this, too.
        const char *const locale = data + begin + length + 1;
        const char *end = locale;
        while (*end > ' ' && *end != ']' && *end != '=')
            ++end;
        if (end == locale || end[0] != ']' || end[1] != '=')
            break;
        m_lines.push_back({std::uint32_t(begin), tag({locale, std::size_t(end - locale)})});
        const auto *const feed =
            static_cast<const char *>(std::memchr(end, '\n', std::size_t(data + size - end)));
        begin = feed ? std::size_t(feed + 1 - data) : size;
    }
    m_runs.back().endKey = std::uint32_t(m_lines.size());
    return begin;
}

void DesktopEntryText::addHeader(std::uint32_t begin, std::uint32_t open, std::uint32_t end)
{
    endGroup();
    const char *const data = m_bytes.constData();
    std::uint32_t close = withoutReturn(data, begin, end);
    while (close > open && isBlank(data[close - 1]))
        --close;
    const std::uint32_t name = open + 1;
    std::uint32_t length = 0;
    if (data[close - 1] == ']' && close - 1 > name)
        length = close - 1 - name;
    // A bracket inside makes the line unclear: it still ends the group above it.
    if (std::memchr(data + name, ']', length))
        length = 0;
    const auto keys = std::uint32_t(m_lines.size());
    const auto runs = std::uint32_t(m_runs.size());
    m_groups.push_back(
        {begin, name, length, std::min(end + 1, std::uint32_t(m_bytes.size())), keys, keys, runs, runs});
}

void DesktopEntryText::endGroup()
{
    if (m_groups.empty())
        return;
    m_groups.back().endKey = std::uint32_t(m_lines.size());
    m_groups.back().endRun = std::uint32_t(m_runs.size());
}

// Takes the line apart that begins and ends there, without its line feed; false if it is no key line.
bool DesktopEntryText::parse(std::uint32_t begin, std::uint32_t end, Key *key) const
{
    const char *const data = m_bytes.constData();
    const std::uint32_t valueEnd = withoutReturn(data, begin, end);
    std::uint32_t name = begin;
    while (isBlank(data[name]))
        ++name;
    const auto *const equals = static_cast<const char *>(std::memchr(data + name, '=', valueEnd - name));
    if (!equals || equals == data + name)
        return false;
    const auto equalsAt = std::uint32_t(equals - data);
    std::uint32_t nameEnd = equalsAt;
    while (isBlank(data[nameEnd - 1]))
        --nameEnd;
    std::uint32_t value = equalsAt + 1;
    while (value < valueEnd && isBlank(data[value]))
        ++value;

    *key = {
        begin, name, nameEnd - name, 0, value, valueEnd, std::min(end + 1, std::uint32_t(m_bytes.size()))};
    if (data[nameEnd - 1] == ']') {
        const auto *const open = static_cast<const char *>(std::memchr(data + name, '[', key->keyLength));
        const auto openAt = open ? std::uint32_t(open - data) : name;
        if (openAt > name && nameEnd - openAt > 2) {
            key->keyLength = openAt - name;
            key->localeLength = nameEnd - openAt - 2;
        }
    }
    return true;
}

void DesktopEntryText::addKey(const Key &key)
{
    const auto index = std::uint32_t(m_lines.size());
    m_lines.push_back({key.line, tag(locale(key))});
    const std::string_view name = keyName(key);
    if (m_runs.size() > m_groups.back().firstRun && isOf(m_runs.back(), name))
        m_runs.back().endKey = index + 1;
    else
        m_runs.push_back(
            {key.key, key.keyLength, index, index + 1, !std::memchr(name.data(), '[', name.size())});
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

DesktopEntryText::Key DesktopEntryText::keyAt(std::uint32_t index) const
{
    makeIndex();
    const char *const data = m_bytes.constData();
    const std::uint32_t begin = m_lines[index].begin;
    const auto rest = std::size_t(m_bytes.size()) - begin;
    const auto *const feed = static_cast<const char *>(std::memchr(data + begin, '\n', rest));
    Key key{};
    parse(begin, feed ? std::uint32_t(feed - data) : std::uint32_t(m_bytes.size()), &key);
    return key;
}

std::optional<DesktopEntryText::Key> DesktopEntryText::key(int group, std::string_view name,
                                                           std::string_view locale) const
{
    if (group == NoGroup || name.empty())
        return std::nullopt;
    makeIndex();
    const std::uint32_t wanted = tag(locale);
    const Group &place = m_groups[std::size_t(group)];
    for (std::uint32_t r = place.endRun; r > place.firstRun; --r) {
        const Run &run = m_runs[r - 1];
        if (!isOf(run, name))
            continue;
        for (std::uint32_t i = run.endKey; i > run.firstKey; --i) {
            if (m_lines[i - 1].tag != wanted)
                continue;
            const Key key = keyAt(i - 1);
            if (this->locale(key) == locale)
                return key;
        }
    }
    return std::nullopt;
}

std::size_t DesktopEntryText::cost() const
{
    makeIndex();
    return sizeof(*this) + std::size_t(m_bytes.size()) + m_groups.capacity() * sizeof(Group)
        + m_runs.capacity() * sizeof(Run) + m_lines.capacity() * sizeof(Line)
        + m_groupByName.size() * 4 * sizeof(void *);
}
