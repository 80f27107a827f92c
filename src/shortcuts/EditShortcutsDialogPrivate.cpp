// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsDialogPrivate.h"

#include "KeySequences.h"
#include "ShortcutConflict.h"
#include "ShortcutsTreeView.h"

#include <QApplication>
#include <QDialog>
#include <QDialogButtonBox>
#include <QFocusEvent>
#include <QGroupBox>
#include <QKeyEvent>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>

EditShortcutsDialogPrivate::EditShortcutsDialogPrivate(QDialog *dialog, ShortcutsModel *shortcuts)
    : form(dialog)
    , m_dialog(dialog)
    , m_model(shortcuts)
    , m_buttons(form.buttonBox)
    , m_message(dialog)
{
    fillTree();
    setChanged(false);
    connectKeys();
}

void EditShortcutsDialogPrivate::setAssistance(bool isOn)
{
    assistance = isOn ? std::make_unique<EditShortcutsAssistance>(form, m_model) : nullptr;
    if (isOn)
        QObject::connect(assistance.get(), &EditShortcutsAssistance::keysChanged, &m_context,
                         [this] { setChanged(true); });
}

void EditShortcutsDialogPrivate::fillTree()
{
    form.treeView->setModel(m_model);
    form.treeView->expandAll();
    form.treeView->resizeColumnToContents(0);
}

void EditShortcutsDialogPrivate::connectKeys()
{
    QObject::connect(form.treeView, &ShortcutsTreeView::currentShortcutChanged, &m_context,
                     [this](const QKeySequence &defaultKey, const QKeySequence &pendingKey) {
                         showShortcut(defaultKey, pendingKey);
                     });
    QObject::connect(form.treeView, &ShortcutsTreeView::currentItemIsNotShortcut, &m_context,
                     [this] { showNoShortcut(); });
    if (m_model)
        QObject::connect(m_model, &QObject::destroyed, &m_context, [this] {
            showNoShortcut();
            setChanged(false);
        });

    QObject::connect(form.keyWidget, &QKeySequenceEdit::keySequenceChanged, &m_context,
                     [this](const QKeySequence &key) { enterKey(QKeySequence(key)); });
    QObject::connect(form.keyWidget, &QKeySequenceEdit::editingFinished, &m_context, [this] { settle(); });
    // Meanwhile the host may have given the shortcut another key, or none.
    QObject::connect(&m_message, &ConflictMessage::closed, &m_context, [this] { dropKey(); });
    QObject::connect(form.defaultKeyRB, &QRadioButton::toggled, &m_context, [this] { enterDefaultKey(); });
    // Last: the dialog takes events as soon as it has this object.
    form.keyWidget->installEventFilter(m_dialog);
}

void EditShortcutsDialogPrivate::showShortcut(const QKeySequence &defaultKey, const QKeySequence &pendingKey)
{
    form.groupBox->setEnabled(true);
    const QString defaultText = defaultKey.toString(QKeySequence::PortableText);
    form.defaultKeyLabel->setText(defaultText.isEmpty() ? tr("None") : defaultText);
    form.defaultKeyRB->setAccessibleDescription(form.defaultKeyLabel->text());
    showKey(pendingKey);
    if (defaultKey == pendingKey) {
        const QSignalBlocker blocker(form.defaultKeyRB);
        form.defaultKeyRB->setChecked(true);
        showKey(QKeySequence());
    } else {
        form.customKeyRB->setChecked(true);
    }
}

void EditShortcutsDialogPrivate::showNoShortcut()
{
    dropRecording();
    form.groupBox->setEnabled(false);
}

// Puts a key into the key editor without the editor announcing it; drops a recording.
void EditShortcutsDialogPrivate::showKey(const QKeySequence &key)
{
    if (m_recording.hasChord())
        m_buttons.setRecording(false);
    m_recording.stop();
    const QSignalBlocker blocker(form.keyWidget);
    form.keyWidget->setKeySequence(key);
}

bool EditShortcutsDialogPrivate::watchKeyEditor(const QEvent &event)
{
    if (event.type() == QEvent::KeyPress || event.type() == QEvent::KeyRelease)
        return record(static_cast<const QKeyEvent &>(event));
    if (event.type() == QEvent::FocusOut)
        leaveKeyEditor(static_cast<const QFocusEvent &>(event).reason());
    return false;
}

bool EditShortcutsDialogPrivate::record(const QKeyEvent &event)
{
    const bool isWithheld = m_recording.withholds(event);
    m_buttons.setRecording(m_recording.hasChord());
    return isWithheld;
}

