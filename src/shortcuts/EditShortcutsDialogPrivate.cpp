// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsDialogPrivate.h"

#include "ClashingRows.h"
#include "KeySequences.h"
#include "ShortcutRows.h"
#include "ShortcutsTreeView.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>

EditShortcutsDialogPrivate::EditShortcutsDialogPrivate(QDialog *dialog, ShortcutsModel *shortcuts)
    : form(dialog)
    , m_dialog(dialog)
    , m_model(shortcuts)
    , m_entry(dialog, form, shortcuts)
{
    fillTree();
    setChanged(false);
    connectKeys();
}

EditShortcutsDialogPrivate::~EditShortcutsDialogPrivate()
{
    if (assistance)
        setAssistance(false);
}

void EditShortcutsDialogPrivate::setAssistance(bool isOn)
{
    m_entry.drop();
    m_entry.setAssistance(nullptr);
    assistance = isOn ? std::make_unique<EditShortcutsAssistance>(form, m_model) : nullptr;
    m_keyAssistance = isOn ? std::make_unique<KeyAssistance>(form, m_model) : nullptr;
    m_entry.setAssistance(m_keyAssistance.get());
    if (isOn)
        connectAssistance();
}

void EditShortcutsDialogPrivate::connectAssistance()
{
    QObject::connect(assistance.get(), &EditShortcutsAssistance::keysChanged, &m_context,
                     [this] { followKeys(); });
    const KeyAssistance *keys = m_keyAssistance.get();
    QObject::connect(keys, &KeyAssistance::noneChosen, &m_context, [this] { takeKeyAway(); });
    QObject::connect(keys, &KeyAssistance::goToRequested, &m_context,
                     [this](const QString &name) { goTo(name); });
    QObject::connect(keys, &KeyAssistance::takeOverRequested, &m_context,
                     [this](const QString &name) { takeOver(name); });
}

void EditShortcutsDialogPrivate::fillTree()
{
    form.treeView->setModel(m_model);
    form.treeView->openAllGroups();
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
            m_entry.drop();
            showNoShortcut();
            setChanged(false);
        });

    QObject::connect(&m_entry, &KeyEntry::entered, &m_context,
                     [this](const QKeySequence &key) { setPendingKey(key); });
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
    m_entry.show(pendingKey);
    if (defaultKey == pendingKey) {
        const QSignalBlocker blocker(form.defaultKeyRB);
        form.defaultKeyRB->setChecked(true);
        m_entry.show(QKeySequence());
    } else {
        form.customKeyRB->setChecked(true);
    }
}

void EditShortcutsDialogPrivate::showNoShortcut()
{
    // A message about the last key stands, also when the click on a group ended the recording.
    m_entry.dropKey();
    form.groupBox->setEnabled(false);
}

void EditShortcutsDialogPrivate::enterDefaultKey()
{
    if (!form.defaultKeyRB->isChecked())
        return;
    m_entry.show(QKeySequence());
    setPendingKey(shownDefaultKey());
}

void EditShortcutsDialogPrivate::takeKeyAway()
{
    m_entry.drop();
    if (!form.treeView->currentKeySequence().isEmpty())
        setPendingKey(QKeySequence());
}

void EditShortcutsDialogPrivate::goTo(const QString &name)
{
    const QKeySequence key = m_keyAssistance->key();
    m_entry.drop();
    const QModelIndex row = m_model ? ClashingRows::of(*m_model, key).value(name).first : QModelIndex();
    if (!row.isValid())
        return;
    form.treeView->goTo(row);
    form.treeView->setFocus();
}

void EditShortcutsDialogPrivate::takeOver(const QString &name)
{
    if (!m_model)
        return;
    const QKeySequence key = m_keyAssistance->key();
    const auto rows = ClashingRows::of(*m_model, key).value(name).pending;
    // Who hears of that may do anything.
    for (const QPersistentModelIndex &row : rows) {
        if (m_model)
            m_model->setKeySequence(row, QKeySequence());
    }
    noteChange();
    m_entry.reconsider();
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
    noteChange();
}

void EditShortcutsDialogPrivate::noteChange()
{
    setChanged(true);
    form.buttonBox->button(QDialogButtonBox::RestoreDefaults)->setEnabled(true);
}

// Keys became pending in other ways; there may be no edit left.
void EditShortcutsDialogPrivate::followKeys()
{
    noteChange();
    setChanged(m_model && ShortcutRows::isAnyEdited(*m_model));
}

bool EditShortcutsDialogPrivate::isChanged() const
{
    return m_model && m_entry.isChanged();
}

void EditShortcutsDialogPrivate::setChanged(bool changed)
{
    m_entry.setChanged(changed);
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
    m_entry.drop();
    if (m_model)
        m_model->resetShortcuts();
    setChanged(false);
}
