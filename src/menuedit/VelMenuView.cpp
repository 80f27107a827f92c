// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuView.h"

#include "EntryExecution.h"
#include "ItemTransfer.h"
#include "MenuClipboard.h"
#include "MenuReordering.h"
#include "StartMenu.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"
#include "VelMenuViewPrivate.h"

#include <frame/QtMajor.h>

#include <QContextMenuEvent>
#include <QDropEvent>
#include <QKeyEvent>
#include <QMenu>
#include <QPointer>

VelMenuView::VelMenuView(QWidget *parent)
    : VelMenuView(QString(), -1, false, parent)
{
}

VelMenuView::VelMenuView(const QString &menuDir, int iconSize, bool editable, QWidget *parent)
    : QTreeView(parent)
{
    init(menuDir, iconSize, editable, parent);
}

VelMenuView::~VelMenuView()
{
    EntryExecution::release(this);
    d.reset();
}

void VelMenuView::init(const QString &menuDir, int iconSize, bool editable, QWidget *parent)
{
    if (parent && parent != parentWidget())
        setParent(parent);
    const bool isAssisted = d && d->isAssisted;
    d.reset(new VelMenuViewPrivate(this, menuDir, editable));

    setDefaultDropAction(Qt::MoveAction);
    setHeaderHidden(true);
    setUniformRowHeights(true);
    if (iconSize != -1)
        setIconSize(QSize(iconSize, iconSize));
    setDragDropMode(editable ? QAbstractItemView::DragDrop : QAbstractItemView::NoDragDrop);
    d->show();
    d->setAssisted(isAssisted);
}

bool VelMenuView::assistance() const
{
    return d->isAssisted;
}

void VelMenuView::setAssistance(bool assistance)
{
    d->setAssisted(assistance);
}

QAction *VelMenuView::undoAction() const
{
    return d->history.undoAction();
}

QAction *VelMenuView::redoAction() const
{
    return d->history.redoAction();
}

QString VelMenuView::menuDir() const
{
    return d->menu.directory();
}

QModelIndex VelMenuView::selectedItem() const
{
    return d->selection.item();
}

QString VelMenuView::selectedPath() const
{
    return d->selection.path();
}

void VelMenuView::setMenuDir(const QString &menuDir)
{
    if ((menuDir.isEmpty() ? StartMenu::directory() : menuDir) != this->menuDir())
        init(menuDir, -1, isEditable(), nullptr);
}

int VelMenuView::itemIconSize() const
{
    return iconSize().width();
}

void VelMenuView::setItemIconSize(int size)
{
    setIconSize(size < 0 ? QSize() : QSize(size, size));
}

bool VelMenuView::isEditable() const
{
    return d->menu.isEditable();
}

void VelMenuView::setEditable(bool editable)
{
    if (editable != isEditable())
        init(menuDir(), -1, editable, nullptr);
}

void VelMenuView::showAndSelect(const QString &path)
{
    d->selection.show(path);
}

void VelMenuView::selectionChangedSlot()
{
    d->tellSelection();
}

void VelMenuView::setActionsEnabled()
{
    if (d->actions)
        d->actions->update(d->menu, selectedItem(), d->selectedRows());
}

void VelMenuView::contextMenuEvent(QContextMenuEvent *event)
{
    if (!d->actions || !selectionModel()) {
        event->ignore();
        return;
    }
    setActionsEnabled();
    d->actions->menu()->exec(event->globalPos());
}

void VelMenuView::clearFindResults()
{
    d->find.clear();
}

bool VelMenuView::findAndSelect(bool next)
{
    return d->find.find(next);
}

void VelMenuView::slotFind()
{
    d->find.ask();
}

void VelMenuView::slotFindNext()
{
    if (d->filter.isOn())
        d->filter.selectNext();
    else
        findAndSelect(true);
}

