// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFormHost.h"
#include "FormState.h"

#include <QObject>
#include <QUndoStack>

class QAction;
class QKeyEvent;

namespace VelUI {

class LanguageRows;

/**
 * Takes back what the user did in the form and does it again: the whole form has one history.
 *
 * What is typed comes back word by word. Loading another entry ends the history.
 */
class FormHistory : public QObject
{
    Q_OBJECT

public:
    /// Remembers what is done in \a form and in the languages of \a rows.
    FormHistory(EntryFormHost &form, LanguageRows &rows);
    ~FormHistory() override;

    /// Good in the form; a window around it may add them to itself.
    QAction *undoAction() const { return m_undo; }
    QAction *redoAction() const { return m_redo; }

    /// The next change is a step of its own, whatever it is.
    void beginStep();

    bool eventFilter(QObject *watched, QEvent *event) override;

Q_SIGNALS:
    /// The form shows again what was loaded.
    void unchanged();

private:
    class Step;

    void makeActions();
    void watchLines();
    void look();
    void start();
    FormState state() const;
    void restore(const FormState &wanted, const FormState &left);
    void showFields(const FormState &wanted);
    void focusChange(const FormState &wanted, const FormState &left);
    bool react(const QKeyEvent &event);
    void showMenu(QWidget *line, const QPoint &place);
    void updateActions();
    QString labelOf(const FormState &before, const FormState &after) const;

    EntryFormHost &m_form;
    LanguageRows &m_rows;
    QUndoStack m_stack;
    QAction *const m_undo;
    QAction *const m_redo;
    FormState m_last;
    bool m_isRestoring = false;
    bool m_beginsStep = true;
};

} // namespace VelUI
