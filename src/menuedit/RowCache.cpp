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
    m_turn.setSingleShot(true);
    connect(&m_turn, &QTimer::timeout, this, [this] {
        m_prefetched.clear();
        m_sharedIcons.clear();
    });
}

RowCache::~RowCache() = default;

// Null where nothing of the folder is known. Rows are asked for folder by folder.
RowCache::Folder *RowCache::folderOf(const QString &path) const
{
    const int end = path.lastIndexOf(QLatin1Char('/')) + 1;
    if (m_last && m_lastFolder.size() == end && path.startsWith(m_lastFolder))
        return m_last;
    const QString folder = path.left(end);
    auto &folders = const_cast<RowCache *>(this)->m_folders;
    const auto known = folders.find(folder);
    if (known == folders.end())
        return nullptr;
    m_lastFolder = folder;
    m_last = &*known;
    return m_last;
}

const RowCache::Row *RowCache::find(const QString &path) const
{
    const Folder *const folder = folderOf(path);
    if (!folder)
        return nullptr;
    const auto row = folder->constFind(path);
    return row != folder->constEnd() ? &*row : nullptr;
}

RowCache::Row &RowCache::make(const QString &path)
{
    if (!folderOf(path))
        m_folders.insert(path.left(path.lastIndexOf(QLatin1Char('/')) + 1), Folder());
    return (*folderOf(path))[path];
}

std::optional<RowCache::Display> RowCache::display(const QString &path) const
{
    const Row *const row = find(path);
    if (!row || !row->isNamed)
        return std::nullopt;
    return Display{row->name, row->isHidden, row->state};
}

void RowCache::setDisplay(const QString &path, const Display &display)
{
    Row &row = make(path);
    row.name = display.name;
    row.isNamed = true;
    row.isHidden = row.isHidden || display.isHidden;
    row.state = display.state;
}

void RowCache::prefetch(const QString &path, const Display &display)
{
    forgetAtTheNextTurn();
    m_prefetched.insert(path, display);
}

void RowCache::forgetAtTheNextTurn()
{
    if (!m_turn.isActive())
        m_turn.start(0);
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
    const Row *const row = find(path);
    if (!row || row->origin != IconOrigin::Known || row->mark != identity.mark())
        return std::nullopt;
    return row->icon;
}

void RowCache::setIcon(const QString &path, const FileIdentity &identity, const QIcon &icon)
{
    Row &row = make(path);
    row.mark = identity.mark();
    row.icon = icon;
    row.origin = IconOrigin::Known;
}

void RowCache::setNewIcon(const QString &path, const QIcon &icon)
{
    Row &row = make(path);
    row.icon = icon;
    row.origin = IconOrigin::New;
}

bool RowCache::hasNewIcon(const QString &path) const
{
    const Row *const row = find(path);
    return row && row->origin == IconOrigin::New;
}

void RowCache::keepNewIcon(const QString &path, const FileIdentity &identity)
{
    setIcon(path, identity, make(path).icon);
}

void RowCache::dropNewIcon(const QString &path)
{
    Row &row = make(path);
    row.icon = QIcon();
    row.origin = IconOrigin::None;
}

bool RowCache::hasIcon(const QString &path) const
{
    const Row *const row = find(path);
    return row && row->origin != IconOrigin::None;
}

std::optional<QIcon> RowCache::sharedIcon(const QString &name) const
{
    const auto icon = m_sharedIcons.constFind(name);
    return icon != m_sharedIcons.constEnd() ? std::optional<QIcon>(*icon) : std::nullopt;
}

void RowCache::shareIcon(const QString &name, const QIcon &icon)
{
    forgetAtTheNextTurn();
    m_sharedIcons.insert(name, icon);
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
    if (Folder *const folder = folderOf(path))
        folder->remove(path);
    m_prefetched.remove(path);
    m_editedIcons.remove(path);
    m_plainFolders.remove(EntryPath::describedBy(path));
}

void RowCache::forgetTree(const QString &path)
{
    forget(path);
    const QString below = path + QLatin1Char('/');
    m_last = nullptr;
    for (auto it = m_folders.lowerBound(below); it != m_folders.end() && it.key().startsWith(below);)
        it = m_folders.erase(it);
    for (auto icon = m_editedIcons.begin(); icon != m_editedIcons.end();)
        icon = icon.key().startsWith(below) ? m_editedIcons.erase(icon) : std::next(icon);
    for (auto folder = m_plainFolders.begin(); folder != m_plainFolders.end();)
        folder = folder->startsWith(below) ? m_plainFolders.erase(folder) : std::next(folder);
}
