// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SharedTexts.h"

#include "TextsAhead.h"

#include <functional>
#include <sys/stat.h>

namespace {

// What an item takes beside its text: path, list node, hash node.
constexpr std::size_t ItemCost = 256;

} // namespace

SharedTexts &SharedTexts::instance()
{
    // Never destroyed: a record may outlive every static of this library.
    static auto *const texts = new SharedTexts;
    return *texts;
}

std::optional<FileText> SharedTexts::findOrRead(const QByteArray &path, Reader read)
{
    if (auto known = find(path))
        return known;
    auto &ahead = TextsAhead::instance();
    auto file = ahead.isEmpty() ? std::nullopt : ahead.take(path.toStdString());
    if (!file)
        file = read(path);
    if (file && file->settled && isKnown(path))
        insert(path, *file);
    return file;
}

// Notes it, too. That two paths have one place now and then only costs one more reading.
bool SharedTexts::isKnown(const QByteArray &path)
{
    const std::size_t hash = std::hash<std::string_view>()({path.constData(), std::size_t(path.size())}) | 1U;
    return m_seen[hash / 2 % m_seen.size()].exchange(hash, std::memory_order_relaxed) == hash;
}

std::optional<FileText> SharedTexts::find(const QByteArray &path)
{
    std::optional<FileText> known;
    {
        const std::lock_guard<std::mutex> lock(m_mutex);
        const auto found = m_index.constFind(path);
        if (found == m_index.constEnd())
            return std::nullopt;
        m_items.splice(m_items.begin(), m_items, *found);
        known = m_items.front().file;
    }
    struct stat status;
    if (::stat(path.constData(), &status) == 0 && S_ISREG(status.st_mode)
        && FileStamp(status) == known->stamp)
        return known;
    return std::nullopt;
}

void SharedTexts::insert(const QByteArray &path, const FileText &file)
{
    const std::size_t cost = ItemCost + std::size_t(path.size()) + file.text->cost();
    const std::lock_guard<std::mutex> lock(m_mutex);
    const auto known = m_index.constFind(path);
    if (known != m_index.constEnd())
        forget(*known);
    if (cost > Limit / 4)
        return;
    m_items.push_front({path, file, cost});
    m_index.insert(path, m_items.begin());
    m_cost += cost;
    while (m_cost > Limit)
        forget(std::prev(m_items.end()));
}

void SharedTexts::remove(const QByteArray &path)
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    const auto known = m_index.constFind(path);
    if (known != m_index.constEnd())
        forget(*known);
}

std::size_t SharedTexts::cost() const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    return m_cost;
}

void SharedTexts::clear()
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    m_index.clear();
    m_items.clear();
    for (auto &seen : m_seen)
        seen = 0;
    m_cost = 0;
}

void SharedTexts::forget(Items::iterator item)
{
    m_cost -= item->cost;
    m_index.remove(item->path);
    m_items.erase(item);
}
