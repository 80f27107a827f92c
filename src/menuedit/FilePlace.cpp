// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FilePlace.h"

#include "OnDisk.h"

#include <QFileInfo>

namespace {

QString folderOf(const QString &path)
{
    return QFileInfo(path).path();
}

} // namespace

FilePlace::FilePlace(const QString &path)
    : m_path(path)
    , m_folder(QFileInfo(folderOf(path)).canonicalFilePath())
{
}

Refusal FilePlace::checkFree() const
{
    const QFileInfo folder(folderOf(m_path));
    if (!folder.isDir())
        return Refusal::gone(folder.filePath());
    // A link in its place may lead anywhere.
    if (folder.canonicalFilePath() != m_folder)
        return Refusal::changed(folder.filePath());
    return OnDisk::exists(m_path) ? Refusal::taken(m_path) : Refusal::none();
}
