// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "NewIcons.h"

#include "RowCache.h"

#include <QElapsedTimer>
#include <QPair>

#include <limits>
#include <utility>

namespace {

// In milliseconds.
constexpr int BetweenTurns = 20;
constexpr int InOneTurn = 5;

constexpr int FilesAtOnce = 50;

QString folderOf(const QString &path)
{
    return path.left(path.lastIndexOf(QLatin1Char('/')) + 1);
}

} // namespace

NewIcons::NewIcons(RowCache *cache)
    : QObject(cache)
    , m_cache(*cache)
{
    m_turn.setInterval(BetweenTurns);
    connect(&m_turn, &QTimer::timeout, this, &NewIcons::askSome);
}

NewIcons::~NewIcons() = default;

void NewIcons::begin(const QString &path)
{
    m_begun = path;
    look(path);
}

// Rows come folder by folder.
void NewIcons::look(const QString &path)
{
    const QString folder = folderOf(path);
    auto known = m_folders.find(folder);
    if (known == m_folders.end()) {
        const qint64 time = FileIdentity::now();
        known = m_folders.insert(folder, {FileIdentity(folder), time, {}});
    }
    m_folder = &*known;
    m_isGrowing = true;
    if (!m_turn.isActive())
        m_turn.start();
}

void NewIcons::end(const QIcon &icon)
{
    m_cache.setNewIcon(m_begun, icon);
    m_folder->paths.append(m_begun);
}

void NewIcons::finish(const QString &path)
{
    const auto folder = m_folders.find(folderOf(path));
    if (folder != m_folders.end())
        ask(folder, std::numeric_limits<int>::max());
}

// As long as rows come, they come first.
void NewIcons::askSome()
{
    if (std::exchange(m_isGrowing, false))
        return;
    QElapsedTimer timer;
    timer.start();
    while (!m_folders.isEmpty() && timer.elapsed() < InOneTurn)
        ask(m_folders.begin(), FilesAtOnce);
    if (m_folders.isEmpty())
        m_turn.stop();
}

// A file that comes to a path has changed by that, but in another folder that does all may be old. The
// folder comes last, so that it was the same all the time.
void NewIcons::ask(Folders::iterator folder, int most)
{
    QVector<QPair<QString, FileIdentity>> files;
    while (files.size() < most && !folder->paths.isEmpty()) {
        const QString path = folder->paths.takeLast();
        if (m_cache.hasNewIcon(path))
            files.append({path, FileIdentity(path)});
    }
    const bool isSame = !files.isEmpty() && FileIdentity(folder.key()).isSameFile(folder->identity);
    for (const auto &[path, identity] : qAsConst(files)) {
        if (isSame && identity.isRegularFile() && identity.isSettledAt(folder->time))
            m_cache.keepNewIcon(path, identity);
        else
            m_cache.dropNewIcon(path);
    }
    if (folder->paths.isEmpty())
        m_folders.erase(folder);
}
