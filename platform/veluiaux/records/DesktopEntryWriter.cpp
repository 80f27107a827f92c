// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopEntryWriter.h"

#include "DesktopEntryNames.h"
#include "LineScan.h"

#include <algorithm>
#include <map>
#include <optional>
#include <string_view>
#include <unordered_set>
#include <utility>

namespace {

using Text = DesktopEntryText;
using Change = DesktopEntryChanges::Change;

// Where several pieces go in at one place, they stand in this order.
enum class Rank { Variant, Key, Group };

// Bytes taken out at a place of the old text, and what comes in there.
struct Splice
{
    std::size_t at;
    std::size_t removed;
    Rank rank;
    bool isLine; // whole new lines, as against a new value inside a line
    std::string inserted;
};

// The new keys of one group, the languages of a key together.
struct NewKeys
{
    std::vector<std::pair<std::string, std::vector<const Change *>>> blocks;
    std::unordered_map<std::string, std::size_t> blockOf;

    void add(const Change &change)
    {
        const auto [found, isNew] = blockOf.emplace(change.key, blocks.size());
        if (isNew)
            blocks.push_back({change.key, {}});
        auto &block = blocks[found->second].second;
        // Whatever was set first, the translations come behind what they translate.
        block.insert(change.locale.empty() ? block.begin() : block.end(), &change);
    }
};

std::string keyLine(const Change &change, const std::string &lineEnd)
{
    std::string line = change.key;
    if (!change.locale.empty())
        line.append(1, '[').append(change.locale).append(1, ']');
    return line.append(1, '=').append(*change.value).append(lineEnd);
}

std::string keyLines(const NewKeys &keys, const std::string &lineEnd)
{
    std::string lines;
    for (const auto &block : keys.blocks) {
        for (const Change *change : block.second)
            lines += keyLine(*change, lineEnd);
    }
    return lines;
}

class Writer
{
public:
    Writer(const Text &text, const DesktopEntryChanges &changes)
        : m_text(text)
        , m_changes(changes)
        , m_lines(text.bytes())
    {
    }

    QByteArray run();

private:
    bool survives(const Text::Group &group) const { return !m_changes.isRemoved(m_text.groupName(group)); }
    std::size_t groupEnd(std::size_t index) const;

    void removeGroups();
    NewKeys &newGroup(const std::string &name);
    void place(const Change &change);
    void removeKeys();
    void insertVariant(int group, const Change &change);
    void insertKey(int group, const Change &change);
    void insertNewKeys();
    void insertNewGroups();
    std::size_t newGroupPlace(const std::string &name, bool *beforeOthers) const;
    QByteArray join();

