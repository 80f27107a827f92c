// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormLayout.h"

#include "RowSlot.h"
#include "TabOrder.h"

#include <QAbstractButton>
#include <QLabel>
#include <QLineEdit>
#include <QStyle>
#include <QVector>

#include <utility>

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
    setItemVisible(rowItem(row, 0), visible);
    setItemVisible(rowItem(row, 1), visible);
    for (RowSlot *slot : {m_beside.value(row), m_below.value(row)}) {
        if (slot)
            slot->setRowVisible(visible);
    }
}

bool FormLayout::isRowVisible(int row) const
{
    QLayoutItem *const item = rowItem(row, 0);
    return item && !item->widget()->isHidden();
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
    QLayoutItem *const item = rowItem(row, 0);
    auto *label = item ? qobject_cast<QLabel *>(item->widget()) : nullptr;
    if (!label)
        return;
    QFont font = label->font();
    font.setWeight(QFont::Bold);
    label->setFont(font);
}

QWidget *FormLayout::labelOf(int row) const
{
    return rowItem(row, 0)->widget();
}

void FormLayout::setField(int row, const QString &label, QWidget *field)
{
    auto *shown = qobject_cast<QLabel *>(rowItem(row, 0)->widget());
    QWidget *const former = rowItem(row, 1)->widget();
    const bool isVisible = isRowVisible(row);
    if (field != former) {
        const bool hadFocus = former->isAncestorOf(former->window()->focusWidget());
        delete replaceWidget(former, field, Qt::FindDirectChildrenOnly); // with the room that it has
        field->setVisible(isVisible);
        if (hadFocus)
            field->setFocus();
        former->hide();
    }
    shown->setText(label + QLatin1Char(':'));
    shown->setBuddy(focusTarget(field));
    nameField(field, label);
}

void FormLayout::spread()
{
    if (!isSpread())
        moveRows(2);
}

void FormLayout::pack()
{
    if (!isSpread())
        return;
    qDeleteAll(m_beside);
    qDeleteAll(m_below);
    m_beside.clear();
    m_below.clear();
    moveRows(1);
}

void FormLayout::holdRows()
{
    setEnabled(false);
}

void FormLayout::showAhead(int row)
{
    RowSlot *const slot = m_below.value(row);
    if (!slot || !slot->isVisible())
        return;
    const QRect field = cellRect(row * m_spacing, 1) | cellRect(row * m_spacing, 2);
    const int height =
        slot->hasHeightForWidth() ? slot->heightForWidth(field.width()) : slot->sizeHint().height();
    const QRect place(field.left(), field.bottom() + 1 + verticalSpacing(), field.width(), height);
    slot->cover(QStyle::visualRect(parentWidget()->layoutDirection(), parentWidget()->rect(), place));
}

void FormLayout::releaseRows()
{
    if (isEnabled())
        return;
    setEnabled(true);
    for (RowSlot *slot : qAsConst(m_below))
        slot->takePlace();
    invalidate();
    activate();
}

int FormLayout::rowOf(QWidget *field) const
{
    const int index = indexOf(field);
    if (index < 0)
        return -1;
    Cell cell{};
    getItemPosition(index, &cell.row, &cell.column, &cell.rowSpan, &cell.columnSpan);
    return cell.row / m_spacing;
}

void FormLayout::addBeside(int row, QWidget *field, QWidget *widget)
{
    RowSlot *const slot = besideRow(row);
    QWidget *const last = TabOrder::lastOf({field, slot});
    slot->add(widget);
    TabOrder::putBehind(last, widget);
}

RowSlot *FormLayout::besideRow(int row)
{
    RowSlot *&slot = m_beside[row];
    if (!slot) {
        slot = makeSlot(row, QBoxLayout::LeftToRight);
        addWidget(slot, row * m_spacing, 2);
        connect(slot, &RowSlot::filled, this, [this, row](bool isFilled) { makeRoomBeside(row, isFilled); });
    }
    return slot;
}

RowSlot *FormLayout::belowRow(int row)
{
    RowSlot *&slot = m_below[row];
    if (!slot) {
        slot = makeSlot(row, QBoxLayout::TopToBottom);
        addWidget(slot, row * m_spacing + 1, 1, 1, 2);
    }
    return slot;
}

RowSlot *FormLayout::makeSlot(int row, QBoxLayout::Direction direction)
{
    auto *slot = new RowSlot(direction, parentWidget());
    slot->setRowVisible(isRowVisible(row));
    return slot;
}

// Only the fields that something stands behind end before it.
void FormLayout::makeRoomBeside(int row, bool isNeeded)
{
    QLayoutItem *const item = rowItem(row, 1);
    if (!item || item == rowItem(row, 0))
        return;
    put(takeAt(indexOf(item)), {row * m_spacing, 1, 1, isNeeded ? 1 : 2});
}

void FormLayout::put(QLayoutItem *item, const Cell &cell)
{
    if (QLayout *const layout = item->layout())
        addLayout(layout, cell.row, cell.column, cell.rowSpan, cell.columnSpan);
    else
        addItem(item, cell.row, cell.column, cell.rowSpan, cell.columnSpan);
}

// The grid cannot insert a line: every item is put in anew.
void FormLayout::moveRows(int spacing)
{
    QVector<QPair<QLayoutItem *, Cell>> items(count());
    for (auto &[item, cell] : items) {
        getItemPosition(0, &cell.row, &cell.column, &cell.rowSpan, &cell.columnSpan);
        item = takeAt(0);
    }
    QVector<int> stretches;
    for (int line = 0; line < rowCount(); line += m_spacing) {
        stretches.append(rowStretch(line));
        setRowStretch(line, 0);
    }
    for (auto &[item, cell] : items) {
        cell.row = cell.row / m_spacing * spacing;
        // A field takes the place behind it, too, while nothing is there.
        if (cell.column == 1)
            cell.columnSpan = spacing > 1 ? 2 : 1;
        put(item, cell);
    }
    for (int row = 0; row < stretches.size(); ++row) {
        if (stretches[row])
            setRowStretch(row * spacing, stretches[row]);
    }
    m_spacing = spacing;
}

} // namespace VelUI
