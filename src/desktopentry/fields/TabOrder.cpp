// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TabOrder.h"

#include <QVector>
#include <QWidget>

namespace VelUI {

namespace {

// What the Tab key comes to in a widget, in its order.
QVector<QWidget *> placesIn(QWidget *widget)
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

} // namespace

QWidget *TabOrder::lastOf(std::initializer_list<QWidget *> widgets)
{
    QWidget *last = nullptr;
    for (QWidget *widget : widgets) {
        const QVector<QWidget *> places = placesIn(widget);
        if (!places.isEmpty())
            last = places.constLast();
    }
    return last;
}

void TabOrder::putBehind(QWidget *last, QWidget *widget)
{
    const QVector<QWidget *> places = placesIn(widget);
    for (QWidget *place : places) {
        if (last)
            QWidget::setTabOrder(last, place);
        last = place;
    }
}

} // namespace VelUI