    const Text &m_text;
    const DesktopEntryChanges &m_changes;
    LineScan m_lines;
    std::vector<Splice> m_splices;
    std::map<int, NewKeys> m_newKeys; // by group of the text
    // By group and key.
    std::map<std::pair<std::string_view, std::string_view>, std::unordered_set<std::string_view>>
        m_goneLocales;
    std::vector<std::pair<std::string, NewKeys>> m_newGroups;
    std::unordered_map<std::string, std::size_t> m_newGroupOf;
};

QByteArray Writer::run()
{
    removeGroups();
    // A new file starts with the main group, also where it has no key.
    if (m_text.groups().empty())
        newGroup(std::string(DesktopEntryNames::MainGroup));
    for (const Change &change : m_changes.all())
        place(change);
    removeKeys();
    insertNewKeys();
    insertNewGroups();
    return join();
}

// The end of what belongs to a group: the next header with the comments right above it is not its own.
std::size_t Writer::groupEnd(std::size_t index) const
{
    const auto &groups = m_text.groups();
    if (index + 1 == groups.size())
        return m_text.bytes().size();
    return m_lines.commentsAbove(groups[index + 1].line);
}

void Writer::removeGroups()
{
    const auto &groups = m_text.groups();
    for (std::size_t i = 0; i < groups.size(); ++i) {
        if (!survives(groups[i]))
            m_splices.push_back({groups[i].line, groupEnd(i) - groups[i].line, Rank::Group, false, {}});
    }
}

NewKeys &Writer::newGroup(const std::string &name)
{
    const auto [found, isNew] = m_newGroupOf.emplace(name, m_newGroups.size());
    if (isNew)
        m_newGroups.push_back({name, {}});
    return m_newGroups[found->second].second;
}

void Writer::place(const Change &change)
{
    const int group = m_changes.isRemoved(change.group()) ? Text::NoGroup : m_text.group(change.group());
    if (!change.value) {
        m_goneLocales[{change.group(), change.key}].insert(change.locale);
        return;
    }
    if (group == Text::NoGroup) {
        newGroup(change.group()).add(change);
        return;
    }
    if (const auto key = m_text.key(group, change.key, change.locale))
        m_splices.push_back({key->value, key->valueEnd - key->value, Rank::Variant, false, *change.value});
    else if (!change.locale.empty())
        insertVariant(group, change);
    else
        insertKey(group, change);
}

// A key goes from all groups of that name, with all languages that go in one walk over its lines.
void Writer::removeKeys()
{
    const auto &groups = m_text.groups();
    for (const auto &[place, locales] : m_goneLocales) {
        for (std::size_t i = 0; i < groups.size(); ++i) {
            if (m_text.groupName(groups[i]) != place.first || !survives(groups[i]))
                continue;
            m_text.forEachLine(int(i), place.second, [this, &gone = locales](const Text::Key &key) {
                if (gone.count(m_text.locale(key)) != 0)
                    m_splices.push_back({key.line, key.lineEnd - key.line, Rank::Variant, false, {}});
            });
        }
    }
}

void Writer::insertVariant(int group, const Change &change)
{
    std::size_t after = 0;
    m_text.forEachLine(group, change.key,
                       [&after](const Text::Key &key) { after = std::max(after, std::size_t(key.lineEnd)); });
    if (after)
        m_splices.push_back({after, 0, Rank::Variant, true, keyLine(change, m_lines.lineEndAt(after))});
    else
        m_newKeys[group].add(change);
}

// Before its translations, if it has any.
void Writer::insertKey(int group, const Change &change)
{
    std::optional<std::size_t> before;
    m_text.forEachLine(group, change.key, [&before](const Text::Key &key) {
        before = std::min(before.value_or(key.line), std::size_t(key.line));
    });
    if (before)
        m_splices.push_back({*before, 0, Rank::Variant, true, keyLine(change, m_lines.lineEndAt(*before))});
    else
        m_newKeys[group].add(change);
}

void Writer::insertNewKeys()
{
    for (const auto &[index, keys] : m_newKeys) {
        const Text::Group &group = m_text.groups()[std::size_t(index)];
        const std::size_t after = m_text.keysEnd(group);
        m_splices.push_back({after, 0, Rank::Key, true, keyLines(keys, m_lines.lineEndAt(after))});
    }
}

// After the last action group for one more of them, after the main group for the first;
// the main group before all others; anything else at the end.
std::size_t Writer::newGroupPlace(const std::string &name, bool *beforeOthers) const
{
    const auto &groups = m_text.groups();
    const bool isMain = name == DesktopEntryNames::MainGroup;
    *beforeOthers = false;
    if (isMain && !groups.empty()) {
        *beforeOthers = true;
        return m_lines.commentsAbove(groups.front().line);
    }
    if (DesktopEntryNames::isActionGroup(name)) {
        for (std::size_t i = groups.size(); i > 0; --i) {
            if (DesktopEntryNames::isActionGroup(m_text.groupName(groups[i - 1])) && survives(groups[i - 1]))
                return m_lines.contentEnd(groupEnd(i - 1));
        }
        const int main = m_text.group(DesktopEntryNames::MainGroup);
        if (main != Text::NoGroup)
            return m_lines.contentEnd(groupEnd(std::size_t(main)));
    }
    return m_lines.contentEnd(m_text.bytes().size());
}

void Writer::insertNewGroups()
{
    // The main group comes first even when an action was set before it.
    std::stable_partition(m_newGroups.begin(), m_newGroups.end(),
                          [](const auto &group) { return group.first == DesktopEntryNames::MainGroup; });
    // The place is the same for all groups of a kind; finding it walks over all groups.
    std::map<int, std::pair<std::size_t, bool>> places;
    for (const auto &[name, keys] : m_newGroups) {
        const int kind = name == DesktopEntryNames::MainGroup ? 0
            : DesktopEntryNames::isActionGroup(name)          ? 1
                                                              : 2;
        if (places.find(kind) == places.end()) {
            bool before = false;
            const std::size_t at = newGroupPlace(name, &before);
            places[kind] = {at, before};
        }
        const auto [at, before] = places[kind];
        const std::string lineEnd = m_lines.lineEndAt(at);
        std::string lines = '[' + name + ']';
        lines += lineEnd;
        lines += keyLines(keys, lineEnd);
        if (before)
            lines += lineEnd;
        else if (at > m_lines.begin() || kind != 0)
            lines.insert(0, lineEnd);
        m_splices.push_back({at, 0, Rank::Group, true, std::move(lines)});
    }
}

QByteArray Writer::join()
{
    std::stable_sort(m_splices.begin(), m_splices.end(), [](const Splice &a, const Splice &b) {
        return a.at != b.at ? a.at < b.at : a.rank < b.rank;
    });
    const std::string_view old = m_text.bytes();
    const auto begin = int(m_lines.begin());
    QByteArray result;
    result.reserve(int(old.size()) + 256);
    const auto append = [&result](std::string_view bytes) { result.append(bytes.data(), int(bytes.size())); };
    std::size_t done = 0;
    for (const Splice &splice : m_splices) {
        if (splice.at > done) {
            append(old.substr(done, splice.at - done));
            done = splice.at;
        }
        // The last line may lack its end, or half of it.
        if (splice.isLine && result.size() > begin && !result.endsWith('\n'))
            append(result.endsWith('\r') ? "\n" : m_lines.lineEndAt(splice.at));
        append(splice.inserted);
        done = std::max(done, splice.at + splice.removed);
    }
    append(old.substr(done));
    return result;
}

} // namespace

QByteArray DesktopEntryWriter::apply(const DesktopEntryText &text, const DesktopEntryChanges &changes)
{
    return Writer(text, changes).run();
}
