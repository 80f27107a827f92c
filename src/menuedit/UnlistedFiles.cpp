// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "UnlistedFiles.h"

#include "OnDisk.h"

#include <frame/FolderListing.h>

#include <QDir>
#include <QFileInfo>
#include <QFileSystemModel>

UnlistedFiles::UnlistedFiles(QFileSystemModel *model)
    : QObject(model)
    , m_model(model)
{
    // It comes behind the last of the rows, and behind those that go.
    connect(model, &QFileSystemModel::directoryLoaded, this, &UnlistedFiles::complete);
}

UnlistedFiles::~UnlistedFiles() = default;

bool UnlistedFiles::mayGoAndCome(const QString &path) const
{
    return m_folders.contains(QFileInfo(path).path()) && OnDisk::exists(path);
}

void UnlistedFiles::complete(const QString &path)
{
    const QString folder = QDir::cleanPath(path);
    const bool isWhole = path.isEmpty() || !FolderListing::holdsOddName(folder);
    if (isWhole && !m_folders.remove(folder))
        return;
    const QSet<QString> names = FolderListing::namesIn(folder).value_or(QSet<QString>());
    const QSet<QString> shown = shownIn(folder);
    markGone(folder, names, shown);
    if (isWhole)
        return;
    m_folders.insert(folder);
    const QSet<QString> lacking = names - shown;
    QStringList sorted(lacking.begin(), lacking.end());
    sorted.sort();
    for (const QString &name : qAsConst(sorted)) {
        const QString file = QDir(folder).filePath(name);
        // The model makes a row for what it is asked for, whatever its filters say.
        if (isShown(file))
            m_model->index(file);
    }
}

// Of a listing that ends at its first name the model takes no notice, and what is gone stays.
void UnlistedFiles::markGone(const QString &folder, const QSet<QString> &names, const QSet<QString> &shown)
{
    const QSet<QString> known = m_gone;
    for (const QString &path : known) {
        const QFileInfo info(path);
        if (info.path() == folder && (names.contains(info.fileName()) || !shown.contains(info.fileName())))
            setGone(path, false);
    }
    const QSet<QString> gone = shown - names;
    for (const QString &name : gone)
        setGone(QDir(folder).filePath(name), true);
}

void UnlistedFiles::setGone(const QString &path, bool isGone)
{
    if (isGone == m_gone.contains(path))
        return;
    if (isGone)
        m_gone.insert(path);
    else
        m_gone.remove(path);
    const QModelIndex row = isGone || OnDisk::exists(path) ? m_model->index(path) : QModelIndex();
    if (row.isValid())
        Q_EMIT m_model->dataChanged(row, row);
}

QSet<QString> UnlistedFiles::shownIn(const QString &folder) const
{
    const QModelIndex parent = m_model->index(folder);
    QSet<QString> names;
    for (int row = 0; row < m_model->rowCount(parent); ++row)
        names.insert(m_model->index(row, 0, parent).data(QFileSystemModel::FileNameRole).toString());
    return names;
}

bool UnlistedFiles::isShown(const QString &path) const
{
    const QDir::Filters filter = m_model->filter();
    const QFileInfo info(path);
    if (!info.exists() || (info.isHidden() && !(filter & QDir::Hidden)))
        return false;
    if (info.isDir())
        return filter & (QDir::Dirs | QDir::AllDirs);
    return filter & (info.isFile() ? QDir::Files : QDir::System);
}
