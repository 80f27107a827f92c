// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormLayout.h"

#include <QAbstractButton>
#include <QLabel>
#include <QLineEdit>

namespace VelUI {

namespace {

void setItemVisible(QLayoutItem *item, bool visible)
{
    if (!item)
        return;
    if (QWidget *widget = item->widget())
        widget->setVisible(visible);
    if (QLayout *layout = item->layout()) {
        for (int i = 0; i < layout->count(); ++i)
            setItemVisible(layout->itemAt(i), visible);
    }
}

// A button that has a name of its own keeps it.
void nameField(QWidget *field, const QString &name)
{
    field->setAccessibleName(name);
    const auto lines = field->findChildren<QLineEdit *>();
    for (QLineEdit *line : lines)
        line->setAccessibleName(name);
    const auto buttons = field->findChildren<QAbstractButton *>();
    for (QAbstractButton *button : buttons) {
        if (button->accessibleName().isEmpty())
            button->setAccessibleName(FormLayout::tr("Edit %1", "name of a \"...\" button").arg(name));
    }
}

// The part of a field that takes the keys.
QWidget *focusTarget(QWidget *field)
{
    return field->focusProxy() ? field->focusProxy() : field;
}

QLabel *makeLabel(const QString &text, QWidget *parent)
{
    return new QLabel(text + QLatin1Char(':'), parent);
}

} // namespace

FormLayout::FormLayout(QWidget *parent)
    : QGridLayout(parent)
{
}

int FormLayout::addRow(const QString &label, QWidget *field)
{
    const int row = rowCount();
    QLabel *const shown = makeLabel(label, parentWidget());
    addWidget(shown, row, 0);
    addWidget(field, row, 1);
    shown->setBuddy(focusTarget(field));
    nameField(field, label);
    return row;
}

int FormLayout::addRow(const QString &label, QLayout *field)
{
    const int row = rowCount();
    QLabel *const shown = makeLabel(label, parentWidget());
    addWidget(shown, row, 0);
    addLayout(field, row, 1);
    for (int i = 0; i < field->count(); ++i) {
        QWidget *const widget = field->itemAt(i)->widget();
        if (!widget)
            continue;
        if (!shown->buddy())
            shown->setBuddy(focusTarget(widget));
        if (widget->accessibleName().isEmpty())
            nameField(widget, label);
    }
    return row;
}

int FormLayout::addRow(QWidget *left, QWidget *right)
{
    const int row = rowCount();
    addWidget(left, row, 0);
    addWidget(right, row, 1);
    if (const auto *button = qobject_cast<QAbstractButton *>(left))
        nameField(right, button->text());
    return row;
}

int FormLayout::addRow(QWidget *field)
{
    const int row = rowCount();
    addWidget(field, row, 0, 1, 2);
    return row;
}

void FormLayout::setRowVisible(int row, bool visible)
{
    setItemVisible(itemAtPosition(row, 0), visible);
    setItemVisible(itemAtPosition(row, 1), visible);
}

void FormLayout::hideRow(int row)
{
    setRowVisible(row, false);
}

void FormLayout::showRow(int row)
{
    setRowVisible(row, true);
}

void FormLayout::setRowLabelBold(int row)
{
    QLayoutItem *const item = itemAtPosition(row, 0);
    auto *label = item ? qobject_cast<QLabel *>(item->widget()) : nullptr;
    if (!label)
        return;
    QFont font = label->font();
    font.setWeight(QFont::Bold);
    label->setFont(font);
}

} // namespace VelUI
