// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsDialogPrivate.h"

#include "EditShortcutsDialog.h"
#include "KeySequences.h"
#include "ShortcutConflict.h"
#include "ShortcutsTreeView.h"

#include <QDialogButtonBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QMessageBox>
#include <QPushButton>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QVBoxLayout>

namespace {

// Not QMessageBox's own functions: their box would not survive that the dialog goes meanwhile.
// Returns NoButton in that case.
QMessageBox::StandardButton showMessage(QWidget *parent, QMessageBox::Icon icon, const QString &title,
                                        const QString &text, QMessageBox::StandardButtons buttons,
                                        QMessageBox::StandardButton defaultButton = QMessageBox::NoButton)
{
    const QPointer<QMessageBox> box(new QMessageBox(icon, title, text, buttons, parent));
    box->setDefaultButton(defaultButton);
    box->exec();
    if (!box)
        return QMessageBox::NoButton;
    const QMessageBox::StandardButton answer = box->standardButton(box->clickedButton());
    delete box;
    return answer;
}

} // namespace

EditShortcutsDialogPrivate::EditShortcutsDialogPrivate(EditShortcutsDialog *dialog, ShortcutsModel *shortcuts)
    : q(dialog)
    , model(shortcuts)
{
}

void EditShortcutsDialogPrivate::buildForm()
{
    q->setObjectName(QStringLiteral("EditShortcutsDialog"));
    q->setWindowTitle(EditShortcutsDialog::tr("Configure shortcuts"));
    q->resize(614, 504);

    verticalLayout = new QVBoxLayout(q);
    verticalLayout->setObjectName(QStringLiteral("verticalLayout"));

    treeView = new ShortcutsTreeView(q);
    treeView->setObjectName(QStringLiteral("treeView"));
    treeView->setAccessibleName(q->windowTitle());
    verticalLayout->addWidget(treeView);

    buildKeyBox();
    verticalLayout->addWidget(groupBox);

    buttonBox = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel | QDialogButtonBox::Reset
                                         | QDialogButtonBox::RestoreDefaults,
                                     q);
    buttonBox->setObjectName(QStringLiteral("buttonBox"));
    verticalLayout->addWidget(buttonBox);
}

void EditShortcutsDialogPrivate::buildKeyBox()
{
    groupBox = new QGroupBox(EditShortcutsDialog::tr("Choose a key for selected action"), q);
    groupBox->setObjectName(QStringLiteral("groupBox"));
    gridLayout = new QGridLayout(groupBox);
    gridLayout->setObjectName(QStringLiteral("gridLayout"));

    defaultKeyRB = new QRadioButton(EditShortcutsDialog::tr("Default key:"), groupBox);
    defaultKeyRB->setObjectName(QStringLiteral("defaultKeyRB"));
    gridLayout->addWidget(defaultKeyRB, 0, 0, 2, 1);

    defaultKeyLabel = new QLabel(groupBox);
    defaultKeyLabel->setObjectName(QStringLiteral("defaultKeyLabel"));
    defaultKeyLabel->setTextFormat(Qt::PlainText);
    gridLayout->addWidget(defaultKeyLabel, 0, 1, 2, 2);

    customKeyRB = new QRadioButton(EditShortcutsDialog::tr("Assign key:"), groupBox);
    customKeyRB->setObjectName(QStringLiteral("customKeyRB"));
    gridLayout->addWidget(customKeyRB, 2, 0);

    keyWidget = new QKeySequenceEdit(groupBox);
    keyWidget->setObjectName(QStringLiteral("keyWidget"));
    keyWidget->setAccessibleName(customKeyRB->text());
    keyWidget->setEnabled(false);
    gridLayout->addWidget(keyWidget, 2, 1, 1, 2);
    QObject::connect(customKeyRB, &QRadioButton::toggled, keyWidget, &QWidget::setEnabled);

    // Nothing is current yet.
    groupBox->setEnabled(false);
}

void EditShortcutsDialogPrivate::fillTree()
{
    treeView->setEditTriggers(QAbstractItemView::NoEditTriggers);
    treeView->setModel(model);
    treeView->expandAll();
    treeView->resizeColumnToContents(0);
}

void EditShortcutsDialogPrivate::connectKeys()
{
    QObject::connect(treeView, &ShortcutsTreeView::currentShortcutChanged, q,
                     &EditShortcutsDialog::checkCurrentShortcut);
    QObject::connect(treeView, &ShortcutsTreeView::currentItemIsNotShortcut, q,
                     &EditShortcutsDialog::disableShortcutEdit);
    QObject::connect(keyWidget, &QKeySequenceEdit::keySequenceChanged, q,
                     &EditShortcutsDialog::checkEnteredKeySequence);
    QObject::connect(defaultKeyRB, &QRadioButton::toggled, q, &EditShortcutsDialog::setDefaultShortcut);

    keyWidget->installEventFilter(q);
    QObject::connect(keyWidget, &QKeySequenceEdit::editingFinished, q, [this] { endRecording(); });
    if (model)
        QObject::connect(model, &QObject::destroyed, q, &EditShortcutsDialog::disableShortcutEdit);
}

bool EditShortcutsDialogPrivate::isChanged() const
{
    return buttonBox->button(QDialogButtonBox::Ok)->isEnabled();
}

void EditShortcutsDialogPrivate::showKey(const QKeySequence &key)
{
    isRecording = false;
    const QSignalBlocker blocker(keyWidget);
    keyWidget->setKeySequence(key);
}

void EditShortcutsDialogPrivate::setPendingKey(const QKeySequence &key)
{
    treeView->setKeySequence(key);
    q->setChanged(true);
    buttonBox->button(QDialogButtonBox::RestoreDefaults)->setEnabled(true);
}

QKeySequence EditShortcutsDialogPrivate::shownDefaultKey() const
{
    const QString text = defaultKeyLabel->text();
    if (text == EditShortcutsDialog::tr("None"))
        return {};
    return KeySequences::fromText(text, QKeySequence::PortableText);
}

void EditShortcutsDialogPrivate::reportConflict(const ShortcutConflict &conflict, const QKeySequence &key)
{
    const QString text = conflict.kind == ShortcutConflict::Global
        ? EditShortcutsDialog::tr("Shortcut '%1' is already used for global action '%2'.")
        : EditShortcutsDialog::tr("Shortcut '%1' is already used for action '%2'. Please try another.");
    showMessage(q, QMessageBox::Critical, EditShortcutsDialog::tr("Shortcuts conflict"),
                text.arg(key.toString(QKeySequence::PortableText), conflict.holder), QMessageBox::Ok);
}

QMessageBox::StandardButton EditShortcutsDialogPrivate::askWhetherToApply()
{
    return showMessage(
        q, QMessageBox::Warning, EditShortcutsDialog::tr("Apply changes"),
        EditShortcutsDialog::tr("Some shortcuts have been changed. Do you want to apply changes?"),
        QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel, QMessageBox::Cancel);
}

void EditShortcutsDialogPrivate::endRecording()
{
    if (!isRecording)
        return;
    const QKeySequence key = keyWidget->keySequence();
    const bool hasKey = !key.isEmpty() && treeView->isShortcutCurrent();
    showKey(hasKey ? key : treeView->currentKeySequence());
    if (hasKey)
        q->checkEnteredKeySequence(key);
}
