// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuSelection.h"

#include "NeighborRow.h"
#include "ShownMenu.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <QFileInfo>
#include <QItemSelectionModel>
#include <QTimer>
#include <QTreeView>

MenuSelection::MenuSelection(QTreeView *view, const ShownMenu &menu)
    : m_view(view)
    , m_menu(menu)
{
    connect(&menu.proxy(), &QAbstractItemModel::rowsAboutToBeRemoved, this, &MenuSelection::leaveRows);
    connect(&menu.proxy(), &QAbstractItemModel::rowsInserted, this, &MenuSelection::awaitRows);
}

MenuSelection::~MenuSelection() = default;

QModelIndex MenuSelection::item() const
{
    const QItemSelectionModel *selection = m_view->selectionModel();
    const QModelIndexList selected = selection ? selection->selectedIndexes() : QModelIndexList();
    return selected.isEmpty() ? QModelIndex() : m_menu.proxy().mapToSource(selected.constFirst());
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

void MenuSelection::clear()
{
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
    m_menu.proxy().letThrough(path);
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

// The row goes a moment later; were it the current one then, its neighbor would be selected.
void MenuSelection::leave(const QString &path)
{
    const QModelIndex index = shown(path);
    const QModelIndex folder = index.parent() == m_view->rootIndex() ? QModelIndex() : index.parent();
    const QModelIndex next = index.isValid()
        ? NeighborRow::whenGone(m_menu.proxy(), index.parent(), index.row(), index.row(), folder)
        : QModelIndex();
    clear();
    m_view->selectionModel()->setCurrentIndex(next, QItemSelectionModel::NoUpdate);
}

// Keeps the view from selecting a neighbor of the row that goes.
void MenuSelection::leaveRows(const QModelIndex &parent, int first, int last)
{
    const QModelIndex current = m_view->currentIndex();
    if (!current.isValid() || current.parent() != parent || current.row() < first || current.row() > last)
        return;
    // A listing that is older than the item takes its row away for a moment.
    const QString selected = path();
    if (!selected.isEmpty() && QFileInfo::exists(selected))
        m_awaited = selected;
    const QModelIndex next = NeighborRow::whenGone(m_menu.proxy(), parent, first, last, QModelIndex());
    m_view->selectionModel()->setCurrentIndex(next, QItemSelectionModel::NoUpdate);
}

// Not at once: looking for the item may bring in further rows.
void MenuSelection::awaitRows()
{
    if (!m_awaited.isEmpty())
        QTimer::singleShot(0, this, &MenuSelection::selectAwaited);
}

void MenuSelection::selectAwaited()
{
    if (m_awaited.isEmpty())
        return;
    const QModelIndex index = QFileInfo::exists(m_awaited) ? shown(m_awaited) : QModelIndex();
    if (index.isValid() && !m_view->selectionModel()->hasSelection()) {
        select(index);
        m_view->scrollTo(index);
    }
    m_awaited.clear();
}
