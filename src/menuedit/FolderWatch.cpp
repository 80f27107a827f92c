// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderWatch.h"

#include <QFileInfo>
#include <QFileSystemModel>

#include <algorithm>
#include <utility>

namespace {

// Long enough that a tree which is moved or deleted folder by folder counts once.
constexpr int Milliseconds = 200;

QStringList existing(QStringList folders)
{
    const auto isGone = [](const QString &folder) { return !QFileInfo::exists(folder); };
    folders.erase(std::remove_if(folders.begin(), folders.end(), isGone), folders.end());
    return folders;
}

} // namespace

FolderWatch::FolderWatch(QFileSystemModel *model)
    : QObject(model)
    , m_model(model)
{
    m_timer.setSingleShot(true);
    m_timer.setInterval(Milliseconds);
    connect(&m_timer, &QTimer::timeout, this, &FolderWatch::renew);
    connect(model, &QAbstractItemModel::rowsAboutToBeRemoved, this, &FolderWatch::noticeRemoval);
    connect(model, &QFileSystemModel::directoryLoaded, this, &FolderWatch::noticeReading);
}

FolderWatch::~FolderWatch() = default;

QStringList FolderWatch::release(const QStringList &paths)
{
    QStringList watched;
    for (const QString &path : paths) {
        if (QFileInfo(path).isDir() && path.startsWith(m_model->rootPath()))
            collect(m_model->index(path), watched);
    }
    forget(watched);
    return watched;
}

void FolderWatch::watchAgain(const QStringList &folders)
{
    const QStringList there = existing(folders);
    expectReading(there);
    read(there);
}

void FolderWatch::read(const QStringList &folders)
{
    for (const QString &folder : folders)
        m_model->fetchMore(m_model->index(folder));
}

// What the model has still to tell of earlier readings comes before what is asked for from now on.
void FolderWatch::expectReading(const QStringList &folders)
{
    const auto expect = [this, folders] { m_expected += QSet<QString>(folders.begin(), folders.end()); };
    QMetaObject::invokeMethod(this, expect, Qt::QueuedConnection);
}

// When all were read, nothing is left of what waited before them.
void FolderWatch::noticeReading(const QString &folder)
{
    if (!m_expected.remove(folder))
        return;
    m_readOnce.append(folder);
    if (!m_expected.isEmpty())
        return;
    const QStringList folders = existing(std::exchange(m_readOnce, {}));
    if (!m_isOn || !QFileInfo::exists(m_model->rootPath()))
        return;
    forget(folders);
    read(folders);
}

void FolderWatch::setOn(bool on)
{
    m_isOn = on;
    m_model->setOption(QFileSystemModel::DontWatchForChanges, !on);
    if (on)
        renew();
}

// Whether a folder was moved or deleted cannot be told when its row goes.
void FolderWatch::noticeRemoval(const QModelIndex &parent, int first, int last)
{
    QStringList gone;
    for (int row = first; row <= last && gone.isEmpty(); ++row) {
        const QModelIndex folder = m_model->index(row, 0, parent);
        if (!m_isInPlace || !m_isInPlace(m_model->filePath(folder)))
            collect(folder, gone);
    }
    if (!gone.isEmpty())
        m_timer.start();
}

// The model does not let go of a single folder that is no longer where it was; it does let go
// of all.
void FolderWatch::renew()
{
    // A root that is gone could be left, but not gone back to.
    if (!m_isOn || !QFileInfo::exists(m_model->rootPath()))
        return;
    QStringList watched;
    collect(m_model->index(m_model->rootPath()), watched);
    m_model->setOption(QFileSystemModel::DontWatchForChanges, true);
    m_model->setOption(QFileSystemModel::DontWatchForChanges, false);
    m_expected.clear();
    m_readOnce.clear();
    const QStringList there = existing(watched);
    expectReading(there);
    forget(watched);
    read(there);
}

// All that were read, by their rows being known in full.
void FolderWatch::collect(const QModelIndex &folder, QStringList &paths) const
{
    if (!folder.isValid())
        return;
    if (!m_model->canFetchMore(folder))
        paths.append(m_model->filePath(folder));
    for (int row = 0; row < m_model->rowCount(folder); ++row)
        collect(m_model->index(row, 0, folder), paths);
}

// The model lets go of a folder that was its root, and reads it anew when asked to.
void FolderWatch::forget(const QStringList &folders)
{
    if (folders.isEmpty())
        return;
    const QString root = m_model->rootPath();
    for (const QString &folder : folders)
        m_model->setRootPath(folder);
    // Where the root is all there is, it still has to be left.
    if (m_model->rootPath() == root)
        m_model->setRootPath(QString());
    m_model->setRootPath(root);
}
