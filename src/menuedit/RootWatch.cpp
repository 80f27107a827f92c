// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RootWatch.h"

#include <QFile>
#include <QFileInfo>

#include <sys/stat.h>

namespace {

// The nearest folder above \a path that is there.
QString folderAbove(const QString &path)
{
    QString folder = QFileInfo(path).path();
    while (!QFileInfo(folder).isDir() && folder != QFileInfo(folder).path())
        folder = QFileInfo(folder).path();
    return folder;
}

} // namespace

RootWatch::RootWatch(const QString &directory)
    : m_directory(QFileInfo(directory).absoluteFilePath())
{
    connect(&m_watcher, &QFileSystemWatcher::directoryChanged, this, &RootWatch::look);
    begin();
}

RootWatch::~RootWatch() = default;

void RootWatch::begin()
{
    watchAbove();
    m_known = identity();
}

RootWatch::Identity RootWatch::identity() const
{
    struct stat status = {};
    if (::stat(QFile::encodeName(m_directory).constData(), &status) != 0 || !S_ISDIR(status.st_mode))
        return {};
    return {quint64(status.st_dev), quint64(status.st_ino)};
}

void RootWatch::look()
{
    watchAbove();
    const Identity now = identity();
    if (now == m_known)
        return;
    m_known = now;
    Q_EMIT replaced();
}

// Folders may come while the one above them is not watched yet.
void RootWatch::watchAbove()
{
    for (QString above = folderAbove(m_directory); m_watcher.directories() != QStringList(above);
         above = folderAbove(m_directory)) {
        const QStringList former = m_watcher.directories();
        if (!former.isEmpty())
            m_watcher.removePaths(former);
        if (!m_watcher.addPath(above) && QFileInfo(above).isDir())
            return; // nobody may watch there
    }
}
