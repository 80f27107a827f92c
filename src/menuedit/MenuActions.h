// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ClipboardContents.h"

#include "ActionState.h"

#include <QModelIndexList>
#include <QVector>

#include <memory>

class QAction;
class QMenu;
class QWidget;
class ShownMenu;

/**
 * The edit actions of a view and the menu that holds them: what they are called, their keys and
 * when they are enabled. Whoever makes them connects them.
 */
class MenuActions
{
public:
    enum Action {
        NewFolder,
        NewEntry,
        Edit,
        Delete,
        Execute,
        Find,
        FindNext,
        Cut,
        Copy,
        Paste,
        Recreate,
        Up,
        Down,
    };

    /// Makes the menu and adds its actions to \a view as well, with one to recreate the menu for
    /// the start menu only.
    MenuActions(QWidget *view, bool isStartMenu);
    ~MenuActions();
    MenuActions(const MenuActions &) = delete;
    MenuActions &operator=(const MenuActions &) = delete;

    QMenu *menu() const { return m_menu.get(); }
    /// Null for what is not offered.
    QAction *action(Action which) const { return m_actions.at(which); }

    /// Whether Up and Down have keys of their own, and all texts a letter to choose them by in the menu.
    void setAssisted(bool assisted);

    /// What of the clipboard Paste depends on.
    ClipboardContents &clipboard() { return m_clipboard; }

    /// Enables what makes sense for \a item of the file model, or without one, where the \a rows of
    /// the sorting model are selected.
    void update(const ShownMenu &menu, const QModelIndex &item, const QModelIndexList &rows);

private:
    void add(QWidget *view, Action which);
    void enable(Action which, bool isEnabled);

    ClipboardContents m_clipboard;
    std::unique_ptr<QMenu> m_menu;
    QVector<QAction *> m_actions;
};
