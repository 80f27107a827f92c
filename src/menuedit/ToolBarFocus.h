// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>

class QToolBar;

/**
 * Lets the keyboard reach the buttons of a tool bar for as long as it exists: by Tab, and Return and
 * Enter press the one that they are on, not the default button of the dialog.
 */
class ToolBarFocus : public QObject
{
    Q_OBJECT

public:
    /// The buttons of \a toolBar come before \a next.
    ToolBarFocus(QToolBar *toolBar, QWidget *next);
    ~ToolBarFocus() override;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QToolBar *const m_toolBar;
};
