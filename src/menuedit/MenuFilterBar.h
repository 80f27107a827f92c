// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QWidget>

class QLineEdit;
class QCheckBox;
class VelMenuView;

/**
 * The line above a menu that says what of it is shown: the words to filter by, and whether what
 * the menu leaves out is shown.
 *
 * Escape clears the words, wherever in the window the keyboard is. Return and F3 go to the next match,
 * Down goes over to the view.
 */
class MenuFilterBar : public QWidget
{
    Q_OBJECT

public:
    /// Filters \a view; \a parent is the window of both.
    MenuFilterBar(VelMenuView *view, QWidget *parent);
    ~MenuFilterBar() override;

    /// Has the Tab key come by before \a next, behind what it comes by before that now.
    void setTabOrderBefore(QWidget *next);

    /// Gives the line the keyboard, with what is in it selected.
    void focusLine();

    bool eventFilter(QObject *watched, QEvent *event) override;

Q_SIGNALS:
    /// Another text is being looked for.
    void textChanged(const QString &text);

private:
    bool lineKey(int key);
    bool clear();
    void goToView();

    VelMenuView *const m_view;
    QLineEdit *m_line;
    QCheckBox *m_hiddenButton;
};
