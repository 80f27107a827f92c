// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsDialogPrivate.h"

#include "KeySequences.h"
#include "ShortcutConflict.h"
#include "ShortcutsTreeView.h"

#include <frame/MessageBox.h>

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
{
    fillTree();
    setChanged(false);
    connectKeys();
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
        QObject::connect(m_model, &QObject::destroyed, &m_context, [this] { showNoShortcut(); });

    QObject::connect(form.keyWidget, &QKeySequenceEdit::keySequenceChanged, &m_context,
                     [this](const QKeySequence &key) { enterKey(key); });
    QObject::connect(form.keyWidget, &QKeySequenceEdit::editingFinished, &m_context,
                     [this] { endRecording(); });
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
    form.groupBox->setEnabled(false);
}

// Puts a key into the key editor without the editor announcing it; ends a recording.
void EditShortcutsDialogPrivate::showKey(const QKeySequence &key)
{
    m_recording.stop();
    const QSignalBlocker blocker(form.keyWidget);
    form.keyWidget->setKeySequence(key);
}

bool EditShortcutsDialogPrivate::watchKeyEditor(const QEvent &event)
{
    if (event.type() == QEvent::KeyPress || event.type() == QEvent::KeyRelease)
        return m_recording.withholds(static_cast<const QKeyEvent &>(event));
    if (event.type() == QEvent::FocusOut
        && static_cast<const QFocusEvent &>(event).reason() != Qt::PopupFocusReason) {
        // The editor itself would wait a second for one more chord, while the user goes on to
        // another row or to Ok.
        endRecording();
    }
    return false;
}

// Takes the key recorded so far; when there is none, the editor shows the old one again.
void EditShortcutsDialogPrivate::endRecording()
{
    if (!m_recording.isActive())
        return;
    const QKeySequence key = form.keyWidget->keySequence();
    const bool hasKey = !key.isEmpty() && form.treeView->isShortcutCurrent();
    showKey(hasKey ? key : form.treeView->currentKeySequence());
    if (hasKey)
        enterKey(key);
}

void EditShortcutsDialogPrivate::enterKey(const QKeySequence &key)
{
    if ((key.isEmpty() && m_recording.isActive()) || key == form.treeView->currentKeySequence() || !m_model)
        return;
    if (!KeySequences::survivesSaving(key)) {
        // A key that Qt has no name for, for instance.
        showKey(form.treeView->currentKeySequence());
        return;
    }
    m_recording.stop();
    const ShortcutConflict conflict = ShortcutConflict::find(*m_model, key);
    if (conflict.kind != ShortcutConflict::None) {
        refuseKey(key, conflict);
        return;
    }
    if (!form.treeView->isShortcutCurrent()) {
        // A recording that outlived its row.
        showKey(QKeySequence());
        return;
    }
    setPendingKey(key);
}

void EditShortcutsDialogPrivate::refuseKey(const QKeySequence &key, const ShortcutConflict &conflict)
{
    const QString text = conflict.kind == ShortcutConflict::Global
        ? tr("Shortcut '%1' is already used for global action '%2'.")
        : tr("Shortcut '%1' is already used for action '%2'. Please try another.");
    const QPointer<QDialog> self(m_dialog);
    MessageBox::show(m_dialog, QMessageBox::Critical, tr("Shortcuts conflict"),
                     text.arg(key.toString(QKeySequence::PortableText), conflict.holder));
    if (self)
        showKey(form.treeView->currentKeySequence());
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
    return form.buttonBox->button(QDialogButtonBox::Ok)->isEnabled();
}

void EditShortcutsDialogPrivate::setChanged(bool changed)
{
    form.buttonBox->button(QDialogButtonBox::Ok)->setEnabled(changed);
    form.buttonBox->button(QDialogButtonBox::Reset)->setEnabled(changed);
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
    if (m_model)
        m_model->resetShortcuts();
    setChanged(false);
}
