// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsDialog.h"

#include "EditShortcutsDialogPrivate.h"
#include "KeySequences.h"
#include "ShortcutConflict.h"
#include "ShortcutsModel.h"
#include "ShortcutsTreeView.h"

#include <QCloseEvent>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QKeyEvent>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QMessageBox>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>

EditShortcutsDialog::EditShortcutsDialog(ShortcutsModel *model, QWidget *parent)
    : QDialog(parent)
    , d(new EditShortcutsDialogPrivate(this, model))
{
    d->buildForm();
    d->fillTree();
    d->connectKeys();
    setChanged(false);
    connect(d->buttonBox, &QDialogButtonBox::clicked, this, &EditShortcutsDialog::processButtonBox);
    connect(d->buttonBox, &QDialogButtonBox::rejected, this, &EditShortcutsDialog::slotReject);
    connect(d->buttonBox, &QDialogButtonBox::accepted, this, &EditShortcutsDialog::slotAccept);
}

EditShortcutsDialog::~EditShortcutsDialog()
{
    // A model that is a child of the dialog goes after this.
    if (d->model)
        d->model->disconnect(this);
}

void EditShortcutsDialog::setChanged(bool changed)
{
    d->buttonBox->button(QDialogButtonBox::Ok)->setEnabled(changed);
    d->buttonBox->button(QDialogButtonBox::Reset)->setEnabled(changed);
}

// NOLINTNEXTLINE(performance-unnecessary-value-param)
void EditShortcutsDialog::checkCurrentShortcut(QKeySequence defKS, QKeySequence currentKS)
{
    d->groupBox->setEnabled(true);
    const QString defaultText = defKS.toString(QKeySequence::PortableText);
    d->defaultKeyLabel->setText(defaultText.isEmpty() ? tr("None") : defaultText);
    d->defaultKeyRB->setAccessibleDescription(d->defaultKeyLabel->text());
    d->showKey(currentKS);
    if (defKS == currentKS) {
        const QSignalBlocker blocker(d->defaultKeyRB);
        d->defaultKeyRB->setChecked(true);
        d->showKey(QKeySequence());
    } else {
        d->customKeyRB->setChecked(true);
    }
}

void EditShortcutsDialog::disableShortcutEdit()
{
    d->groupBox->setEnabled(false);
}

// NOLINTNEXTLINE(performance-unnecessary-value-param)
void EditShortcutsDialog::checkEnteredKeySequence(QKeySequence key)
{
    if ((key.isEmpty() && d->isRecording) || key == d->treeView->currentKeySequence() || !d->model)
        return;
    if (!KeySequences::isKnown(key)) {
        // A key of the keyboard that Qt has no name for.
        d->showKey(d->treeView->currentKeySequence());
        return;
    }
    d->isRecording = false;
    const ShortcutConflict conflict = ShortcutConflict::find(*d->model, key);
    if (conflict.kind != ShortcutConflict::None) {
        const QPointer<EditShortcutsDialog> guard(this);
        d->reportConflict(conflict, key);
        if (guard)
            d->showKey(d->treeView->currentKeySequence());
        return;
    }
    if (!d->treeView->isShortcutCurrent()) {
        // A recording that outlived its row.
        d->showKey(QKeySequence());
        return;
    }
    d->setPendingKey(key);
}

void EditShortcutsDialog::setDefaultShortcut()
{
    if (!d->defaultKeyRB->isChecked())
        return;
    d->showKey(QKeySequence());
    d->setPendingKey(d->shownDefaultKey());
}

void EditShortcutsDialog::processButtonBox(QAbstractButton *button)
{
    if (!d->model)
        return;
    QPushButton *restoreButton = d->buttonBox->button(QDialogButtonBox::RestoreDefaults);
    switch (d->buttonBox->standardButton(button)) {
    case QDialogButtonBox::RestoreDefaults:
        d->model->restoreDefaults();
        setChanged(true);
        restoreButton->setEnabled(false);
        break;
    case QDialogButtonBox::Reset:
        d->model->resetShortcuts();
        setChanged(false);
        restoreButton->setEnabled(true);
        break;
    default:
        break;
    }
}

void EditShortcutsDialog::slotAccept()
{
    const QPointer<EditShortcutsDialog> guard(this);
    if (d->model)
        d->model->commitChanges();
    // The host hears of its new keys and may close its windows, this one too.
    if (!guard)
        return;
    setChanged(false);
    accept();
}

void EditShortcutsDialog::slotReject()
{
    if (d->model)
        d->model->resetShortcuts();
    setChanged(false);
    reject();
}

void EditShortcutsDialog::reject()
{
    if (d->isChanged())
        slotReject(); // which comes back here, unchanged
    else
        QDialog::reject();
}

void EditShortcutsDialog::closeEvent(QCloseEvent *event)
{
    if (d->isChanged()) {
        const QPointer<EditShortcutsDialog> guard(this);
        const QMessageBox::StandardButton answer = d->askWhetherToApply();
        if (answer == QMessageBox::Yes) {
            slotAccept();
        } else if (answer == QMessageBox::No) {
            slotReject();
        } else {
            event->ignore(); // also when the dialog went with its message
            return;
        }
        if (!guard)
            return;
    }
    QDialog::closeEvent(event);
}

void EditShortcutsDialog::keyPressEvent(QKeyEvent *event)
{
    if (event->matches(QKeySequence::Cancel))
        slotReject();
    else
        QDialog::keyPressEvent(event);
}

bool EditShortcutsDialog::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == d->keyWidget && event->type() == QEvent::KeyPress) {
        d->isRecording = true;
    } else if (watched == d->keyWidget && event->type() == QEvent::FocusOut
               && static_cast<QFocusEvent *>(event)->reason() != Qt::PopupFocusReason) {
        // The editor itself would wait a second for one more chord, while the user goes on to
        // another row or to Ok.
        d->endRecording();
    }
    return QDialog::eventFilter(watched, event);
}
