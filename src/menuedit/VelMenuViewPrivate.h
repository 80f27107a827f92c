// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CutMark.h"
#include "DragOpening.h"
#include "EmptyMenuLabel.h"
#include "FolderOpening.h"
#include "MenuActions.h"
#include "MenuDeletion.h"
#include "MenuDuplication.h"
#include "MenuEditing.h"
#include "MenuFilter.h"
#include "MenuFind.h"
#include "MenuHiding.h"
#include "MenuHistory.h"
#include "MenuMoving.h"
#include "MenuReload.h"
#include "MenuSelection.h"
#include "MenuSorting.h"
#include "MenuVoice.h"
#include "OpenedFolders.h"
#include "RootWatch.h"
#include "SeveralRows.h"
#include "ShownMenu.h"

#include <QTimer>

#include <memory>

class QAction;
class QKeyEvent;
class VelMenuView;

/**
 * The parts of a VelMenuView on one menu directory, and how they are put together. Each call of
 * VelMenuView::init() makes one anew.
 */
class VelMenuViewPrivate
{
public:
    /// Builds the parts; the \a view shows nothing of them yet.
    VelMenuViewPrivate(VelMenuView *view, const QString &directory, bool isEditable);
    /// Takes the parts away, and the selection and the connections that the view had to them.
    ~VelMenuViewPrivate();
    VelMenuViewPrivate(const VelMenuViewPrivate &) = delete;
    VelMenuViewPrivate &operator=(const VelMenuViewPrivate &) = delete;

    /// How the parts of \a view tell the user.
    static MenuVoice &voiceOf(const VelMenuView &view);
    /// What is selected in \a view.
    static MenuSelection &selectionOf(const VelMenuView &view);
    /// What was done to the menu of \a view.
    static MenuHistory &historyOf(const VelMenuView &view);

    /// Which folders are opened in \a view.
    static OpenedFolders &openedFoldersOf(const VelMenuView &view);

    VelMenuView *const q;
    /// See VelMenuView::setAssistance().
    bool isAssisted = false;
    MenuVoice voice;
    ShownMenu menu;
    MenuSelection selection;
    SeveralRows severalRows;
    MenuFind find;
    MenuFilter filter;
    MenuHistory history;
    MenuHiding hiding;
    MenuMoving moving;
    MenuEditing editing;
    MenuDeletion deletion;
    MenuDuplication duplication;
    MenuSorting sorting;
    FolderOpening folderOpening;
    MenuReload reloading;
    OpenedFolders openedFolders;
    CutMark cutMark;
    DragOpening dragOpening;
    /// Null where there is no assistance, or nothing to begin.
    std::unique_ptr<EmptyMenuLabel> emptyLabel;
    /// Null where the view is only to be looked at.
    std::unique_ptr<MenuActions> actions;
    /// The line under the commands of the history in the menu of the actions.
    std::unique_ptr<QAction> historyEnd;

    /// Switches on or off what goes beyond the plain tree.
    void setAssisted(bool assisted);
    /// Has the view show the menu.
    void show();
    /// Shows the menu directory after it was replaced.
    void showAnew();
    void showReplaced();
    /// Whether the user has selected several items, of which none can be edited or run.
    bool hasSeveral() const { return severalRows.isOn() && selection.isSeveral(); }
    /// All rows that the user has selected, where that may be several.
    QModelIndexList selectedRows() const { return severalRows.isOn() ? selection.all() : QModelIndexList(); }
    /// Puts the selected items on the clipboard.
    void putSelected(Qt::DropAction action);
    /// Tells what is selected now.
    void tellSelection();
    /// Deletes the selected items.
    void removeSelected();
    /// Runs the entry at \a path, and tells why it does not start.
    void execute(const QString &path) const;
    /// Builds the default menu anew.
    void recreate();
    void setHiddenShown(bool isShown);
    /// Does what a key does to the item that the keyboard is on; whether it does anything.
    bool takeKey(const QKeyEvent &event);
    /// Whether \a event is a key to move an item with, which means nothing else even when there is
    /// nothing to move.
    bool isKeyToMove(const QKeyEvent &event) const;

private:
    void setAssistedTree(bool assisted);
    void connectSelection();
    void editCurrent();
    void makeEditable();
    void connectActions();
    void connectRows();
    void connectFiles();
    void showRoot();
    void hideTopLevel();

    RootWatch m_rootWatch;
    // Rows come in many signals; the actions are looked at once afterwards.
    QTimer m_refresh;
    // The path that was told as selected last.
    QString m_told;
};
