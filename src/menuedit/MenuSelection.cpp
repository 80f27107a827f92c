// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuSelection.h"

#include "NeighborRow.h"
#include "ShownMenu.h"
#include "TreeOrder.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <QFileInfo>
#include <QItemSelectionModel>
#include <QTimer>
#include <QTreeView>

#include <algorithm>
#include <numeric>

MenuSelection::MenuSelection(QTreeView *view, const ShownMenu &menu)
    : m_view(view)
    , m_menu(menu)
{
    connect(&menu.proxy(), &QAbstractItemModel::rowsAboutToBeRemoved, this, &MenuSelection::leaveRows);
    connect(&menu.proxy(), &QAbstractItemModel::rowsInserted, this, &MenuSelection::awaitRows);
    // Before the selection hears of it, which is made with the view's model.
    connect(&menu.proxy(), &QAbstractItemModel::layoutAboutToBeChanged, this, &MenuSelection::keepEachRow);
}

MenuSelection::~MenuSelection() = default;

// Of thousands the ranges are few.
QModelIndex MenuSelection::item() const
{
    const QItemSelectionModel *model = m_view->selectionModel();
    if (!model || !model->hasSelection())
        return {};
    if (model->isSelected(m_view->currentIndex()))
        return m_menu.proxy().mapToSource(m_view->currentIndex());
    QModelIndexList tops;
    const QItemSelection ranges = model->selection();
    for (const QItemSelectionRange &range : ranges)
        tops.append(range.topLeft());
    return m_menu.proxy().mapToSource(TreeOrder::fromTop(tops).value(0));
}

QModelIndexList MenuSelection::all() const
{
    const QItemSelectionModel *selection = m_view->selectionModel();
    return selection ? selection->selectedIndexes() : QModelIndexList();
}

int MenuSelection::count() const
{
    const QItemSelectionModel *model = m_view->selectionModel();
    const QItemSelection ranges = model ? model->selection() : QItemSelection();
    return std::accumulate(ranges.begin(), ranges.end(), 0, [](int count, const QItemSelectionRange &range) {
        return count + range.height();
    });
}

QStringList MenuSelection::paths() const
{
    QStringList paths;
    for (const QModelIndex &index : TreeOrder::outermost(all()))
        paths.append(pathOf(index));
    return paths;
}

QString MenuSelection::path() const
{
    const QModelIndex selected = item();
    return selected.isValid() ? m_menu.files().filePath(selected) : QString();
}

QModelIndex MenuSelection::shown(const QString &path) const
{
    const QModelIndex index = m_menu.proxy().mapFromSource(m_menu.files().index(path));
    const QModelIndex root = m_view->rootIndex();
    for (QModelIndex above = index.parent(); above.isValid() && root.isValid(); above = above.parent()) {
        if (above == root)
            return index;
    }
    return {};
}

QString MenuSelection::pathOf(const QModelIndex &shown) const
{
    return m_menu.files().filePath(m_menu.proxy().mapToSource(shown));
}

void MenuSelection::clear()
{
    m_awaited.clear();
    m_came.clear();
    m_view->selectionModel()->clearSelection();
}

void MenuSelection::select(const QModelIndex &index)
{
    clear();
    m_view->selectionModel()->setCurrentIndex(index, QItemSelectionModel::Select);
}

void MenuSelection::show(const QString &path)
{
    clear();
    m_menu.proxy().letThrough({path});
    const QModelIndex index = shown(path);
    if (!index.isValid())
        return;
    if (index.parent().isValid())
        m_view->expand(index.parent());
    select(index);
    reveal(path);
}

void MenuSelection::reveal(const QString &path)
{
    QTimer::singleShot(0, this, [this, path] {
        const QModelIndex again = shown(path);
        if (again.isValid())
            m_view->scrollTo(again);
    });
}

QModelIndex MenuSelection::shownFolder(const QString &path) const
{
    return path == pathOf(m_view->rootIndex()) ? m_view->rootIndex() : shown(path);
}

// With those that it lies in: what is selected has to be seen.
void MenuSelection::openFolder(const QModelIndex &folder)
{
    for (QModelIndex index = folder; index.isValid() && index != m_view->rootIndex(); index = index.parent())
        m_view->expand(index);
}

// Thousands are looked for among the rows that there are: asking for one by its path would make it.
void MenuSelection::show(const QStringList &paths)
{
    m_menu.proxy().letThrough(paths);
    const bool isOne = paths.size() < 2 || m_view->selectionMode() == QAbstractItemView::SingleSelection;
    // The first of those that are not hidden.
    const auto first = isOne ? paths.begin()
                             : std::find_if(paths.begin(), paths.end() - 1,
                                            [this](const QString &path) { return shown(path).isValid(); });
    show(paths.isEmpty() ? QString() : *first);
    if (isOne)
        return;
    QSet<QString> wanted(first + 1, paths.end());
    QSet<QString> folders;
    for (const QString &path : qAsConst(wanted))
        folders.insert(path.left(path.lastIndexOf(QLatin1Char('/'))));
    QModelIndexList rows;
    for (const QString &path : qAsConst(folders)) {
        const QModelIndex folder = shownFolder(path);
        openFolder(folder);
        for (int row = 0; folder.isValid() && row < m_menu.proxy().rowCount(folder); ++row) {
            const QModelIndex child = m_menu.proxy().index(row, 0, folder);
            if (wanted.remove(pathOf(child)))
                rows.append(child);
        }
    }
    add(rows);
    m_awaited = wanted;
}

