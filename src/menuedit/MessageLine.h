// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuVoice.h"

#include <QPointer>
#include <QWidget>

class QAction;
class QLabel;
class QPushButton;

/**
 * One line that tells what was done or what failed, with a button that takes it back.
 *
 * What it tells stays until it tells something else. Screen readers say it at once.
 */
class MessageLine : public QWidget
{
    Q_OBJECT

public:
    explicit MessageLine(QWidget *parent);
    ~MessageLine() override;

    /// Tells \a text in plain text; \a kind as VelMenuView::told() has it. The rest of a step stands below
    /// the note on it.
    void tell(const QString &text, int kind, MenuVoice::Subject subject);
    /// Has the Tab key come by behind \a previous, which takes the keyboard back when the button goes.
    void setTabOrderAfter(QWidget *previous);

    /// What the line says while there is nothing else to tell; may be empty.
    void setRest(const QString &text, int kind);
    /// Goes back to what it says at rest.
    void clear();

    /// The action behind the button, null for none. The button stands beside what tells of the step that the
    /// action would take back.
    void setUndoAction(QAction *action);

private:
    void show(const QString &text, int kind);
    void updateButton();

    QLabel *m_icon;
    QLabel *m_label;
    QPushButton *m_button;
    QPointer<QWidget> m_previous;
    QPointer<QAction> m_undo;
    QString m_restText;
    int m_restKind = 0;
    bool m_isAtRest = true;
    bool m_isUndoable = false;
};
