// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QList>
#include <QMenu>
#include <QPersistentModelIndex>
#include <QString>
#include <QStringList>

#include <memory>

class QAction;
class QIcon;
class QKeySequence;
class TreeLoader;
class VelMenuModel;
class VelMenuProxyModel;
class VelMenuView;

/**
 * What a VelMenuView keeps, and the steps that its operations share.
 */
class VelMenuViewPrivate
{
public:
    explicit VelMenuViewPrivate(VelMenuView *view);
    ~VelMenuViewPrivate();

    std::unique_ptr<VelMenuModel> model;
    VelMenuProxyModel *proxy = nullptr;
    QMenu *editMenu = nullptr;
    QAction *cutAction = nullptr;
    QAction *copyAction = nullptr;
    QAction *pasteAction = nullptr;
    QAction *dirNewAction = nullptr;
    QAction *fileNewAction = nullptr;
    QAction *editAction = nullptr;
    QAction *deleteAction = nullptr;
    QAction *executeAction = nullptr;
    QAction *upAction = nullptr;
    QAction *downAction = nullptr;
    QAction *recreateAction = nullptr;
    QAction *findAction = nullptr;
    QAction *findNextAction = nullptr;
    bool editable = false;
    QString findText;
    /// In the sorting model; persistent, as rows come and go between two searches.
    QList<QPersistentModelIndex> findResults;
    int findPos = -1;

    VelMenuView *q = nullptr;
    QString menuDir;
    std::unique_ptr<TreeLoader> loader;
    /// The selected item whose row went although the file is there: its row comes back.
    QString awaited;

    /// Takes models, menu and connections of an earlier init() away.
    void clear();
    /// Builds the file-system model and puts it under the sorting model.
    void buildModel();
    /// Shows the children of the menu directory; none when it does not exist.
    void showRoot();
    /// Keeps track of rows that come and go; runs before the base class sees them.
    void watchRows();
    /// Keeps the base class from selecting a neighbour of the row that goes.
    void leaveRows(const QModelIndex &parent, int first, int last);
    /// Selects the awaited item again once its row is back.
    void selectAwaited();
    /// Hides the root of the file system, which an invalid root index would show.
    void hideTopLevel();

    void buildActions();
    void buildEditActions();
    void buildOtherActions();
    template <typename Slot>
    QAction *addAction(const char *name, const QIcon &icon, const QString &text, Slot slot,
                       const QKeySequence &key);
    void makeEditable();

    /// The item of the sorting model for \a path; invalid unless it lies below the menu directory.
    QModelIndex proxyIndex(const QString &path) const;
    /// Selects \a index of the sorting model alone; the keyboard goes on from there.
    void selectOnly(const QModelIndex &index);
    void clearSelection();
    /// Selects the match at findPos and brings it into sight.
    void showMatch();
    /// The matches below the root, in the order shown.
    QModelIndexList matches() const;
    /// Goes on to the next match that is still there; false when there is none.
    bool showNextMatch();

    void moveSelected(bool up);
    /// Writes the record of a new item; false when it cannot be saved.
    bool writeNew(const QString &path, bool folder, const QString &number);
    /// Opens the editor on a new item and takes the item away again unless it is accepted.
    bool offerNew(const QString &path, bool folder);
    /// Opens the editor on the item at \a path; whether it was saved.
    bool edit(const QString &path);
    /// Clears the selection, and puts the keyboard beside the item at \a path, which is about to go.
    void leaveItem(const QString &path);
};