// The editor itself would wait a second for one more chord, while the user goes on to another
// row or to Ok.
void EditShortcutsDialogPrivate::leaveKeyEditor(Qt::FocusReason reason)
{
    if (reason == Qt::PopupFocusReason)
        return;
    if (QApplication::focusWidget() == form.buttonBox->button(QDialogButtonBox::Cancel)) {
        dropRecording();
        return;
    }
    endRecording();
    if (reason == Qt::MouseFocusReason)
        m_message.showLater();
    else
        m_message.show();
}

// Takes the key recorded so far; when there is none, the editor shows the old one again.
void EditShortcutsDialogPrivate::endRecording()
{
    if (!m_recording.isActive())
        return;
    if (m_recording.hasChord() && form.treeView->isShortcutCurrent())
        finish(form.keyWidget->keySequence());
    else
        dropKey();
}

void EditShortcutsDialogPrivate::enterKey(const QKeySequence &key)
{
    // What the editor announces when a recording begins.
    if (key.isEmpty() && m_recording.isActive())
        return;
    finish(key);
    m_message.show();
}

// Nothing is enabled and disabled on the way: a button that has the focus would lose it.
void EditShortcutsDialogPrivate::finish(const QKeySequence &key)
{
    m_recording.stop();
    const bool isTaken = m_model && key != form.treeView->currentKeySequence() && takeKey(key);
    m_buttons.setRecording(false);
    if (!isTaken)
        dropKey();
}

bool EditShortcutsDialogPrivate::settle()
{
    endRecording();
    return m_message.show();
}

void EditShortcutsDialogPrivate::dropRecording()
{
    m_message.clear();
    if (m_recording.isActive())
        dropKey();
}

void EditShortcutsDialogPrivate::dropKey()
{
    showKey(form.treeView->currentKeySequence());
}

// Makes a key the pending one, unless a message or nothing at all has to say why not.
bool EditShortcutsDialogPrivate::takeKey(const QKeySequence &key)
{
    // Not a key that Qt has no name for; and a recording may have outlived its row.
    if (!KeySequences::survivesSaving(key) || refuseTakenKey(key) || !form.treeView->isShortcutCurrent())
        return false;
    setPendingKey(key);
    return true;
}

bool EditShortcutsDialogPrivate::refuseTakenKey(const QKeySequence &key)
{
    const ShortcutConflict conflict = ShortcutConflict::find(*m_model, key);
    if (conflict.kind == ShortcutConflict::None)
        return false;
    m_message.refuse(key, conflict);
    return true;
}

void EditShortcutsDialogPrivate::enterDefaultKey()
{
    if (!form.defaultKeyRB->isChecked())
        return;
    showKey(QKeySequence());
    setPendingKey(shownDefaultKey());
}

QKeySequence EditShortcutsDialogPrivate::shownDefaultKey() const
{
    const QString text = form.defaultKeyLabel->text();
    if (text == tr("None"))
        return {};
    return KeySequences::fromText(text, QKeySequence::PortableText);
}

// The tree view hands the key to the model and hears of the change from it.
void EditShortcutsDialogPrivate::setPendingKey(const QKeySequence &key)
{
    form.treeView->setKeySequence(key);
    setChanged(true);
    form.buttonBox->button(QDialogButtonBox::RestoreDefaults)->setEnabled(true);
}

bool EditShortcutsDialogPrivate::isChanged() const
{
    return m_model && m_buttons.isChanged();
}

void EditShortcutsDialogPrivate::setChanged(bool changed)
{
    m_buttons.setChanged(changed);
}

void EditShortcutsDialogPrivate::press(QAbstractButton *button)
{
    if (!m_model)
        return;
    QPushButton *restoreButton = form.buttonBox->button(QDialogButtonBox::RestoreDefaults);
    switch (form.buttonBox->standardButton(button)) {
    case QDialogButtonBox::RestoreDefaults:
        m_model->restoreDefaults();
        setChanged(true);
        restoreButton->setEnabled(false);
        break;
    case QDialogButtonBox::Reset:
        m_model->resetShortcuts();
        setChanged(false);
        restoreButton->setEnabled(true);
        break;
    default:
        break;
    }
}

void EditShortcutsDialogPrivate::commit()
{
    if (m_model)
        m_model->commitChanges();
}

void EditShortcutsDialogPrivate::discard()
{
    dropRecording();
    if (m_model)
        m_model->resetShortcuts();
    setChanged(false);
}
