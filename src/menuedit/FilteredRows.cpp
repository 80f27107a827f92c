// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FilteredRows.h"

namespace {

// Empty for what lies at the root.
QString folderOf(const QString &path)
{
    return path.left(path.lastIndexOf(QLatin1Char('/')));
}

} // namespace

void FilteredRows::add(const QString &menuDirectory, const QString &path, bool isFolder)
{
    m_matches.insert(path);
    if (isFolder)
        m_folders.insert(path);
    for (QString folder = folderOf(path); folder.size() > menuDirectory.size(); folder = folderOf(folder)) {
        if (m_toOpen.contains(folder))
            return;
        m_toOpen.insert(folder);
    }
}

void FilteredRows::unite(const FilteredRows &other)
{
    m_matches.unite(other.m_matches);
    m_toOpen.unite(other.m_toOpen);
    m_folders.unite(other.m_folders);
}

bool FilteredRows::contains(const QString &path) const
{
    if (m_matches.contains(path) || m_toOpen.contains(path))
        return true;
    if (m_folders.isEmpty())
        return false;
    for (QString folder = folderOf(path); !folder.isEmpty(); folder = folderOf(folder)) {
        if (m_folders.contains(folder))
            return true;
    }
    return false;
}

bool FilteredRows::operator==(const FilteredRows &other) const
{
    return m_matches == other.m_matches && m_toOpen == other.m_toOpen && m_folders == other.m_folders;
}
