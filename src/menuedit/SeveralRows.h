// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>

class MenuSelection;
class QModelIndex;
class QTreeView;

/**
 * Lets the user select several rows of a tree, by Ctrl, Shift and Ctrl+A, and sees to it that only
 * what can be seen is selected.
 */
class SeveralRows : public QObject
{
    Q_OBJECT

public:
    /// For \a view, whose \a selection it is. Off at first.
    SeveralRows(QTreeView *view, MenuSelection &selection);
    ~SeveralRows() override;

    /// Off, the view selects as it did before, of what was selected the one item that the keyboard is
    /// on. A view that selects several by itself goes on to do so.
    void setOn(bool on);
    bool isOn() const { return m_isOn; }

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void leaveFolder(const QModelIndex &folder);

    QTreeView *const m_view;
    MenuSelection &m_selection;
    bool m_isOn = false;
    bool m_isModeOurs = false;
};
