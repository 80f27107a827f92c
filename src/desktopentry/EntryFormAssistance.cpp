// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryFormAssistance.h"

#include "fields/FormLayout.h"
#include "fields/RowSlot.h"

#include <QWidget>

#include <algorithm>
#include <initializer_list>

namespace VelUI {

namespace {

// What the Tab key comes to in a widget, in its order.
QVector<QWidget *> tabOrder(QWidget *widget)
{
    QVector<QWidget *> found;
    QWidget *next = widget;
    do {
        if ((next->focusPolicy() & Qt::TabFocus) && !next->focusProxy()
            && (next == widget || widget->isAncestorOf(next)))
            found.append(next);
        next = next->nextInFocusChain();
    } while (next != widget);
    return found;
}

QWidget *lastOf(std::initializer_list<QWidget *> widgets)
{
    QWidget *last = nullptr;
    for (QWidget *widget : widgets) {
        const QVector<QWidget *> order = tabOrder(widget);
        if (!order.isEmpty())
            last = order.constLast();
    }
    return last;
}

void putBehind(QWidget *last, QWidget *widget)
{
    const QVector<QWidget *> order = tabOrder(widget);
    for (QWidget *next : order) {
        if (last)
            QWidget::setTabOrder(last, next);
        last = next;
    }
}

} // namespace

EntryFormAssistance::EntryFormAssistance(EntryFormHost &form)
    : m_form(form)
{
    m_form.formLayout()->spread();
    connect(&m_form, &EntryFormHost::recordChanged, this, &EntryFormAssistance::recordChanged);
}

EntryFormAssistance::~EntryFormAssistance()
{
    m_form.formLayout()->pack();
}

const QVector<FormRow> &EntryFormAssistance::rows() const
{
    return m_form.formRows();
}

const FormRow *EntryFormAssistance::row(const QString &key) const
{
    const auto found = std::find_if(rows().begin(), rows().end(), [&key](const FormRow &row) {
        return !row.isTranslation && row.key == key;
    });
    return found == rows().end() ? nullptr : &*found;
}

bool EntryFormAssistance::isShown(const FormRow &row) const
{
    return m_form.formLayout()->isRowVisible(row.number);
}

void EntryFormAssistance::addBeside(const FormRow &row, QWidget *widget)
{
    RowSlot *const slot = m_form.formLayout()->besideRow(row.number);
    QWidget *const last = lastOf({row.field, slot});
    slot->add(widget);
    putBehind(last, widget);
}

void EntryFormAssistance::addBelow(const FormRow &row, QWidget *widget)
{
    RowSlot *const slot = m_form.formLayout()->belowRow(row.number);
    QWidget *const last = lastOf({row.field, m_form.formLayout()->besideRow(row.number), slot});
    slot->add(widget);
    putBehind(last, widget);
}

VelUIDesktopEntry EntryFormAssistance::record() const
{
    return m_form.record();
}

} // namespace VelUI
