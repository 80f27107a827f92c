// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuViewPrivate.h"

#include "TreeLoader.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"
#include "VelMenuView.h"

#include <QItemSelectionModel>

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
    hideTopLevel();
    q->setRootIndex(proxy->mapFromSource(model->index(menuDir)));
}

void VelMenuViewPrivate::hideTopLevel()
{
    for (int row = 0; row < proxy->rowCount(); ++row)
        q->setRowHidden(row, QModelIndex(), true);
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
