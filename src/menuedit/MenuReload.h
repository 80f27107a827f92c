// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QStringList>

#include <functional>
#include <memory>

class MenuSelection;
class QAction;
class QMenu;
class QTreeView;
class ShownMenu;

/**
 * Reading a menu anew from disk: a command with a key, for what changed where nobody could see it
 * change.
 */
class MenuReload : public QObject
{
    Q_OBJECT

public:
    /// For \a view, which \a showAnew has build its rows from nothing.
    MenuReload(QTreeView *view, const ShownMenu &menu, MenuSelection &selection,
               std::function<void()> showAnew);
    ~MenuReload() override;

    /// Whether there is the command; it stands at the end of \a menu, too, if that is not null.
    void setOn(bool on, QMenu *menu);

    /// Reads everything anew; what was selected and opened stays so where it is still there.
    void reload();

private:
    QStringList selectedItems() const;
    void selectAgain(const QStringList &paths);

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    const std::function<void()> m_showAnew;
    std::unique_ptr<QAction> m_action;
    std::unique_ptr<QAction> m_separator;
};