void MenuSelection::add(const QModelIndexList &rows)
{
    m_isSelecting = true;
    m_view->selectionModel()->select(TreeOrder::ranges(rows), QItemSelectionModel::Select);
    m_isSelecting = false;
}

void MenuSelection::deselect(const std::function<bool(const QModelIndex &)> &isToGo)
{
    QModelIndexList going;
    QModelIndexList staying;
    const QModelIndexList selected = all();
    for (const QModelIndex &index : selected)
        (isToGo(index) ? going : staying).append(index);
    if (staying.isEmpty())
        return clear();
    // Each range is compared with all that are selected.
    if (staying.size() < going.size())
        m_view->selectionModel()->select(TreeOrder::ranges(staying), QItemSelectionModel::ClearAndSelect);
    else if (!going.isEmpty())
        m_view->selectionModel()->select(TreeOrder::ranges(going), QItemSelectionModel::Deselect);
}

// Of all rows of a large folder Qt keeps the first and the last while rows come and go, and what comes
// between them is selected. A second range has it keep each row.
void MenuSelection::keepEachRow()
{
    QItemSelectionModel *const model = m_view->selectionModel();
    const QItemSelection selection = model ? model->selection() : QItemSelection();
    if (selection.size() == 1 && selection.constFirst().height() > 1)
        model->select(selection.constFirst().topLeft(), QItemSelectionModel::Select);
}

void MenuSelection::leave(const QString &path)
{
    leave(QStringList{path});
}

// The rows go a moment later; were one the current one then, its neighbor would be selected.
void MenuSelection::leave(const QStringList &paths)
{
    m_awaited.clear();
    m_came.clear();
    const QSet<QString> going(paths.begin(), paths.end());
    const QModelIndex current = m_view->currentIndex();
    QModelIndex start = goingOne(current, going);
    const bool isKept = !start.isValid() && current.isValid() && paths.size() > 1;
    if (!start.isValid() && !isKept)
        start = shown(paths.value(0));
    deselect([&](const QModelIndex &index) { return goingOne(index, going).isValid(); });
    if (start.isValid())
        m_view->selectionModel()->setCurrentIndex(neighborOf(start, going), QItemSelectionModel::NoUpdate);
}

// What of the paths \a index is, or lies in; invalid for none.
QModelIndex MenuSelection::goingOne(const QModelIndex &index, const QSet<QString> &going) const
{
    QModelIndex place = index;
    while (place.isValid() && !going.contains(pathOf(place)))
        place = place.parent();
    return place;
}

// Where all in a folder go, the folder stays.
QModelIndex MenuSelection::neighborOf(const QModelIndex &index, const QSet<QString> &going) const
{
    const auto goes = [&](int row) {
        const QModelIndex sibling = m_menu.proxy().index(row, 0, index.parent());
        return sibling.isValid() && going.contains(pathOf(sibling));
    };
    int first = index.row();
    int last = index.row();
    while (goes(first - 1))
        --first;
    while (goes(last + 1))
        ++last;
    const QModelIndex folder = index.parent() == m_view->rootIndex() ? QModelIndex() : index.parent();
    return NeighborRow::whenGone(m_menu.proxy(), index.parent(), first, last, folder);
}

// A listing that is older than the items takes their rows away for a moment.
void MenuSelection::awaitGoing(const QModelIndex &parent, int first, int last)
{
    const QItemSelection selection = m_view->selectionModel()->selection();
    for (const QItemSelectionRange &range : selection) {
        if (range.parent() != parent)
            continue;
        for (int row = std::max(first, range.top()); row <= std::min(last, range.bottom()); ++row) {
            const QString path = pathOf(m_menu.proxy().index(row, 0, parent));
            if (QFileInfo::exists(path))
                m_awaited.insert(path);
        }
    }
}

// Keeps the view from selecting a neighbor of the row that goes.
void MenuSelection::leaveRows(const QModelIndex &parent, int first, int last)
{
    awaitGoing(parent, first, last);
    const QModelIndex current = m_view->currentIndex();
    if (!current.isValid() || current.parent() != parent || current.row() < first || current.row() > last)
        return;
    const QModelIndex next = NeighborRow::whenGone(m_menu.proxy(), parent, first, last, QModelIndex());
    m_view->selectionModel()->setCurrentIndex(next, QItemSelectionModel::NoUpdate);
}

// Not at once: the view has not heard of the rows yet.
void MenuSelection::awaitRows(const QModelIndex &parent, int first, int last)
{
    if (m_awaited.isEmpty())
        return;
    const bool isWaiting = !m_came.isEmpty();
    for (int row = first; row <= last; ++row) {
        const QModelIndex index = m_menu.proxy().index(row, 0, parent);
        if (m_awaited.remove(pathOf(index)))
            m_came.append(index);
    }
    if (!isWaiting && !m_came.isEmpty())
        QTimer::singleShot(0, this, &MenuSelection::selectAwaited);
}

void MenuSelection::selectAwaited()
{
    QModelIndexList rows;
    for (const QPersistentModelIndex &row : qAsConst(m_came)) {
        if (row.isValid() && QFileInfo::exists(pathOf(row)))
            rows.append(row);
    }
    m_came.clear();
    if (rows.isEmpty())
        return;
    if (!m_view->selectionModel()->hasSelection()) {
        m_view->selectionModel()->setCurrentIndex(rows.constFirst(), QItemSelectionModel::NoUpdate);
        m_view->scrollTo(rows.constFirst());
    }
    add(rows);
}

void MenuSelection::noteSelected(const QItemSelection &selected)
{
    if (m_isSelecting || selected.isEmpty())
        return;
    m_awaited.clear();
    m_came.clear();
}
