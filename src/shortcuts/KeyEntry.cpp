// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyEntry.h"

#include "KeyAssistance.h"
#include "KeySequences.h"
#include "ShortcutConflict.h"
#include "ShortcutsModel.h"
#include "ShortcutsTreeView.h"

#include <QApplication>
#include <QDialogButtonBox>
#include <QFocusEvent>
#include <QKeyEvent>
#include <QKeySequenceEdit>
#include <QPushButton>
#include <QSignalBlocker>

KeyEntry::KeyEntry(QDialog *dialog, const EditShortcutsForm &form, ShortcutsModel *shortcuts)
    : m_form(form)
    , m_model(shortcuts)
    , m_buttons(form.buttonBox)
    , m_message(dialog)
{
    connect(form.keyWidget, &QKeySequenceEdit::keySequenceChanged, this, [this](const QKeySequence &key) {
        if (!isEcho(key) && !hold(key))
            enter(QKeySequence(key));
    });
    connect(form.keyWidget, &QKeySequenceEdit::editingFinished, this, [this] {
        if (m_recording.isActive() && !m_recording.isHeld())
            settle();
    });
    // Meanwhile the host may have given the shortcut another key, or none.
    connect(&m_message, &ConflictMessage::closed, this, &KeyEntry::showPendingKey);
}

KeyEntry::~KeyEntry() = default;

void KeyEntry::setAssistance(const KeyAssistance *assistance)
{
    m_assistance = assistance;
    if (assistance)
        connect(assistance, &KeyAssistance::left, this, [this] {
            if (m_recording.isHeld())
                leave(Qt::MouseFocusReason);
        });
}

void KeyEntry::show(const QKeySequence &key)
{
    if (m_recording.hasChord())
        m_buttons.setRecording(false);
    m_recording.stop();
    m_settledKey = key;
    const QSignalBlocker blocker(m_form.keyWidget);
    m_form.keyWidget->setKeySequence(key);
}

// Qt 6 announces what stands in the field whenever it is left, also when nothing was recorded.
bool KeyEntry::isEcho(const QKeySequence &key) const
{
    return !m_recording.isActive() && key == m_settledKey;
}

bool KeyEntry::watch(const QEvent &event)
{
    if (event.type() == QEvent::KeyPress || event.type() == QEvent::KeyRelease) {
        dropWhatIsNoKey();
        return record(static_cast<const QKeyEvent &>(event));
    }
    if (event.type() != QEvent::FocusOut)
        return false;
    const Qt::FocusReason reason = static_cast<const QFocusEvent &>(event).reason();
    // The recording goes on beside a menu, but the field of Qt 6.4 would end it.
    if (reason == Qt::PopupFocusReason)
        return m_recording.isActive();
    leaveField(reason);
    return false;
}

bool KeyEntry::record(const QKeyEvent &event)
{
    if (event.type() == QEvent::KeyPress && KeyRecording::movesTheFocus(event)
        && event.modifiers() != Qt::NoModifier) {
        moveFocus(event);
        return true;
    }
    const bool isWithheld = m_recording.withholds(event);
    m_buttons.setRecording(m_recording.hasChord());
    return isWithheld;
}

// Since Qt 6.5 the field would record such a key unless it comes without modifiers.
void KeyEntry::moveFocus(const QKeyEvent &event)
{
    const bool isBack = event.key() == Qt::Key_Backtab || (event.modifiers() & Qt::ShiftModifier);
    QKeyEvent bare(QEvent::KeyPress, isBack ? Qt::Key_Backtab : Qt::Key_Tab, Qt::NoModifier);
    QCoreApplication::sendEvent(m_form.keyWidget, &bare);
}

// With Shift the field takes what the key gives without it, which may be a dead key.
void KeyEntry::dropWhatIsNoKey()
{
    if (m_recording.hasChord() && !KeySequences::survivesSaving(m_form.keyWidget->keySequence()))
        showPendingKey();
}

// The field itself would wait a second for one more chord, while the user goes on to another row or
// to Ok.
void KeyEntry::leaveField(Qt::FocusReason reason)
{
    if (m_assistance && (m_assistance->hasFocus() || reason == Qt::ActiveWindowFocusReason))
        pause();
    else
        leave(reason);
}

void KeyEntry::leave(Qt::FocusReason reason)
{
    if (QApplication::focusWidget() == m_form.buttonBox->button(QDialogButtonBox::Cancel)) {
        drop();
        return;
    }
    endRecording();
    if (reason == Qt::MouseFocusReason)
        m_message.showLater();
    else
        m_message.show();
}

// Only what is not refused is decided here: the user is still about the key.
void KeyEntry::pause()
{
    if (!m_recording.hasChord() || !hold(m_form.keyWidget->keySequence()))
        endRecording();
}

// Leaves a key that would be refused in the field, so that the user finds a way out; tells whether
// it is such a key.
bool KeyEntry::hold(const QKeySequence &key)
{
    if (!m_assistance || !m_model || !m_form.treeView->isShortcutCurrent()
        || key == m_form.treeView->currentKeySequence()
        || ShortcutConflict::find(*m_model, key).kind == ShortcutConflict::None)
        return false;
    m_recording.hold();
    m_buttons.setRecording(true);
    // Or the field would take the next chord for a part of it.
    const QSignalBlocker blocker(m_form.keyWidget);
    m_form.keyWidget->setKeySequence(key);
    return true;
}

void KeyEntry::reconsider()
{
    const QKeySequence key = m_form.keyWidget->keySequence();
    if (m_recording.hasChord() && !hold(key))
        finish(key);
}

// Takes the key recorded so far; when there is none, the field shows the old one again.
void KeyEntry::endRecording()
{
    if (!m_recording.isActive())
        return;
    if (m_recording.hasChord() && m_form.treeView->isShortcutCurrent())
        finish(m_form.keyWidget->keySequence());
    else
        showPendingKey();
}

void KeyEntry::enter(const QKeySequence &key)
{
    // What the field announces when a recording begins.
    if (key.isEmpty() && m_recording.isActive())
        return;
    finish(key);
    m_message.show();
}

// Nothing is enabled and disabled on the way: a button that has the focus would lose it.
void KeyEntry::finish(const QKeySequence &key)
{
    m_recording.stop();
    m_settledKey = key;
    const bool isTaken = m_model && key != m_form.treeView->currentKeySequence() && take(key);
    m_buttons.setRecording(false);
    if (!isTaken)
        showPendingKey();
}

bool KeyEntry::settle()
{
    endRecording();
    return m_message.show();
}

void KeyEntry::dropKey()
{
    if (m_recording.isActive())
        showPendingKey();
}

void KeyEntry::drop()
{
    m_message.clear();
    dropKey();
}

void KeyEntry::showPendingKey()
{
    show(m_form.treeView->currentKeySequence());
}

// Makes a key the pending one, unless a message or nothing at all has to say why not.
bool KeyEntry::take(const QKeySequence &key)
{
    // Not a key that Qt has no name for; and a recording may have outlived its row.
    if (!KeySequences::survivesSaving(key) || refuseTaken(key) || !m_form.treeView->isShortcutCurrent())
        return false;
    Q_EMIT entered(key);
    return true;
}

bool KeyEntry::refuseTaken(const QKeySequence &key)
{
    const ShortcutConflict conflict = ShortcutConflict::find(*m_model, key);
    if (conflict.kind == ShortcutConflict::None)
        return false;
    m_message.refuse(key, conflict);
    return true;
}
