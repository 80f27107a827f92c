// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuClipboard.h"
#include "VelMenuModel.h"
#include "VelMenuView.h"
#include "VelMenuViewPrivate.h"

#include <QClipboard>
#include <QDropEvent>
#include <QGuiApplication>
#include <QIcon>
#include <QMenu>
#include <QPointer>

void VelMenuView::FillClipboard(QModelIndex item, Qt::DropAction action)
{
    QClipboard *clipboard = QGuiApplication::clipboard();
    clipboard->clear();
    if (item.isValid())
        clipboard->setMimeData(new MenuClipboard::ItemData(d->model->filePath(item), action));
}

void VelMenuView::slotCut()
{
    if (selectedItem().isValid())
        FillClipboard(selectedItem(), Qt::MoveAction);
    setActionsEnabled();
}

void VelMenuView::slotCopy()
{
    if (selectedItem().isValid())
        FillClipboard(selectedItem(), Qt::CopyAction);
    setActionsEnabled();
}

void VelMenuView::slotPaste()
{
    const QModelIndex item = selectedItem();
    if (!item.isValid())
        return;
    const bool isFolder = d->model->isDir(item);
    const QModelIndex target = isFolder ? item : item.parent();
    const int row = isFolder ? -1 : item.row();
    const int column = isFolder ? -1 : item.column();

    QClipboard *clipboard = QGuiApplication::clipboard();
    const QMimeData *mimeData = clipboard->mimeData();
    const QString format = dndFormat(mimeData);
    if (!target.isValid() || format.isEmpty())
        return;
    const Qt::DropAction action = format.contains(QLatin1String("move")) ? Qt::MoveAction : Qt::CopyAction;
    const QPointer<VelMenuView> self(this);
    if (!d->model->dropMimeData(mimeData, action, row, column, target) || action != Qt::MoveAction)
        return;
    clipboard->clear();
    if (self)
        setActionsEnabled();
}

QString VelMenuView::dndFormat(const QMimeData *mimeData) const
{
    return MenuClipboard::format(mimeData);
}

QList<QUrl> VelMenuView::dndUrls(const QMimeData *mimeData, const QString &format) const
{
    return MenuClipboard::urls(mimeData, format);
}

void VelMenuView::dropEvent(QDropEvent *event)
{
    const QPointer<QMenu> menu(new QMenu(this));
    const QAction *move = menu->addAction(tr("Move"));
    const QAction *copy = menu->addAction(tr("Copy"));
    menu->addSeparator();
    menu->addAction(QIcon::fromTheme(QStringLiteral("dialog-cancel")), tr("Cancel"));

    const QPointer<VelMenuView> self(this);
    const QAction *chosen = menu->exec(viewport()->mapToGlobal(event->posF().toPoint()));
    delete menu;
    if (!self)
        return;
    Qt::DropAction action = Qt::IgnoreAction;
    if (chosen)
        action = chosen == move ? Qt::MoveAction : chosen == copy ? Qt::CopyAction : Qt::IgnoreAction;
    event->setDropAction(action);
    QTreeView::dropEvent(event);
    if (event->isAccepted() && self) {
        // The base tells the source the action that was proposed, not the one carried out. In place
        // of one that the source does not allow, the event takes the proposed one both times.
        event->setDropAction(action);
        event->accept();
    }
}
