// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditableListWidget.h"

#include <QListWidget>
#include <QPointer>
#include <QPushButton>

namespace VelUI {

namespace {

const ListEditorForm::Names FormNames = {
    "EditableListWidget",
    QT_TRANSLATE_NOOP("EditableListWidget", "Form"),
    QT_TRANSLATE_NOOP("EditableListWidget", "Add..."),
    QT_TRANSLATE_NOOP("EditableListWidget", "Edit..."),
    QT_TRANSLATE_NOOP("EditableListWidget", "Delete"),
    QT_TRANSLATE_NOOP("EditableListWidget", "Up"),
    QT_TRANSLATE_NOOP("EditableListWidget", "Down"),
};

} // namespace

EditableListWidget::EditableListWidget(QWidget *parent)
    : QWidget(parent)
    , m_addTitle(tr("Add string"))
    , m_addLabel(tr("String:"))
    , m_editTitle(tr("Edit string"))
    , m_editLabel(tr("String:"))
{
    m_ui.setupUi(this, FormNames);
    connect(m_ui.addButton, &QPushButton::clicked, this, &EditableListWidget::addAction);
    connect(m_ui.editButton, &QPushButton::clicked, this, &EditableListWidget::editAction);
    connect(m_ui.deleteButton, &QPushButton::clicked, this, &EditableListWidget::deleteActions);
    connect(m_ui.upButton, &QPushButton::clicked, this, &EditableListWidget::upAction);
    connect(m_ui.downButton, &QPushButton::clicked, this, &EditableListWidget::downAction);
    connect(m_ui.listWidget, &QListWidget::itemSelectionChanged, this,
            &EditableListWidget::updateButtonsAvailability);
}

void EditableListWidget::setStrings(const QStringList &strings)
{
    m_ui.listWidget->clear();
    m_ui.listWidget->addItems(strings);
}

QStringList EditableListWidget::strings() const
{
    QStringList strings;
    for (int row = 0; row < m_ui.listWidget->count(); ++row)
        strings.append(m_ui.listWidget->item(row)->text());
    return strings;
}

void EditableListWidget::select(int row)
{
    m_ui.select(row);
}

void EditableListWidget::setTexts(const QString &addTitle, const QString &addLabel, const QString &editTitle,
                                  const QString &editLabel)
{
    m_addTitle = addTitle;
    m_addLabel = addLabel;
    m_editTitle = editTitle;
    m_editLabel = editLabel;
}

void EditableListWidget::setInputFunction(InputFunction function)
{
    m_inputFunction = function ? function : askForText;
}

void EditableListWidget::addAction()
{
    const QPointer<EditableListWidget> self(this);
    const QString text = m_inputFunction(this, m_addTitle, m_addLabel, QLineEdit::Normal, QString());
    if (!self || text.isEmpty())
        return;
    m_ui.listWidget->addItem(text);
    m_ui.select(m_ui.listWidget->count() - 1);
    Q_EMIT changed();
}

void EditableListWidget::editAction()
{
    if (!m_ui.listWidget->currentItem())
        return;
    const QPointer<EditableListWidget> self(this);
    const QString current = m_ui.listWidget->currentItem()->text();
    const QString text = m_inputFunction(this, m_editTitle, m_editLabel, QLineEdit::Normal, current);
    if (!self || text.isEmpty() || !m_ui.listWidget->currentItem())
        return;
    m_ui.listWidget->currentItem()->setText(text);
    Q_EMIT changed();
}

void EditableListWidget::deleteActions()
{
    m_ui.removeSelectedItems();
    Q_EMIT changed();
}

void EditableListWidget::upAction()
{
    moveCurrent(-1);
}

void EditableListWidget::downAction()
{
    moveCurrent(1);
}

void EditableListWidget::moveCurrent(int rows)
{
    if (m_ui.moveCurrentItem(rows))
        Q_EMIT changed();
}

void EditableListWidget::updateButtonsAvailability()
{
    m_ui.updateButtons();
}

} // namespace VelUI
