// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuView.h"

#include "VelMenuViewPrivate.h"

VelMenuView::VelMenuView(QWidget *parent)
    : VelMenuView(QString(), -1, false, parent)
{
}

VelMenuView::VelMenuView(const QString &menuDir, int iconSize, bool editable, QWidget *parent)
    : QTreeView(parent)
    , d(new VelMenuViewPrivate)
{
    init(menuDir, iconSize, editable, parent);
}

VelMenuView::~VelMenuView() = default;

void VelMenuView::init(const QString &menuDir, int, bool, QWidget *)
{
    d->menuDir = menuDir;
}

QString VelMenuView::menuDir() const
{
    return d->menuDir;
}

QModelIndex VelMenuView::selectedItem() const
{
    return {};
}

QString VelMenuView::selectedPath() const
{
    return {};
}

void VelMenuView::showAndSelect(const QString &) { }

void VelMenuView::invalidateSortOrder(const QModelIndex &) { }

void VelMenuView::clearFindResults() { }

bool VelMenuView::findAndSelect(bool)
{
    return false;
}

void VelMenuView::FillClipboard(QModelIndex, Qt::DropAction) { }

QString VelMenuView::dndFormat(const QMimeData *) const
{
    return {};
}

QList<QUrl> VelMenuView::dndUrls(const QMimeData *, const QString &) const
{
    return {};
}

bool VelMenuView::createNew(bool)
{
    return false;
}

bool VelMenuView::fixSortOrderForNew(const QString &, int, const QModelIndex &)
{
    return false;
}

void VelMenuView::fixSortOrderInDir(const QModelIndex &, bool) { }

void VelMenuView::contextMenuEvent(QContextMenuEvent *) { }

void VelMenuView::dropEvent(QDropEvent *) { }

void VelMenuView::setActionsEnabled() { }

void VelMenuView::slotDirNew() { }

void VelMenuView::slotFileNew() { }

bool VelMenuView::slotEdit()
{
    return false;
}

void VelMenuView::slotDel() { }

void VelMenuView::slotExe() { }

void VelMenuView::slotCut() { }

void VelMenuView::slotCopy() { }

void VelMenuView::slotPaste() { }

void VelMenuView::slotUp() { }

void VelMenuView::slotDown() { }

void VelMenuView::slotRecreate() { }

void VelMenuView::slotFind() { }

void VelMenuView::slotFindNext() { }

void VelMenuView::selectionChangedSlot() { }
