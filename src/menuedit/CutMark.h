// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>

class QTreeView;
class ShownMenu;

/**
 * Dims what was cut in a menu for as long as it waits on the clipboard.
 */
class CutMark : public QObject
{
    Q_OBJECT

public:
    /// For the rows of \a menu in \a view. Off at first.
    CutMark(QTreeView *view, const ShownMenu &menu);
    ~CutMark() override;

    void setOn(bool on);

private:
    void look();

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    bool m_isOn = false;
};
