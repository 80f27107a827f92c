// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ItemTransfer.h"

#include "MenuClipboard.h"
#include "VelMenuModel.h"

#include <QClipboard>
#include <QCoreApplication>
#include <QGuiApplication>
#include <QIcon>
#include <QMenu>
#include <QPointer>

void ItemTransfer::put(const VelMenuModel &files, const QModelIndex &item, Qt::DropAction action)
{
    QClipboard *clipboard = QGuiApplication::clipboard();
    clipboard->clear();
    if (item.isValid())
        clipboard->setMimeData(new MenuClipboard::ItemData(files.filePath(item), action));
}

bool ItemTransfer::paste(VelMenuModel &files, const QModelIndex &item)
{
    if (!item.isValid())
        return false;
    const bool isFolder = files.isDir(item);
    const QModelIndex target = isFolder ? item : item.parent();
    const int row = isFolder ? -1 : item.row();
    const int column = isFolder ? -1 : item.column();

    QClipboard *clipboard = QGuiApplication::clipboard();
    const QMimeData *mimeData = clipboard->mimeData();
    const QString format = MenuClipboard::format(mimeData);
    if (!target.isValid() || format.isEmpty())
        return false;
    const Qt::DropAction action = format.contains(QLatin1String("move")) ? Qt::MoveAction : Qt::CopyAction;
    if (!files.dropMimeData(mimeData, action, row, column, target) || action != Qt::MoveAction)
        return false;
    clipboard->clear();
    return true;
}

Qt::DropAction ItemTransfer::askForDropAction(QWidget *view, const QPoint &position)
{
    const QPointer<QMenu> menu(new QMenu(view));
    const QAction *move = menu->addAction(QCoreApplication::translate("VelMenuView", "Move"));
    const QAction *copy = menu->addAction(QCoreApplication::translate("VelMenuView", "Copy"));
    menu->addSeparator();
    menu->addAction(QIcon::fromTheme(QStringLiteral("dialog-cancel")),
                    QCoreApplication::translate("VelMenuView", "Cancel"));
    const QAction *chosen = menu->exec(position);
    delete menu;
    if (!chosen)
        return Qt::IgnoreAction;
    return chosen == move ? Qt::MoveAction : chosen == copy ? Qt::CopyAction : Qt::IgnoreAction;
}
