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
    while (!m_files || !m_files->hasNext()) {
        if (!enterNextFolder())
            return std::nullopt;
    }
    Item item;
    item.path = m_files->next();
    const QFileInfo info = m_files->fileInfo();
    item.isFolder = info.isDir();
    if (item.isFolder)
        note(info);
    return item;
}

// One folder is listed to its end before the next is opened, however deep they lie.
bool MenuWalk::enterNextFolder()
{
    m_files.reset();
    if (m_current + 1 >= m_folders.size())
        return false;
    ++m_current;
    m_files =
        std::make_unique<QDirIterator>(m_folders.at(m_current).path, QDir::AllEntries | QDir::NoDotAndDotDot);
    return true;
}

void MenuWalk::note(const QFileInfo &folder)
{
    const Folder &here = m_folders.at(m_current);
    const bool isLink = folder.isSymLink();
    const QString canonical =
        isLink ? folder.canonicalFilePath() : asPrefix(here.canonical) + folder.fileName();
    const bool isOutside = here.isOutside || (isLink && !isWithin(canonical));
    if (canonical.isEmpty() || isGoneThrough(canonical) || (isOutside && !m_isOpened(folder.filePath())))
        return;
    if (m_folders.size() >= m_mostFolders) {
        m_isWhole = false;
        return;
    }
    m_folders.append({folder.filePath(), canonical, m_current, isOutside});
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
