// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ItemTransfer.h"

#include "ClipboardContents.h"
#include "MenuClipboard.h"
#include "MenuVoice.h"
#include "VelMenuModel.h"
#include "WebAddress.h"

#include <frame/QtMajor.h>

#include <QApplication>
#include <QClipboard>
#include <QCoreApplication>
#include <QDropEvent>
#include <QIcon>
#include <QMenu>
#include <QMimeData>
#include <QMouseEvent>
#include <QPersistentModelIndex>
#include <QPointer>
#include <QUrl>

#include <algorithm>

void ItemTransfer::put(const VelMenuModel &files, const QModelIndex &item, Qt::DropAction action)
{
    put(item.isValid() ? QStringList{files.filePath(item)} : QStringList(), action);
}

void ItemTransfer::put(const QStringList &paths, Qt::DropAction action)
{
    QClipboard *clipboard = QGuiApplication::clipboard();
    clipboard->clear();
    if (!paths.isEmpty())
        clipboard->setMimeData(new MenuClipboard::ItemData(paths, action));
}

namespace {

constexpr int ManyMoves = 10; // after which a menu takes any click for one that is meant

/// The menu of a drop. A menu of Qt 6 closes at a click of a mouse that has not moved since it opened, and
/// measures that from where the mouse was last seen: one that drags something of another program is not seen.
class DropMenu : public QMenu
{
public:
    DropMenu(QWidget *view, const QPoint &position)
        : QMenu(view)
        , m_position(position)
    {
    }

protected:
    void mousePressEvent(QMouseEvent *event) override
    {
        const QPointF place = QtMajor::positionOf(*event);
        const QPoint onScreen = mapToGlobal(place.toPoint());
        const int distance = (onScreen - m_position).manhattanLength();
        if (rect().contains(place.toPoint()) && distance > QApplication::startDragDistance()) {
            QMouseEvent move(QEvent::MouseMove, place, place, onScreen, Qt::NoButton, Qt::NoButton,
                             event->modifiers());
            for (int i = 0; i < ManyMoves; ++i)
                mouseMoveEvent(&move);
        }
        QMenu::mousePressEvent(event);
    }

private:
    const QPoint m_position;
};

// Whether what is on the clipboard can be had without a long wait; tells when it cannot.
bool isToBeHad(ClipboardContents *contents, const QModelIndex &item, MenuVoice &voice)
{
    const QPersistentModelIndex place(item);
    const QPointer<MenuVoice> guarded(&voice);
    if (!contents || contents->isAnswered())
        return place.isValid();
    if (guarded)
        voice.tell(QCoreApplication::translate("VelMenuView",
                                               "The program that holds the clipboard does not answer. "
                                               "Nothing was pasted."),
                   MenuVoice::Failure);
    return false;
}

} // namespace

bool ItemTransfer::paste(VelMenuModel &files, const QModelIndex &selected, ClipboardContents *contents,
                         MenuVoice &voice)
{
    const QPersistentModelIndex item(selected);
    if (!item.isValid() || !isToBeHad(contents, item, voice))
        return false;
    const bool isFolder = files.isDir(item);
    const QModelIndex target = isFolder ? QModelIndex(item) : item.parent();
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

// The source believes in what was proposed to it, unless that makes it remove something.
Qt::DropAction ItemTransfer::actionForAddresses(const QDropEvent &drop)
{
    const QList<QUrl> urls = drop.mimeData()->urls();
    if (urls.isEmpty() || !std::all_of(urls.begin(), urls.end(), &WebAddress::isOne))
        return Qt::IgnoreAction;
    if (drop.proposedAction() != Qt::MoveAction)
        return drop.proposedAction();
    return drop.possibleActions() & Qt::CopyAction ? Qt::CopyAction : Qt::LinkAction;
}

Qt::DropAction ItemTransfer::askForDropAction(QWidget *view, const QPoint &position, Qt::DropActions possible)
{
    const QPointer<QMenu> menu(new DropMenu(view, position));
    QAction *const move = menu->addAction(QCoreApplication::translate("VelMenuView", "Move"));
    move->setEnabled(possible & Qt::MoveAction);
    QAction *const copy = menu->addAction(QCoreApplication::translate("VelMenuView", "Copy"));
    copy->setEnabled(possible & Qt::CopyAction);
    menu->addSeparator();
    menu->addAction(QIcon::fromTheme(QStringLiteral("dialog-cancel")),
                    QCoreApplication::translate("VelMenuView", "Cancel"));
    const QAction *chosen = menu->exec(position);
    delete menu;
    if (!chosen)
        return Qt::IgnoreAction;
    return chosen == move ? Qt::MoveAction : chosen == copy ? Qt::CopyAction : Qt::IgnoreAction;
}
