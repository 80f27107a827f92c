// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EditShortcutsAssistance.h"
#include "EditShortcutsForm.h"
#include "KeyAssistance.h"
#include "KeyEntry.h"
#include "ShortcutsModel.h"

#include <QCoreApplication>
#include <QKeySequence>
#include <QPointer>

#include <memory>

class QAbstractButton;
class QDialog;

/**
 * What the shortcuts dialog does with keys: it shows those of the current shortcut, and makes those
 * pending that the user chooses.
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
    ~EditShortcutsDialogPrivate();
    Q_DISABLE_COPY(EditShortcutsDialogPrivate)

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

    /// Where keys are recorded.
    KeyEntry &entry() { return m_entry; }
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
    void connectAssistance();
    void fillTree();
    void connectKeys();
    void setPendingKey(const QKeySequence &key);
    void noteChange();
    void followKeys();
    void takeKeyAway();
    void goTo(const QString &name);
    void takeOver(const QString &name);
    QKeySequence shownDefaultKey() const;

    QDialog *const m_dialog;
    const QPointer<ShortcutsModel> m_model;
    KeyEntry m_entry;
    std::unique_ptr<KeyAssistance> m_keyAssistance; // null for none
    /// Ends the connections: widgets and model may outlive this object.
    const QObject m_context;
};
