// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ChangeButtons.h"
#include "ConflictMessage.h"
#include "EditShortcutsAssistance.h"
#include "EditShortcutsForm.h"
#include "KeyRecording.h"
#include "ShortcutsModel.h"

#include <QCoreApplication>
#include <QKeySequence>
#include <QPointer>

#include <memory>

class QAbstractButton;
class QDialog;
class QEvent;
class QKeyEvent;

/**
 * What the shortcuts dialog does with keys: it follows one from the field where it is recorded,
 * past those who may have it already, until it is pending in the model.
 *
 * It is told of what happens on the form by the form itself; the functions are the steps that
 * the slots of the dialog take.
 */
class EditShortcutsDialogPrivate
{
    Q_DECLARE_TR_FUNCTIONS(EditShortcutsDialog)

public:
    /// Builds the form on \a dialog and shows \a shortcuts, which may be null, in it.
    EditShortcutsDialogPrivate(QDialog *dialog, ShortcutsModel *shortcuts);

    /// Whether there is something to apply, and a model that takes it.
    bool isChanged() const;
    /// Enables or disables the buttons Ok and Reset.
    void setChanged(bool changed);

    /// Completes the form, or makes it the plain one again.
    void setAssistance(bool isOn);

    /// Shows the keys of the shortcut that is current.
    void showShortcut(const QKeySequence &defaultKey, const QKeySequence &pendingKey);
    /// No shortcut is current.
    void showNoShortcut();

    /// Watches a recording: \a event goes to the key editor, unless this says that it must not.
    bool watchKeyEditor(const QEvent &event);
    /// Takes the key that is being recorded, before the dialog closes or accepts; false when it
    /// is refused with a message, in which the dialog may go.
    bool settle();
    /// Forgets the key that is being recorded, and a message about the last one.
    void dropRecording();
    /// Makes \a key the pending one of the current shortcut, or refuses it with a message, in
    /// which the dialog may go.
    void enterKey(const QKeySequence &key);
    /// Makes the default key the pending one if that is what the radio buttons say.
    void enterDefaultKey();

    /// Restores the defaults or resets the edits, if \a button stands for that.
    void press(QAbstractButton *button);
    /// Puts the pending keys into force; the dialog may go when the host hears of them.
    void commit();
    /// Throws the edits away.
    void discard();

    const EditShortcutsForm form;
    /// What the form has beyond the plain one; null for nothing.
    std::unique_ptr<EditShortcutsAssistance> assistance;

private:
    void fillTree();
    void connectKeys();
    void showKey(const QKeySequence &key);
    bool record(const QKeyEvent &event);
    void leaveKeyEditor(Qt::FocusReason reason);
    void endRecording();
    void dropKey();
    void finish(const QKeySequence &key);
    bool takeKey(const QKeySequence &key);
    bool refuseTakenKey(const QKeySequence &key);
    void setPendingKey(const QKeySequence &key);
    QKeySequence shownDefaultKey() const;

    QDialog *const m_dialog;
    const QPointer<ShortcutsModel> m_model;
    KeyRecording m_recording;
    ChangeButtons m_buttons;
    ConflictMessage m_message;
    /// Ends the connections: widgets and model may outlive this object.
    const QObject m_context;
};
