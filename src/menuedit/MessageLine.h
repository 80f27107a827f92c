// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

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

    /// Tells \a text in plain text; \a kind as VelMenuView::told() has it.
    void tell(const QString &text, int kind);
    /// Tells \a text below the note that it shows, which can be taken back as before.
    void tellRest(const QString &text, int kind);
    /// Has the Tab key come by behind \a previous.
    void setTabOrderAfter(QWidget *previous);

    /// What the line says while there is nothing else to tell; may be empty.
    void setRest(const QString &text, int kind);
    /// Goes back to what it says at rest.
    void clear();

    /// The action behind the button, null for none. The button stands beside a note that follows on
    /// a change of the action, which is how one tells that there is something to take back.
    void setUndoAction(QAction *action);

private:
    void say(const QString &text, int kind);
    void show(const QString &text, int kind);
    void updateButton();

    QLabel *m_icon;
    QLabel *m_label;
    QPushButton *m_button;
    QPointer<QAction> m_undo;
    QString m_restText;
    int m_restKind = 0;
    bool m_isAtRest = true;
    bool m_isUndoable = false;
    bool m_hasChanged = false; // the action, since something was told last
};
