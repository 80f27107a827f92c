// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OpenedFolders.h"

#include "LoadedFolders.h"
#include "MenuSelection.h"
#include "ShownMenu.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/FolderListing.h>

#include <QDir>
#include <QFileInfo>
#include <QTreeView>

#include <algorithm>

namespace {

// What the model reads comes all at once, and the window does not answer meanwhile.
constexpr int FoldersAtOnce = 8;
constexpr int Pause = 15; // milliseconds

QString rootOf(const ShownMenu &menu)
{
    return QDir::cleanPath(menu.files().menuDirectory());
}

QString asPrefix(const QString &folder)
{
    return folder.endsWith(QLatin1Char('/')) ? folder : folder + QLatin1Char('/');
}

QStringList sorted(const QSet<QString> &paths)
{
    QStringList list(paths.begin(), paths.end());
    std::sort(list.begin(), list.end());
    return list;
}

} // namespace

OpenedFolders::OpenedFolders(QTreeView *view, const ShownMenu &menu, MenuSelection &selection)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
{
    m_turn.setSingleShot(true);
    m_turn.setInterval(Pause);
    connect(&m_turn, &QTimer::timeout, this, &OpenedFolders::openSome);
    connect(view, &QTreeView::expanded, this, [this] {
        if (!m_waiting.isEmpty())
            m_turn.start();
    });
    connect(&menu.proxy(), &QAbstractProxyModel::sourceModelChanged, this, &OpenedFolders::watchFiles);
    watchFiles();
}

OpenedFolders::~OpenedFolders() = default;

void OpenedFolders::watchFiles()
{
    m_items = 0;
    connect(&m_menu.files(), &QFileSystemModel::directoryLoaded, this, [this] {
        if (!m_waiting.isEmpty())
            m_turn.start();
    });
}

QSet<QString> OpenedFolders::in(const QTreeView &view, const ShownMenu &menu, const MenuSelection &selection)
{
    QSet<QString> opened;
    const QSet<QString> loaded = LoadedFolders::in(menu.files());
    for (const QString &path : loaded) {
        if (view.isExpanded(selection.shown(path)))
            opened.insert(path);
    }
    return opened;
}

void OpenedFolders::open(const QStringList &folders)
{
    const QString root = asPrefix(rootOf(m_menu));
    for (const QString &folder : folders) {
        const QString path = QDir::cleanPath(root + folder);
        if (m_waiting.size() < MostFolders && path.startsWith(root))
            m_waiting.insert(path);
    }
    if (!m_waiting.isEmpty())
        m_turn.start();
}

QStringList OpenedFolders::opened() const
{
    const QString root = asPrefix(rootOf(m_menu));
    QStringList folders;
    for (const QString &path : sorted(in(*m_view, m_menu, m_selection) + m_waiting + m_left)) {
        if (folders.size() < MostFolders && isWithin(path))
            folders.append(path.mid(root.size()));
    }
    return folders;
}

// From the outside in.
void OpenedFolders::openSome()
{
    int count = 0;
    for (const QString &path : sorted(m_waiting)) {
        if (!isReady(path))
            continue;
        if (++count > FoldersAtOnce) {
            m_turn.start();
            return;
        }
        m_waiting.remove(path);
        if (!isWithin(path))
            continue;
        if (takeItems(path))
            m_view->expand(m_selection.shown(path));
        else
            m_left.insert(path);
    }
}

// Looking up what lies in a folder that nobody has read would make its row.
bool OpenedFolders::isReady(const QString &path) const
{
    const QString above = QFileInfo(path).path();
    if (above == rootOf(m_menu))
        return true;
    const QModelIndex folder =
        m_waiting.contains(above) || !isReady(above) ? QModelIndex() : m_selection.shown(above);
    return folder.isValid() && m_view->isExpanded(folder);
}

// Of a folder that is gone, too, nothing is opened.
bool OpenedFolders::isWithin(const QString &path) const
{
    const QFileInfo info(path);
    const QString root = QFileInfo(rootOf(m_menu)).canonicalFilePath();
    return info.isDir() && !root.isEmpty() && info.canonicalFilePath().startsWith(asPrefix(root));
}

bool OpenedFolders::takeItems(const QString &path)
{
    const int count = FolderListing::namesIn(path).value_or(QSet<QString>()).size();
    if (count > MostItems - m_items)
        return false;
    m_items += count;
    return true;
}
