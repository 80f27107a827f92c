// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuActions.h"
#include "MenuEditing.h"
#include "MenuFilter.h"
#include "MenuFind.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "RootWatch.h"
#include "ShownMenu.h"

#include <QTimer>

#include <memory>

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

    VelMenuView *const q;
    /// See VelMenuView::setAssistance().
    bool isAssisted = false;
    MenuVoice voice;
    ShownMenu menu;
    MenuSelection selection;
    MenuFind find;
    MenuFilter filter;
    MenuEditing editing;
    /// Null where the view is only to be looked at.
    std::unique_ptr<MenuActions> actions;

    /// Has the view show the menu.
    void show();
    /// Shows the menu directory after it was replaced.
    void showAnew();
    void moveSelected(bool up);
    /// Does what a key does to the item that the keyboard is on; whether it does anything.
    bool takeKey(const QKeyEvent &event);

private:
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
};
