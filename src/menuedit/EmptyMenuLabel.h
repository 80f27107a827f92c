// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QLabel>
#include <QTimer>

class QTreeView;
class ShownMenu;

/**
 * Says in the middle of the tree why a menu has nothing in it, and how to begin.
 */
class EmptyMenuLabel : public QLabel
{
    Q_OBJECT

public:
    /// On \a view, which shows \a menu already.
    EmptyMenuLabel(QTreeView *view, const ShownMenu &menu);
    ~EmptyMenuLabel() override;

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    bool isEmpty() const;
    void appear();
    void look();

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    QTimer m_patience;
};