void VelMenuView::setFilter(const QString &text)
{
    if (!d->isAssisted)
        return;
    const QPointer<VelMenuView> self(this);
    d->filter.setText(text);
    if (self)
        setActionsEnabled();
}

void VelMenuView::setHiddenShown(bool shown)
{
    if (d->isAssisted)
        d->setHiddenShown(shown);
}

bool VelMenuView::createNew(bool folder)
{
    return d->editing.createNew(folder ? FreeName::Kind::Folder : FreeName::Kind::Entry);
}

void VelMenuView::slotDirNew()
{
    createNew(true);
}

void VelMenuView::slotFileNew()
{
    createNew(false);
}

bool VelMenuView::slotEdit()
{
    return !d->hasSeveral() && d->editing.edit(selectedPath());
}

void VelMenuView::slotDel()
{
    d->removeSelected();
}

bool VelMenuView::fixSortOrderForNew(const QString &name, int row, const QModelIndex &folder)
{
    return MenuReordering::list(d->menu, d->voice, name, row, folder);
}

void VelMenuView::fixSortOrderInDir(const QModelIndex &item, bool up)
{
    MenuReordering::move(d->menu, d->voice, item, up);
}

void VelMenuView::invalidateSortOrder(const QModelIndex &sourceIndex)
{
    d->menu.proxy().invalidateSortOrder(d->menu.files().filePath(sourceIndex));
}

void VelMenuView::slotUp()
{
    d->moving.move(true);
}

void VelMenuView::slotDown()
{
    d->moving.move(false);
}

void VelMenuView::FillClipboard(QModelIndex item, Qt::DropAction action)
{
    ItemTransfer::put(d->menu.files(), item, action);
}

void VelMenuView::slotCut()
{
    d->putSelected(Qt::MoveAction);
}

void VelMenuView::slotCopy()
{
    d->putSelected(Qt::CopyAction);
}

void VelMenuView::slotPaste()
{
    const QPointer<VelMenuView> self(this);
    ClipboardContents *const clipboard = d->actions ? &d->actions->clipboard() : nullptr;
    if (ItemTransfer::paste(d->menu.files(), selectedItem(), clipboard, d->voice) && self)
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

void VelMenuView::keyPressEvent(QKeyEvent *event)
{
    // The base copies the name of the item that the keyboard is on, whether or not it is selected.
    if (event->matches(QKeySequence::Copy) && (d->menu.isEditable() || !selectedItem().isValid())) {
        event->ignore();
        return;
    }
    // At the end of its folder an item stays selected: the next press would move another one.
    if (d->isKeyToMove(*event)) {
        event->accept();
        return;
    }
    const QPointer<VelMenuView> self(this);
    QTreeView::keyPressEvent(event);
    // What the base ignores would go on to the default button of a dialog.
    if (!event->isAccepted() && self && d->takeKey(*event))
        event->accept();
}

void VelMenuView::dropEvent(QDropEvent *event)
{
    const QPointer<VelMenuView> self(this);
    Qt::DropAction action = d->isAssisted ? ItemTransfer::actionForAddresses(*event) : Qt::IgnoreAction;
    if (action == Qt::IgnoreAction)
        action = ItemTransfer::askForDropAction(
            this, viewport()->mapToGlobal(QtMajor::positionOf(*event).toPoint()), event->possibleActions());
    if (!self)
        return;
    event->setDropAction(action);
    QTreeView::dropEvent(event);
    if (event->isAccepted() && self) {
        // The base tells the source the action that was proposed, not the one carried out. In place
        // of one that the source does not allow, the event takes the proposed one both times.
        event->setDropAction(action);
        event->accept();
    }
}

void VelMenuView::slotExe()
{
    const QString path = selectedPath();
    if (path.isEmpty() || d->hasSeveral())
        return;
    if (d->isAssisted)
        d->execute(path);
    else
        EntryExecution::start(this, path);
}

void VelMenuView::slotRecreate()
{
    d->recreate();
}
