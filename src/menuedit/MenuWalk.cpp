// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuWalk.h"

#include <QDir>
#include <QFileInfo>

#include <utility>

namespace {

// With a "/" at its end, that of the root stands already.
QString asPrefix(const QString &folder)
{
    return folder.endsWith(QLatin1Char('/')) ? folder : folder + QLatin1Char('/');
}

} // namespace

MenuWalk::MenuWalk(const QString &menuDirectory, IsOpened isOpened, int mostFolders)
    : m_isOpened(std::move(isOpened))
    , m_mostFolders(mostFolders)
{
    const QFileInfo info(menuDirectory);
    if (info.isDir())
        m_folders.append({QDir::cleanPath(info.absoluteFilePath()), info.canonicalFilePath(), -1, false});
}

MenuWalk::~MenuWalk() = default;

std::optional<MenuWalk::Item> MenuWalk::next()
{
    std::optional<FolderListing::Item> found = m_files ? m_files->next() : std::nullopt;
    while (!found) {
        if (!enterNextFolder())
            return std::nullopt;
        found = m_files->next();
    }
    if (found->isFolder)
        note(*found);
    return Item{found->path, found->isFolder};
}

// One folder is listed to its end before the next is opened, however deep they lie.
bool MenuWalk::enterNextFolder()
{
    m_files.reset();
    if (m_current + 1 >= m_folders.size())
        return false;
    ++m_current;
    m_files.emplace(m_folders.at(m_current).path);
    return true;
}

void MenuWalk::note(const FolderListing::Item &folder)
{
    const Folder &here = m_folders.at(m_current);
    const QString canonical =
        folder.isLink ? QFileInfo(folder.path).canonicalFilePath() : asPrefix(here.canonical) + folder.name;
    const bool isOutside = here.isOutside || (folder.isLink && !isWithin(canonical));
    if (canonical.isEmpty() || isGoneThrough(canonical) || (isOutside && !m_isOpened(folder.path)))
        return;
    if (m_folders.size() >= m_mostFolders) {
        m_isWhole = false;
        return;
    }
    m_folders.append({folder.path, canonical, m_current, isOutside});
}

bool MenuWalk::isWithin(const QString &canonical) const
{
    const QString &root = m_folders.constFirst().canonical;
    return canonical == root || canonical.startsWith(asPrefix(root));
}

// On the way to where the walk is now.
bool MenuWalk::isGoneThrough(const QString &canonical) const
{
    for (int i = m_current; i >= 0; i = m_folders.at(i).above) {
        if (m_folders.at(i).canonical == canonical)
            return true;
    }
    return false;
}
