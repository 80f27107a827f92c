// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ChangeButtons.h"
#include "ConflictMessage.h"
#include "EditShortcutsForm.h"
#include "KeyRecording.h"

#include <QKeySequence>
#include <QObject>
#include <QPointer>

class KeyAssistance;
class QDialog;
class QEvent;
class QKeyEvent;
class ShortcutsModel;

/**
 * Follows a key from the field where it is recorded, past those who may have it already, until it
 * is entered or refused.
 *
 * With assistance a recorded key that would be refused waits in the field for as long as the user is
 * about it, neither entered nor refused.
 */
class KeyEntry : public QObject
{
    Q_OBJECT

public:
    /// Works on the \a form of a \a dialog, which shows \a shortcuts, or nothing when that is null.
    KeyEntry(QDialog *dialog, const EditShortcutsForm &form, ShortcutsModel *shortcuts);
    ~KeyEntry() override;

    /// What helps the user, or null; to be set to null before that goes.
    void setAssistance(const KeyAssistance *assistance);

    /// Puts a key into the field without the field announcing it; drops a recording.
    void show(const QKeySequence &key);
    /// Watches a recording: \a event goes to the field, unless this says that it must not.
    bool watch(const QEvent &event);
    /// Enters a key, or refuses it with a message, in which the dialog may go.
    void enter(const QKeySequence &key);
    /// Enters the key that is being recorded; false when it is refused with a message, in which the
    /// dialog may go.
    bool settle();
    /// The user has decided about the recorded key: enters it if it would not be refused any more.
    void reconsider();
    /// Forgets the key that is being recorded.
    void dropKey();
    /// Forgets a message about the last key, too.
    void drop();

    /// Whether there is something to apply.
    bool isChanged() const { return m_buttons.isChanged(); }
    /// Enables or disables the buttons Ok and Reset; they are enabled while a chord is recorded.
    void setChanged(bool changed) { m_buttons.setChanged(changed); }

Q_SIGNALS:
    /// A key is to be the pending one of the current shortcut.
    void entered(const QKeySequence &key);

private:
    bool isEcho(const QKeySequence &key) const;
    bool record(const QKeyEvent &event);
    void moveFocus(const QKeyEvent &event);
    void dropWhatIsNoKey();
    void leaveField(Qt::FocusReason reason);
    void leave(Qt::FocusReason reason);
    void pause();
    bool hold(const QKeySequence &key);
    void endRecording();
    void finish(const QKeySequence &key);
    bool take(const QKeySequence &key);
    bool refuseTaken(const QKeySequence &key);
    void showPendingKey();

    const EditShortcutsForm m_form;
    const QPointer<ShortcutsModel> m_model;
    const KeyAssistance *m_assistance = nullptr;
    KeyRecording m_recording;
    QKeySequence m_settledKey; // the last one that was shown or decided about
    ChangeButtons m_buttons;
    ConflictMessage m_message;
};
