// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFilter.h"

#include "LoadedFolders.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "OpenedFolders.h"
#include "ShownMenu.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/SearchText.h>

#include <QCoreApplication>
#include <QTimer>
#include <QTreeView>

#include <algorithm>

namespace {

// What the model reads comes all at once, and the window does not answer meanwhile.
constexpr int FoldersAtOnce = 8;
constexpr int Pause = 15; // milliseconds

QSet<QString> foldersOf(const QStringList &paths)
{
    QSet<QString> folders;
    for (const QString &path : paths) {
        QString folder = path;
        do {
            folder.truncate(folder.lastIndexOf(QLatin1Char('/')));
            if (folders.contains(folder))
                break;
            folders.insert(folder);
        } while (!folder.isEmpty());
    }
    return folders;
}

} // namespace

MenuFilter::MenuFilter(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuVoice &voice)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
    , m_voice(voice)
{
    // Folders that lead to a match may lie in one that was read only now.
    connect(&menu.proxy(), &QAbstractItemModel::rowsInserted, this, [this] {
        if (isOn())
            openFoldersSoon();
    });
    connect(&menu.proxy(), &QAbstractProxyModel::sourceModelChanged, this, &MenuFilter::takeModel);
    takeModel();
}

MenuFilter::~MenuFilter() = default;

void MenuFilter::takeModel()
{
    m_index = std::make_unique<MenuIndex>(m_menu.files());
    m_index->setHiddenFound(m_isHiddenFound);
    connect(m_index.get(), &MenuIndex::grown, this, &MenuFilter::showMore);
    const auto readSoon = [this] {
        if (isOn())
            m_index->readSoon();
    };
    const QAbstractItemModel *files = &m_menu.files();
    connect(files, &QAbstractItemModel::rowsInserted, m_index.get(), readSoon);
    connect(files, &QAbstractItemModel::dataChanged, m_index.get(), readSoon);
    // Not now: the sorting model is being given the other model.
    if (isOn())
        m_index->readSoon();
}

void MenuFilter::setText(const QString &text)
{
    const QStringList words = SearchText::words(text);
    m_text = text.simplified();
    if (words == m_words)
        return;
    const bool wasOn = isOn();
    m_words = words;
    m_isTold = false;
    if (!isOn())
        return end();
    if (!wasOn)
        begin();
    showNew();
}

void MenuFilter::setHiddenFound(bool isFound)
{
    m_isHiddenFound = isFound;
    m_index->setHiddenFound(isFound);
    if (isOn())
        showNew();
}

void MenuFilter::begin()
{
    m_openedBefore = OpenedFolders::in(*m_view, m_menu, m_selection);
    m_isBeginning = true;
    m_index->read();
    m_isBeginning = false;
}

void MenuFilter::end()
{
    m_index->clear();
    m_menu.proxy().setFilter(std::nullopt);
    const QString selected = m_selection.path();
    const QSet<QString> onTheWay = foldersOf(m_selection.paths());
    const QSet<QString> folders = LoadedFolders::in(m_menu.files());
    for (const QString &path : folders)
        m_view->setExpanded(m_selection.shown(path),
                            onTheWay.contains(path) || m_openedBefore.contains(path));
    if (!selected.isEmpty())
        m_view->scrollTo(m_selection.shown(selected));
}

void MenuFilter::showNew()
{
    apply(m_index->find(m_words));
    tellIfNothing();
}

void MenuFilter::showMore()
{
    if (m_isBeginning)
        return;
    FilteredRows rows = m_index->find(m_words);
    if (m_menu.proxy().isFiltered())
        rows.unite(m_menu.proxy().filteredRows());
    apply(rows);
    tellIfNothing();
}

// What is no longer shown may not stay selected: nobody would see what is about to be deleted.
void MenuFilter::apply(const FilteredRows &rows)
{
    if (m_menu.proxy().isFiltered() && m_menu.proxy().filteredRows() == rows)
        return;
    m_selection.deselect([&](const QModelIndex &index) {
        return !rows.contains(m_menu.files().filePath(m_menu.proxy().mapToSource(index)));
    });
    const QString selected = m_selection.path();
    m_menu.proxy().setFilter(rows);
    openFolders();
    if (!selected.isEmpty())
        m_view->scrollTo(m_selection.shown(selected));
}

// From the outside in; a folder is looked up only once the one that it lies in is being read, as
// looking it up would make its row.
void MenuFilter::openFolders()
{
    if (!isOn() || !m_menu.proxy().isFiltered())
        return;
    const QSet<QString> &wanted = m_menu.proxy().filteredRows().foldersToOpen();
    QStringList paths(wanted.begin(), wanted.end());
    std::sort(paths.begin(), paths.end());
    QSet<QString> known;
    int asked = 0;
    for (const QString &path : qAsConst(paths)) {
        const QString above = path.left(path.lastIndexOf(QLatin1Char('/')));
        if (wanted.contains(above) && !known.contains(above))
            continue;
        const QModelIndex folder = m_menu.files().index(path);
        if (!folder.isValid())
            continue;
        // A view that is not shown has nothing read.
        if (m_menu.files().canFetchMore(folder)) {
            if (++asked > FoldersAtOnce)
                return openFoldersSoon();
            m_menu.files().fetchMore(folder);
        }
        m_view->expand(m_menu.proxy().mapFromSource(folder));
        known.insert(path);
    }
}

void MenuFilter::openFoldersSoon()
{
    if (m_isOpening)
        return;
    m_isOpening = true;
    QTimer::singleShot(Pause, this, [this] {
        m_isOpening = false;
        openFolders();
    });
}

bool MenuFilter::selectNext()
{
    if (!isOn() || !m_menu.proxy().isFiltered())
        return false;
    const FilteredRows &rows = m_menu.proxy().filteredRows();
    const QModelIndex first = m_view->model()->index(0, 0, m_view->rootIndex());
    const QModelIndex begin = m_view->currentIndex().isValid() ? m_view->currentIndex() : first;
    // The current item was the last match, unless nothing is selected yet.
    QModelIndex index = m_selection.item().isValid() ? m_view->indexBelow(begin) : begin;
    for (int turns = 0; turns < 2;) {
        if (!index.isValid()) {
            index = first;
            ++turns;
            continue;
        }
        if (rows.isMatch(m_menu.files().filePath(m_menu.proxy().mapToSource(index)))) {
            m_selection.select(index);
            m_view->scrollTo(index);
            return true;
        }
        index = m_view->indexBelow(index);
        if (!first.isValid())
            break;
    }
    return false;
}

// Last: who is told may take the view away.
void MenuFilter::tellIfNothing()
{
    if (m_isTold || m_index->isReading() || !m_menu.proxy().filteredRows().isEmpty())
        return;
    m_isTold = true;
    m_voice.tell(QCoreApplication::translate("VelMenuView", "Nothing in this menu matches '%1'.").arg(m_text),
                 MenuVoice::Note);
}
