// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ListEditorForm.h"

#include "ButtonKeys.h"

#include <QCoreApplication>
#include <QHBoxLayout>
#include <QListWidget>
#include <QPushButton>
#include <QTimer>
#include <QVBoxLayout>

namespace VelUI {

void ListEditorForm::setupUi(QWidget *widget, const Names &names)
{
    if (widget->objectName().isEmpty())
        widget->setObjectName(QLatin1String(names.form));
    widget->resize(445, 180);

    horizontalLayout = new QHBoxLayout(widget);
    horizontalLayout->setObjectName(QStringLiteral("horizontalLayout"));
    horizontalLayout->setContentsMargins(0, 0, 0, 0);

    listWidget = new QListWidget(widget);
    listWidget->setObjectName(QStringLiteral("listWidget"));
    horizontalLayout->addWidget(listWidget);
    widget->setFocusProxy(listWidget);

    verticalLayout = new QVBoxLayout;
    verticalLayout->setObjectName(QStringLiteral("verticalLayout"));
    addButton = addPushButton(widget, "addButton", names.form, names.addText);
    editButton = addPushButton(widget, "editButton", names.form, names.editText);
    deleteButton = addPushButton(widget, "deleteButton", names.form, names.deleteText);
    verticalLayout->addItem(new QSpacerItem(20, 13, QSizePolicy::Minimum, QSizePolicy::Expanding));
    upButton = addPushButton(widget, "upButton", names.form, names.upText);
    downButton = addPushButton(widget, "downButton", names.form, names.downText);
    horizontalLayout->addLayout(verticalLayout);

    widget->setWindowTitle(QCoreApplication::translate(names.form, names.windowTitle));
    QMetaObject::connectSlotsByName(widget);
    connectKeys();
    updateButtons();
}

void ListEditorForm::connectKeys()
{
    auto *keys = new ButtonKeys(listWidget);
    keys->add(Qt::Key_Delete, deleteButton);
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Enter, Qt::Key_F2})
        keys->add(key, editButton);
    // Not from the click itself: what opens may take the list away, which is not done with it yet.
    QPushButton *const edit = editButton;
    QObject::connect(listWidget, &QListWidget::itemDoubleClicked, edit,
                     [edit] { QTimer::singleShot(0, edit, &QPushButton::click); });
}

QPushButton *ListEditorForm::addPushButton(QWidget *widget, const char *name, const char *context,
                                           const char *text)
{
    auto *button = new QPushButton(QCoreApplication::translate(context, text), widget);
    button->setObjectName(QLatin1String(name));
    verticalLayout->addWidget(button);
    return button;
}

void ListEditorForm::select(int row)
{
    listWidget->setCurrentRow(row, QItemSelectionModel::ClearAndSelect);
    listWidget->scrollToItem(listWidget->currentItem());
    updateButtons();
}

void ListEditorForm::removeSelectedItems()
{
    qDeleteAll(listWidget->selectedItems());
    updateButtons();
}

bool ListEditorForm::moveCurrentItem(int rows)
{
    const int row = listWidget->currentRow();
    QListWidgetItem *const item = listWidget->takeItem(row);
    if (!item)
        return false;
    listWidget->insertItem(row + rows, item);
    listWidget->setCurrentItem(item);
    updateButtons();
    return true;
}

void ListEditorForm::updateButtons()
{
    const QList<QListWidgetItem *> selected = listWidget->selectedItems();
    const bool one = selected.size() == 1;
    const int row = one ? listWidget->row(selected.constFirst()) : -1;
    editButton->setEnabled(one);
    deleteButton->setEnabled(!selected.isEmpty());
    upButton->setEnabled(one && row > 0);
    downButton->setEnabled(one && row < listWidget->count() - 1);
}

} // namespace VelUI
