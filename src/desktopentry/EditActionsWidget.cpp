// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditActionsWidget.h"

#include "ActionPropsDialog.h"

#include <frame/GuardedDialog.h>

#include <QListWidget>
#include <QPushButton>

namespace VelUI {

namespace {

const ListEditorForm::Names FormNames = {
    "EditActionsWidget",
    QT_TRANSLATE_NOOP("EditActionsWidget", "Form"),
    QT_TRANSLATE_NOOP("EditActionsWidget", "Add..."),
    QT_TRANSLATE_NOOP("EditActionsWidget", "Edit..."),
    QT_TRANSLATE_NOOP("EditActionsWidget", "Delete"),
    QT_TRANSLATE_NOOP("EditActionsWidget", "Up"),
    QT_TRANSLATE_NOOP("EditActionsWidget", "Down"),
};

VelUIDesktopAction actionOf(const QListWidgetItem *item)
{
    return item->data(EditActionsWidget::ActionRole).value<VelUIDesktopAction>();
}

} // namespace

EditActionsWidget::EditActionsWidget(QWidget *parent)
    : QWidget(parent)
    , m_addTitle(tr("Add action"))
    , m_editTitle(tr("Edit action"))
{
    m_ui.setupUi(this, FormNames);
    connect(m_ui.addButton, &QPushButton::clicked, this, &EditActionsWidget::addAction);
    connect(m_ui.editButton, &QPushButton::clicked, this, &EditActionsWidget::editAction);
    connect(m_ui.deleteButton, &QPushButton::clicked, this, &EditActionsWidget::deleteActions);
    connect(m_ui.upButton, &QPushButton::clicked, this, &EditActionsWidget::upAction);
    connect(m_ui.downButton, &QPushButton::clicked, this, &EditActionsWidget::downAction);
    connect(m_ui.listWidget, &QListWidget::itemSelectionChanged, this,
            &EditActionsWidget::updateButtonsAvailability);
}

void EditActionsWidget::setActions(const QList<VelUIDesktopAction> &actions)
{
    m_ui.listWidget->clear();
    for (const VelUIDesktopAction &action : actions)
        appendItem(action);
}

QList<VelUIDesktopAction> EditActionsWidget::actions() const
{
    QList<VelUIDesktopAction> actions;
    for (int row = 0; row < m_ui.listWidget->count(); ++row)
        actions.append(actionOf(m_ui.listWidget->item(row)));
    return actions;
}

void EditActionsWidget::select(int row)
{
    m_ui.select(row);
}

void EditActionsWidget::setTexts(const QString &addTitle, const QString &editTitle)
{
    m_addTitle = addTitle;
    m_editTitle = editTitle;
}

void EditActionsWidget::appendItem(const VelUIDesktopAction &action)
{
    auto *item = new QListWidgetItem(action.getId(), m_ui.listWidget);
    item->setData(ActionRole, QVariant::fromValue(action));
}

void EditActionsWidget::addAction()
{
    GuardedDialog<ActionPropsDialog> dialog(VelUIDesktopAction(tr("newAction", "id of a new action")), this);
    dialog->setWindowTitle(m_addTitle);
    if (!dialog.run())
        return;
    appendItem(dialog->action());
    m_ui.select(m_ui.listWidget->count() - 1);
    Q_EMIT changed();
}

void EditActionsWidget::editAction()
{
    if (!m_ui.listWidget->currentItem())
        return;
    GuardedDialog<ActionPropsDialog> dialog(actionOf(m_ui.listWidget->currentItem()), this);
    dialog->setWindowTitle(m_editTitle);
    if (!dialog.run() || !m_ui.listWidget->currentItem())
        return;
    m_ui.listWidget->currentItem()->setData(ActionRole, QVariant::fromValue(dialog->action()));
    Q_EMIT changed();
}

void EditActionsWidget::deleteActions()
{
    m_ui.removeSelectedItems();
    Q_EMIT changed();
}

void EditActionsWidget::upAction()
{
    moveCurrent(-1);
}

void EditActionsWidget::downAction()
{
    moveCurrent(1);
}

void EditActionsWidget::moveCurrent(int rows)
{
    if (m_ui.moveCurrentItem(rows))
        Q_EMIT changed();
}

void EditActionsWidget::updateButtonsAvailability()
{
    m_ui.updateButtons();
}

} // namespace VelUI
