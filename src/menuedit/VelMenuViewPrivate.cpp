// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuViewPrivate.h"

#include "TreeLoader.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"
#include "VelMenuView.h"

#include <QFileInfo>
#include <QItemSelectionModel>
#include <QTimer>

VelMenuViewPrivate::VelMenuViewPrivate(VelMenuView *view)
    : q(view)
{
}

VelMenuViewPrivate::~VelMenuViewPrivate() = default;

void VelMenuViewPrivate::clear()
{
    if (!model)
        return;
    QObject::disconnect(q, &QAbstractItemView::doubleClicked, q, &VelMenuView::slotEdit);
    delete editMenu;
    editMenu = nullptr;
    for (QAction **action :
         {&cutAction, &copyAction, &pasteAction, &dirNewAction, &fileNewAction, &editAction, &deleteAction,
          &executeAction, &upAction, &downAction, &recreateAction, &findAction, &findNextAction})
        *action = nullptr;
    findResults.clear();
    findPos = -1;
    findText.clear();
    awaited.clear();
    QItemSelectionModel *selection = q->selectionModel();
    q->setModel(nullptr);
    delete selection;
    delete proxy;
    proxy = nullptr;
    loader.reset();
    model.reset();
}

void VelMenuViewPrivate::buildModel()
{
    std::unique_ptr<VelMenuModel> former = std::move(model);
    model = std::make_unique<VelMenuModel>(menuDir, q, nullptr);
    loader = std::make_unique<TreeLoader>(model.get());
    if (editable) {
        model->setReadOnly(false);
        QObject::connect(model.get(), &VelMenuModel::changed, q, &VelMenuView::changed);
    }
    proxy->setSourceModel(model.get());
}

void VelMenuViewPrivate::showRoot()
{
    q->setRootIndex(proxy->mapFromSource(model->index(menuDir)));
    hideTopLevel();
}

void VelMenuViewPrivate::watchRows()
{
    QObject::connect(
        proxy, &QAbstractItemModel::rowsAboutToBeRemoved, q,
        [this](const QModelIndex &parent, int first, int last) { leaveRows(parent, first, last); });
    QObject::connect(proxy, &QAbstractItemModel::rowsRemoved, q, [this] { hideTopLevel(); });
    QObject::connect(proxy, &QAbstractItemModel::modelReset, q, [this] { hideTopLevel(); });
    QObject::connect(proxy, &QAbstractItemModel::rowsInserted, q, [this](const QModelIndex &parent) {
        if (!parent.isValid())
            hideTopLevel();
        // Not from here: looking for the item may bring in further rows.
        if (!awaited.isEmpty())
            QTimer::singleShot(0, q, [this] { selectAwaited(); });
    });
}

void VelMenuViewPrivate::leaveRows(const QModelIndex &parent, int first, int last)
{
    const QModelIndex current = q->currentIndex();
    if (!current.isValid() || current.parent() != parent || current.row() < first || current.row() > last)
        return;
    // A listing that is older than the item takes its row away for a moment.
    const QString path = q->selectedPath();
    if (!path.isEmpty() && QFileInfo::exists(path))
        awaited = path;
    QModelIndex neighbour = proxy->index(last + 1, 0, parent);
    if (!neighbour.isValid() && first > 0)
        neighbour = proxy->index(first - 1, 0, parent);
    q->selectionModel()->setCurrentIndex(neighbour, QItemSelectionModel::NoUpdate);
}

void VelMenuViewPrivate::selectAwaited()
{
    if (awaited.isEmpty())
        return;
    const QModelIndex index = QFileInfo::exists(awaited) ? proxyIndex(awaited) : QModelIndex();
    if (index.isValid() && !q->selectionModel()->hasSelection()) {
        selectOnly(index);
        q->scrollTo(index);
    }
    awaited.clear();
}

// Without its root the tree would show the file system instead of nothing. While there is a root,
// nothing is hidden: a view starts no drag from below a hidden row.
void VelMenuViewPrivate::hideTopLevel()
{
    const bool isRootless = !q->rootIndex().isValid();
    for (int row = 0; row < proxy->rowCount(); ++row) {
        if (q->isRowHidden(row, QModelIndex()) != isRootless)
            q->setRowHidden(row, QModelIndex(), isRootless);
    }
}

QModelIndex VelMenuViewPrivate::proxyIndex(const QString &path) const
{
    const QModelIndex index = proxy->mapFromSource(model->index(path));
    const QModelIndex root = q->rootIndex();
    for (QModelIndex above = index.parent(); above.isValid() && root.isValid(); above = above.parent()) {
        if (above == root)
            return index;
    }
    return {};
}

void VelMenuViewPrivate::selectOnly(const QModelIndex &index)
{
    clearSelection();
    q->selectionModel()->setCurrentIndex(index, QItemSelectionModel::Select);
}

void VelMenuViewPrivate::clearSelection()
{
    q->selectionModel()->clearSelection();
}
