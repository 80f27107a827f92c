// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsForm.h"

#include "ShortcutsTreeView.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QRadioButton>
#include <QVBoxLayout>

EditShortcutsForm::EditShortcutsForm(QDialog *dialog)
{
    dialog->setObjectName(QStringLiteral("EditShortcutsDialog"));
    dialog->setWindowTitle(tr("Configure shortcuts"));
    dialog->resize(614, 504);

    auto *layout = new QVBoxLayout(dialog);
    layout->setObjectName(QStringLiteral("verticalLayout"));
    addTree(layout);
    addKeyBox(layout);
    addButtons(layout);
}

void EditShortcutsForm::addTree(QVBoxLayout *layout)
{
    QWidget *dialog = layout->parentWidget();
    treeView = new ShortcutsTreeView(dialog);
    treeView->setObjectName(QStringLiteral("treeView"));
    treeView->setAccessibleName(dialog->windowTitle());
    treeView->setEditTriggers(QAbstractItemView::NoEditTriggers);
    layout->addWidget(treeView);
}

void EditShortcutsForm::addKeyBox(QVBoxLayout *layout)
{
    groupBox = new QGroupBox(tr("Choose a key for selected action"), layout->parentWidget());
    groupBox->setObjectName(QStringLiteral("groupBox"));
    auto *grid = new QGridLayout(groupBox);
    grid->setObjectName(QStringLiteral("gridLayout"));
    addDefaultKey(grid);
    addCustomKey(grid);
    // Nothing is current yet.
    groupBox->setEnabled(false);
    layout->addWidget(groupBox);
}

void EditShortcutsForm::addDefaultKey(QGridLayout *grid)
{
    defaultKeyRB = new QRadioButton(tr("Default key:"), groupBox);
    defaultKeyRB->setObjectName(QStringLiteral("defaultKeyRB"));
    grid->addWidget(defaultKeyRB, 0, 0, 2, 1);

    defaultKeyLabel = new QLabel(groupBox);
    defaultKeyLabel->setObjectName(QStringLiteral("defaultKeyLabel"));
    defaultKeyLabel->setTextFormat(Qt::PlainText);
    grid->addWidget(defaultKeyLabel, 0, 1, 2, 2);
}

void EditShortcutsForm::addCustomKey(QGridLayout *grid)
{
    customKeyRB = new QRadioButton(tr("Assign key:"), groupBox);
    customKeyRB->setObjectName(QStringLiteral("customKeyRB"));
    grid->addWidget(customKeyRB, 2, 0);

    keyWidget = new QKeySequenceEdit(groupBox);
    keyWidget->setObjectName(QStringLiteral("keyWidget"));
    keyWidget->setAccessibleName(customKeyRB->text());
    keyWidget->setEnabled(false);
    grid->addWidget(keyWidget, 2, 1, 1, 2);
    QObject::connect(customKeyRB, &QRadioButton::toggled, keyWidget, &QWidget::setEnabled);
}

void EditShortcutsForm::addButtons(QVBoxLayout *layout)
{
    buttonBox = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel | QDialogButtonBox::Reset
                                         | QDialogButtonBox::RestoreDefaults,
                                     layout->parentWidget());
    buttonBox->setObjectName(QStringLiteral("buttonBox"));
    layout->addWidget(buttonBox);
}
