// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopEntryIndex.h"

#include <QVarLengthArray>

#include <algorithm>
#include <array>
#include <cstring>
#include <utility>

namespace {

using Group = DesktopEntryIndex::Group;
using Run = DesktopEntryIndex::Run;
using Key = DesktopEntryIndex::Key;

constexpr std::uint32_t NoLine = DesktopEntryIndex::NoLine;
constexpr std::string_view ByteOrderMark = "\xEF\xBB\xBF";
constexpr std::size_t ManyGroups = 16;

bool isBlank(char c)
{
    return c == ' ' || c == '\t';
}

std::uint32_t withoutReturn(const char *data, std::uint32_t begin, std::uint32_t end)
{
    return end > begin && data[end - 1] == '\r' ? end - 1 : end;
}

// The bytes of usual keys and languages: neither blanks nor anything that ends them. A line with
// others goes the long way.
constexpr std::array<bool, 256> usualBytes()
{
    std::array<bool, 256> usual{};
    for (std::size_t c = '!'; c <= '~'; ++c)
        usual[c] = c != '[' && c != ']' && c != '=';
    return usual;
}

const char *skipUsual(const char *from)
{
    static constexpr std::array<bool, 256> Usual = usualBytes();
    while (Usual[static_cast<unsigned char>(*from)])
        ++from;
    return from;
}

// Walks over all lines. What it finds stands on the stack at first, so that the index itself
// takes no more memory than it needs: it is kept for long.
class Indexer
{
public:
    Indexer(std::string_view bytes, DesktopEntryIndex::Tag language)
        : m_bytes(bytes)
        , m_language(language)
        , m_data(bytes.data())
        , m_size(std::uint32_t(bytes.size()))
    {
    }

    void run();

    std::vector<Group> groups() const { return {m_groups.begin(), m_groups.end()}; }
    std::vector<Run> runs() const { return {m_runs.begin(), m_runs.end()}; }

private:
    std::uint32_t lineEnd(const char *from) const
    {
        const auto *const feed =
            static_cast<const char *>(std::memchr(from, '\n', std::size_t(m_data + m_size - from)));
        return feed ? std::uint32_t(feed + 1 - m_data) : m_size;
    }
    bool isInRun() const { return !m_groups.empty() && m_runs.size() > int(m_groups.back().firstRun); }
    std::uint32_t addLine(std::uint32_t begin);
    std::uint32_t addVariants(std::uint32_t begin);
    std::uint32_t addHeader(std::uint32_t begin, std::uint32_t open);
    void addKey(const Key &key);
    void addVariant(Run &run, std::uint32_t begin, std::uint32_t end, const char *locale)
    {
        if (DesktopEntryIndex::tag(locale) != m_language)
            return;
        run.localBegin = std::min(run.localBegin, begin);
        run.localEnd = end;
    }
    void endGroup();

