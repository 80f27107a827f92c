// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsDialog.h"

#include "EditShortcutsDialogPrivate.h"

#include <frame/MessageBox.h>

#include <QAbstractButton>
#include <QCloseEvent>
#include <QDialogButtonBox>
#include <QKeyEvent>
#include <QKeySequenceEdit>
#include <QPointer>

EditShortcutsDialog::EditShortcutsDialog(ShortcutsModel *model, QWidget *parent)
    : QDialog(parent)
    , d(std::make_unique<EditShortcutsDialogPrivate>(this, model))
{
    const QDialogButtonBox *buttonBox = d->form.buttonBox;
    connect(buttonBox, &QDialogButtonBox::clicked, this, &EditShortcutsDialog::processButtonBox);
    connect(buttonBox, &QDialogButtonBox::rejected, this, &EditShortcutsDialog::slotReject);
    connect(buttonBox, &QDialogButtonBox::accepted, this, &EditShortcutsDialog::slotAccept);
}

EditShortcutsDialog::~EditShortcutsDialog() = default;

bool EditShortcutsDialog::assistance() const
{
    return d->assistance != nullptr;
}

void EditShortcutsDialog::setAssistance(bool assistance)
{
    if (assistance != this->assistance())
        d->setAssistance(assistance);
}

void EditShortcutsDialog::setChanged(bool changed)
{
    d->setChanged(changed);
}

// NOLINTNEXTLINE(performance-unnecessary-value-param)
void EditShortcutsDialog::checkCurrentShortcut(QKeySequence defKS, QKeySequence currentKS)
{
    d->showShortcut(defKS, currentKS);
}

void EditShortcutsDialog::disableShortcutEdit()
{
    d->showNoShortcut();
}

// NOLINTNEXTLINE(performance-unnecessary-value-param)
void EditShortcutsDialog::checkEnteredKeySequence(QKeySequence key)
{
    d->entry().enter(key);
}

void EditShortcutsDialog::setDefaultShortcut()
{
    d->enterDefaultKey();
}

void EditShortcutsDialog::processButtonBox(QAbstractButton *button)
{
    d->press(button);
}

void EditShortcutsDialog::slotAccept()
{
    if (!d->entry().settle())
        return;
    const QPointer<EditShortcutsDialog> self(this);
    d->commit();
    // The host hears of its new keys and may close its windows, this one too.
    if (!self)
        return;
    setChanged(false);
    accept();
}

void EditShortcutsDialog::slotReject()
{
    d->discard();
    reject();
}

void EditShortcutsDialog::reject()
{
    if (d->isChanged())
        slotReject(); // which comes back here, unchanged
    else
        QDialog::reject();
}

void EditShortcutsDialog::done(int result)
{
    if (result == Accepted) {
        if (!d->entry().settle())
            return;
    } else if (result == Rejected && d->isChanged()) {
        d->discard();
    }
    QDialog::done(result);
}

void EditShortcutsDialog::setVisible(bool visible)
{
    // Before the key editor loses the focus, which would take the key.
    if (!visible)
        d->entry().drop();
    QDialog::setVisible(visible);
}

void EditShortcutsDialog::closeEvent(QCloseEvent *event)
{
    if (!d->entry().settle()) {
        event->ignore();
        return;
    }
    if (d->isChanged()) {
        const QPointer<EditShortcutsDialog> self(this);
        const QMessageBox::StandardButton answer =
            MessageBox::show(this, QMessageBox::Warning, tr("Apply changes"),
                             tr("Some shortcuts have been changed. Do you want to apply changes?"),
                             QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel, QMessageBox::Cancel);
        if (answer == QMessageBox::Yes) {
            slotAccept();
        } else if (answer == QMessageBox::No) {
            slotReject();
        } else {
            event->ignore(); // also when the dialog went with its message
            return;
        }
        if (!self)
            return;
    }
    QDialog::closeEvent(event);
}

void EditShortcutsDialog::keyPressEvent(QKeyEvent *event)
{
    if (!event->matches(QKeySequence::Cancel))
        QDialog::keyPressEvent(event);
    else if (!d->assistance || !d->assistance->stepBackFromFilter())
        slotReject();
}

bool EditShortcutsDialog::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == d->form.keyWidget && d->entry().watch(*event))
        return true;
    return QDialog::eventFilter(watched, event);
}
