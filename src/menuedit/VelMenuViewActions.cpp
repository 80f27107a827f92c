// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionState.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"
#include "VelMenuView.h"
#include "VelMenuViewPrivate.h"

#include <velcore/dirs.h>

#include <QAction>
#include <QClipboard>
#include <QFileInfo>
#include <QGuiApplication>
#include <QIcon>

namespace {

QIcon themeIcon(const char *name)
{
    return QIcon::fromTheme(QLatin1String(name));
}

} // namespace

template <typename Slot>
QAction *VelMenuViewPrivate::addAction(const char *name, const QIcon &icon, const QString &text, Slot slot,
                                       const QKeySequence &key)
{
    QAction *action = editMenu->addAction(icon, text, q, slot, key);
    action->setObjectName(QLatin1String(name));
    // Space must go on to press the buttons around the tree.
    action->setShortcutContext(Qt::WidgetShortcut);
    q->addAction(action);
    return action;
}

void VelMenuViewPrivate::buildActions()
{
    editMenu = new QMenu(VelMenuView::tr("Edit"), q);
    buildEditActions();
    editMenu->addSeparator();
    buildOtherActions();
}

void VelMenuViewPrivate::buildEditActions()
{
    dirNewAction = addAction("dirNewAction", themeIcon("folder-new"), VelMenuView::tr("New folder"),
                             &VelMenuView::slotDirNew, {});
    fileNewAction = addAction("fileNewAction", themeIcon("document-new"), VelMenuView::tr("New entry"),
                              &VelMenuView::slotFileNew, QKeySequence::New);
    editAction = addAction("editAction", themeIcon("document-properties"), VelMenuView::tr("Edit"),
                           &VelMenuView::slotEdit, Qt::Key_Space);
    deleteAction = addAction("deleteAction", themeIcon("edit-delete"), VelMenuView::tr("Delete"),
                             &VelMenuView::slotDel, QKeySequence::Delete);
    editMenu->addSeparator();
    executeAction = addAction("executeAction", QIcon(), VelMenuView::tr("Execute"), &VelMenuView::slotExe,
                              QKeySequence(QStringLiteral("Ctrl+E")));
    findAction = addAction("findAction", themeIcon("edit-find"), VelMenuView::tr("Find"),
                           &VelMenuView::slotFind, QKeySequence::Find);
    findNextAction = addAction("findNextAction", QIcon(), VelMenuView::tr("Find Next"),
                               &VelMenuView::slotFindNext, QKeySequence::FindNext);
}

void VelMenuViewPrivate::buildOtherActions()
{
    cutAction = addAction("cutAction", themeIcon("edit-cut"), VelMenuView::tr("Cut"), &VelMenuView::slotCut,
                          QKeySequence::Cut);
    copyAction = addAction("copyAction", themeIcon("edit-copy"), VelMenuView::tr("Copy"),
                           &VelMenuView::slotCopy, QKeySequence::Copy);
    pasteAction = addAction("pasteAction", themeIcon("edit-paste"), VelMenuView::tr("Paste"),
                            &VelMenuView::slotPaste, QKeySequence::Paste);
    editMenu->addSeparator();
    if (menuDir == QString::fromStdString(GetVelDir(VelDir::StartMenu)))
        recreateAction = addAction("recreateAction", themeIcon("velmenuedit"),
                                   VelMenuView::tr("Default menu..."), &VelMenuView::slotRecreate, {});
    editMenu->addSeparator();
    upAction = addAction("upAction", themeIcon("go-up"), VelMenuView::tr("Up"), &VelMenuView::slotUp, {});
    downAction =
        addAction("downAction", themeIcon("go-down"), VelMenuView::tr("Down"), &VelMenuView::slotDown, {});
}

void VelMenuViewPrivate::makeEditable()
{
    buildActions();
    q->setActionsEnabled();
    QObject::connect(q, &QAbstractItemView::doubleClicked, q, &VelMenuView::slotEdit);
    QObject::connect(QGuiApplication::clipboard(), &QClipboard::dataChanged, editMenu,
                     [this] { q->setActionsEnabled(); });
    q->setDropIndicatorShown(true);
}

void VelMenuView::setActionsEnabled()
{
    if (!d->editable)
        return;
    const QModelIndex item = selectedItem();
    const QModelIndex shown = d->proxy->mapFromSource(item);
    ActionState::Selection selection;
    selection.any = item.isValid();
    if (selection.any) {
        const QFileInfo info(d->model->filePath(item));
        selection.writable = QFileInfo(info.isDir() ? info.filePath() : info.absolutePath()).isWritable();
        selection.filesOnClipboard = !dndFormat(QGuiApplication::clipboard()->mimeData()).isEmpty();
        selection.row = shown.row();
        selection.count = d->proxy->rowCount(shown.parent());
    }

    const ActionState state = ActionState::of(selection);
    d->dirNewAction->setEnabled(state.create);
    d->fileNewAction->setEnabled(state.create);
    for (QAction *action : {d->editAction, d->deleteAction, d->executeAction, d->cutAction, d->copyAction})
        action->setEnabled(state.edit);
    d->pasteAction->setEnabled(state.paste);
    d->upAction->setEnabled(state.up);
    d->downAction->setEnabled(state.down);
    if (d->recreateAction)
        d->recreateAction->setEnabled(true);
}
