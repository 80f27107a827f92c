// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RowCache.h"

#include "EntryDisplay.h"

#include <frame/EntryPath.h>

#include <iterator>

RowCache::Display RowCache::Display::of(const VelUIDesktopEntry &entry)
{
    const EntryState::Kind state = EntryState::of(entry);
    return {EntryDisplay::shownName(entry), EntryState::isHidden(state), state};
}

RowCache::RowCache()
{
    m_prefetchEnd.setSingleShot(true);
    connect(&m_prefetchEnd, &QTimer::timeout, this, [this] { m_prefetched.clear(); });
}

RowCache::~RowCache() = default;

std::optional<RowCache::Display> RowCache::display(const QString &path) const
{
    const auto row = m_rows.constFind(path);
    if (row == m_rows.constEnd() || !row->isNamed)
        return std::nullopt;
    return Display{row->name, row->isHidden, row->state};
}

void RowCache::setDisplay(const QString &path, const Display &display)
{
    Row &row = m_rows[path];
    row.name = display.name;
    row.isNamed = true;
    row.isHidden = row.isHidden || display.isHidden;
    row.state = display.state;
}

void RowCache::prefetch(const QString &path, const Display &display)
{
    if (!m_prefetchEnd.isActive())
        m_prefetchEnd.start(0);
    m_prefetched.insert(path, display);
}

std::optional<RowCache::Display> RowCache::takePrefetched(const QString &path)
{
    const auto known = m_prefetched.find(path);
    if (known == m_prefetched.end())
        return std::nullopt;
    const Display display = *known;
    m_prefetched.erase(known);
    return display;
}

std::optional<QIcon> RowCache::icon(const QString &path, const FileIdentity &identity) const
{
    const auto row = m_rows.constFind(path);
    return row != m_rows.constEnd() && row->identity == identity ? row->icon : std::nullopt;
}

void RowCache::setIcon(const QString &path, const FileIdentity &identity, const QIcon &icon)
{
    Row &row = m_rows[path];
    row.identity = identity;
    row.icon = icon;
}

void RowCache::setEditedIcon(const QString &path, const QIcon &icon)
{
    m_editedIcons.insert(path, icon);
}

std::optional<QIcon> RowCache::editedIcon(const QString &path) const
{
    const auto icon = m_editedIcons.constFind(path);
    return icon != m_editedIcons.constEnd() ? std::optional<QIcon>(*icon) : std::nullopt;
}

void RowCache::noteListed(const QString &path, const QIcon &icon)
{
    if (!m_plainFolders.isEmpty())
        m_plainFolders.remove(EntryPath::describedBy(path));
    const auto edited = m_editedIcons.find(path);
    if (edited != m_editedIcons.end())
        *edited = icon;
}

void RowCache::forget(const QString &path)
{
    m_rows.remove(path);
    m_prefetched.remove(path);
    m_editedIcons.remove(path);
    m_plainFolders.remove(EntryPath::describedBy(path));
}

void RowCache::forgetTree(const QString &path)
{
    forget(path);
    const QString below = path + QLatin1Char('/');
    for (auto row = m_rows.lowerBound(below); row != m_rows.end() && row.key().startsWith(below);)
        row = m_rows.erase(row);
    for (auto icon = m_editedIcons.begin(); icon != m_editedIcons.end();)
        icon = icon.key().startsWith(below) ? m_editedIcons.erase(icon) : std::next(icon);
    for (auto folder = m_plainFolders.begin(); folder != m_plainFolders.end();)
        folder = folder->startsWith(below) ? m_plainFolders.erase(folder) : std::next(folder);
}
