// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopEntryText.h"

#include "MessageLocale.h"

#include <utility>

DesktopEntryText::DesktopEntryText(QByteArray bytes)
    : m_bytes(std::move(bytes))
{
}

DesktopEntryText::DesktopEntryText(QByteArray bytes, DesktopEntryIndex::Tag language,
                                   DesktopEntryIndex::Places places)
    : m_bytes(std::move(bytes))
    , m_isIndexed(true)
    , m_index(this->bytes(), language, std::move(places))
{
}

void DesktopEntryText::makeIndexNow() const
{
    makeIndex(MessageLocale::current().language());
}

void DesktopEntryText::makeIndex(std::string_view language) const
{
    const std::lock_guard<std::mutex> lock(m_indexing);
    if (m_isIndexed.load(std::memory_order_relaxed))
        return;
    m_index = DesktopEntryIndex(bytes(), language);
    m_isIndexed.store(true, std::memory_order_release);
}

std::uint32_t DesktopEntryText::keysEnd(const Group &group) const
{
    return group.endRun > group.firstRun ? index().runs()[group.endRun - 1].end : group.lineEnd;
}

std::optional<DesktopEntryText::Key> DesktopEntryText::key(int group, std::string_view name,
                                                           std::string_view locale) const
{
    if (group == NoGroup || name.empty())
        return std::nullopt;
    Key key;
    const Group &place = groups()[std::size_t(group)];
    for (std::uint32_t i = place.endRun; i > place.firstRun; --i) {
        const Run &run = index().runs()[i - 1];
        if (!isOf(run, name))
            continue;
        if (locale.empty()) {
            if (run.plain != DesktopEntryIndex::NoLine && DesktopEntryIndex::parse(bytes(), run.plain, &key))
                return key;
            continue;
        }
        std::optional<Key> last;
        walk(linesOf(run, locale), [&](const Key &variant) {
            if (this->locale(variant) == locale)
                last = variant;
        });
        if (last)
            return last;
    }
    return std::nullopt;
}

// Where in a run all lines of that language stand, and maybe others.
DesktopEntryText::Range DesktopEntryText::linesOf(const Run &run, std::string_view language) const
{
    const auto tag = DesktopEntryIndex::tag(language);
    if (!tag || tag != index().language())
        return {run.begin, run.end};
    if (run.localBegin == DesktopEntryIndex::NoLine)
        return {run.end, run.end};
    return {run.localBegin, run.localEnd};
}

// The next key line, maybe of the line that begins there.
bool DesktopEntryText::findKey(Range *rest, Key *key) const
{
    while (rest->begin < rest->end) {
        const bool found = DesktopEntryIndex::parse(bytes(), rest->begin, key);
        rest->begin = key->lineEnd;
        if (found)
            return true;
    }
    return false;
}
