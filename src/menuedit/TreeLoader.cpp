// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeLoader.h"

#include <QEventLoop>
#include <QFileInfo>
#include <QFileSystemModel>
#include <QTimer>

#include <iterator>

TreeLoader::TreeLoader(QFileSystemModel *model, QObject *parent)
    : QObject(parent)
    , m_model(model)
{
    connect(model, &QFileSystemModel::directoryLoaded, this, &TreeLoader::folderLoaded);
    connect(model, &QAbstractItemModel::rowsAboutToBeRemoved, this, &TreeLoader::forgetFolders);
    connect(model, &QObject::destroyed, this, [this] {
        if (m_loop)
            m_loop->quit();
    });
}

TreeLoader::~TreeLoader()
{
    if (m_loop)
        m_loop->quit();
}

void TreeLoader::setLimits(int folders, int milliseconds)
{
    m_folderLimit = folders;
    m_milliseconds = milliseconds;
}

bool TreeLoader::load(const QModelIndex &root)
{
    if (m_busy || !m_model || !root.isValid())
        return false;
    m_busy = true;
    m_complete = true;
    m_folders = 0;
    m_root = m_model->filePath(root);
    visit(root);

    const QPointer<TreeLoader> self(this);
    if (!m_pending.isEmpty()) {
        QEventLoop loop;
        QTimer::singleShot(m_milliseconds, &loop, &QEventLoop::quit);
        m_loop = &loop;
        loop.exec(QEventLoop::ExcludeUserInputEvents);
        if (!self)
            return false;
        m_loop = nullptr;
    }
    const bool complete = m_complete && m_model && m_pending.isEmpty();
    m_pending.clear();
    m_busy = false;
    return complete;
}

void TreeLoader::folderLoaded(const QString &path)
{
    // The model also says so when it has read a single file of a folder that nobody asked for.
    const QModelIndex folder = m_model->index(path);
    if (!folder.isValid() || !m_model->canFetchMore(folder))
        m_loaded.insert(path);
    if (!m_pending.remove(path))
        return;
    visitChildren(folder);
    if (m_loop && m_pending.isEmpty())
        m_loop->quit();
}

void TreeLoader::forgetFolders(const QModelIndex &parent, int first, int last)
{
    for (int row = first; row <= last; ++row) {
        const QString path = m_model->filePath(m_model->index(row, 0, parent));
        if (!m_loaded.remove(path))
            continue;
        const QString below = path + QLatin1Char('/');
        for (auto folder = m_loaded.begin(); folder != m_loaded.end();)
            folder = folder->startsWith(below) ? m_loaded.erase(folder) : std::next(folder);
    }
}

void TreeLoader::visit(const QModelIndex &folder)
{
    if (m_folders >= m_folderLimit) {
        m_complete = false;
        return;
    }
    ++m_folders;
    const QString path = m_model->filePath(folder);
    if (m_loaded.contains(path) && !m_model->canFetchMore(folder)) {
        visitChildren(folder);
        return;
    }
    m_pending.insert(path);
    if (m_model->canFetchMore(folder))
        m_model->fetchMore(folder);
}

void TreeLoader::visitChildren(const QModelIndex &folder)
{
    if (!folder.isValid())
        return;
    const int count = m_model->rowCount(folder);
    for (int row = 0; row < count; ++row) {
        const QModelIndex child = m_model->index(row, 0, folder);
        if (m_model->isDir(child) && !leadsAbove(m_model->filePath(child)))
            visit(child);
    }
}

bool TreeLoader::leadsAbove(const QString &path) const
{
    const QFileInfo info(path);
    if (!info.isSymLink())
        return false;
    const QString target = info.canonicalFilePath();
    QString above = info.absolutePath();
    while (above.size() >= m_root.size()) {
        if (QFileInfo(above).canonicalFilePath() == target)
            return true;
        const QString next = QFileInfo(above).absolutePath();
        if (next == above)
            break;
        above = next;
    }
    // A folder above the root holds the root, too.
    return target == QLatin1String("/")
        || QFileInfo(m_root).canonicalFilePath().startsWith(target + QLatin1Char('/'));
}