    const std::string_view m_bytes;
    const DesktopEntryIndex::Tag m_language;
    const char *const m_data;
    const std::uint32_t m_size;
    QVarLengthArray<Group, 16> m_groups;
    QVarLengthArray<Run, 64> m_runs;
    bool m_isPlainName = false; // no bracket in the name of the last run
};

void Indexer::run()
{
    std::uint32_t begin =
        m_bytes.substr(0, ByteOrderMark.size()) == ByteOrderMark ? std::uint32_t(ByteOrderMark.size()) : 0;
    while (begin < m_size)
        begin = addVariants(addLine(begin));
    endGroup();
}

// Returns the begin of the next line, and so do the others.
std::uint32_t Indexer::addLine(std::uint32_t begin)
{
    std::uint32_t first = begin;
    while (isBlank(m_data[first]))
        ++first;
    if (m_data[first] == '[')
        return addHeader(begin, first);
    if (m_data[first] == '#' || m_groups.empty())
        return lineEnd(m_data + first);

    const char *const nameEnd = skipUsual(m_data + first);
    Key key;
    if (*nameEnd == '=' && nameEnd > m_data + first)
        key = {begin, first, std::uint32_t(nameEnd - m_data) - first, 0, 0, 0, lineEnd(nameEnd)};
    else if (!DesktopEntryIndex::parse(m_bytes, begin, &key))
        return key.lineEnd;
    addKey(key);
    return key.lineEnd;
}

// The short way for most lines of most files: the key of the line above in other languages.
// Stops at the first line that is not so, or not surely so.
std::uint32_t Indexer::addVariants(std::uint32_t begin)
{
    if (!m_isPlainName || !isInRun())
        return begin;
    Run &run = m_runs.back();
    const char *const name = m_data + run.name;
    const std::size_t length = run.nameLength;
    while (m_size - begin > length && m_data[begin + length] == '['
           && std::memcmp(m_data + begin, name, length) == 0) {
        // The bytes end with a zero, which ends this, too.
        const char *const locale = m_data + begin + length + 1;
        const char *const end = skipUsual(locale);
        if (end == locale || end[0] != ']' || end[1] != '=')
            break;
        const std::uint32_t next = lineEnd(end);
        addVariant(run, begin, next, locale);
        begin = run.end = next;
    }
    return begin;
}

std::uint32_t Indexer::addHeader(std::uint32_t begin, std::uint32_t open)
{
    endGroup();
    const std::uint32_t next = lineEnd(m_data + open);
    const std::uint32_t end = m_data[next - 1] == '\n' ? next - 1 : next;
    std::uint32_t close = withoutReturn(m_data, begin, end);
    while (close > open && isBlank(m_data[close - 1]))
        --close;
    const std::uint32_t name = open + 1;
    std::uint32_t length = 0;
    if (m_data[close - 1] == ']' && close - 1 > name)
        length = close - 1 - name;
    // A bracket inside makes the line unclear: it still ends the group above it.
    if (std::memchr(m_data + name, ']', length))
        length = 0;
    const auto runs = std::uint32_t(m_runs.size());
    m_groups.append({begin, name, length, next, runs, runs});
    return next;
}

void Indexer::addKey(const Key &key)
{
    const char *const name = m_data + key.key;
    if (!isInRun() || m_runs.back().nameLength != key.keyLength
        || std::memcmp(m_data + m_runs.back().name, name, key.keyLength) != 0) {
        m_isPlainName = !std::memchr(name, '[', key.keyLength);
        m_runs.append({key.line, 0, NoLine, NoLine, 0, key.key, key.keyLength});
    }
    Run &run = m_runs.back();
    run.end = key.lineEnd;
    if (key.localeLength)
        addVariant(run, key.line, key.lineEnd, name + key.keyLength + 1);
    else
        run.plain = key.line;
}

void Indexer::endGroup()
{
    if (!m_groups.empty())
        m_groups.back().endRun = std::uint32_t(m_runs.size());
}

} // namespace

DesktopEntryIndex::DesktopEntryIndex(std::string_view bytes, std::string_view language)
    : m_bytes(bytes)
    , m_language(tag(language))
{
    Indexer indexer(bytes, m_language);
    indexer.run();
    m_groups = indexer.groups();
    m_runs = indexer.runs();
    if (m_groups.size() >= ManyGroups)
        nameGroups();
}

DesktopEntryIndex::DesktopEntryIndex(std::string_view bytes, Tag language, Places places)
    : m_bytes(bytes)
    , m_language(language)
    , m_groups(std::move(places.groups))
    , m_runs(std::move(places.runs))
{
    if (m_groups.size() >= ManyGroups)
        nameGroups();
}

void DesktopEntryIndex::nameGroups()
{
    m_groupByName = std::make_unique<std::unordered_map<std::string_view, int>>();
    for (std::size_t i = 0; i < m_groups.size(); ++i) {
        if (m_groups[i].nameLength)
            (*m_groupByName)[groupName(m_groups[i])] = int(i);
    }
}

int DesktopEntryIndex::group(std::string_view name) const
{
    if (name.empty())
        return NoGroup;
    if (m_groupByName) {
        const auto found = m_groupByName->find(name);
        return found == m_groupByName->end() ? NoGroup : found->second;
    }
    for (int i = int(m_groups.size()) - 1; i >= 0; --i) {
        if (groupName(m_groups[std::size_t(i)]) == name)
            return i;
    }
    return NoGroup;
}

bool DesktopEntryIndex::parse(std::string_view bytes, std::uint32_t begin, Key *key)
{
    const char *const data = bytes.data();
    const auto *const feed = static_cast<const char *>(std::memchr(data + begin, '\n', bytes.size() - begin));
    const std::uint32_t end = feed ? std::uint32_t(feed - data) : std::uint32_t(bytes.size());
    key->lineEnd = feed ? end + 1 : end;

    const std::uint32_t valueEnd = withoutReturn(data, begin, end);
    std::uint32_t name = begin;
    while (isBlank(data[name]))
        ++name;
    if (name >= valueEnd || data[name] == '#')
        return false;
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

    *key = {begin, name, nameEnd - name, 0, value, valueEnd, key->lineEnd};
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

std::size_t DesktopEntryIndex::cost() const
{
    return m_groups.capacity() * sizeof(Group) + m_runs.capacity() * sizeof(Run)
        + (m_groupByName ? m_groupByName->size() * 4 * sizeof(void *) : 0);
}
