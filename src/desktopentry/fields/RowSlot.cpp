// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RowSlot.h"

#include <QChildEvent>

#include <algorithm>

namespace VelUI {

RowSlot::RowSlot(QBoxLayout::Direction direction, QWidget *parent)
    : QWidget(parent)
    , m_layout(new QBoxLayout(direction, this))
{
    m_layout->setContentsMargins(0, 0, 0, 0);
    hide();
}

void RowSlot::add(QWidget *widget)
{
    const bool isHidden = widget->testAttribute(Qt::WA_WState_ExplicitShowHide) && widget->isHidden();
    m_layout->addWidget(widget);
    widget->setVisible(!isHidden);
    widget->installEventFilter(this);
    update();
}

void RowSlot::setRowVisible(bool visible)
{
    m_isRowVisible = visible;
    update();
}

void RowSlot::cover(const QRect &place)
{
    if (m_hasPlace && place == geometry())
        return;
    m_hasPlace = false;
    setAutoFillBackground(true);
    raise();
    setGeometry(place);
    m_layout->activate();
    repaint();
}

void RowSlot::takePlace()
{
    setAutoFillBackground(false);
    m_hasPlace = !isHidden();
}

bool RowSlot::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::ShowToParent || event->type() == QEvent::HideToParent)
        update();
    return QWidget::eventFilter(watched, event);
}

void RowSlot::childEvent(QChildEvent *event)
{
    QWidget::childEvent(event);
    if (event->removed())
        update();
}

void RowSlot::update()
{
    const auto widgets = findChildren<QWidget *>(QString(), Qt::FindDirectChildrenOnly);
    const bool hasShown = std::any_of(widgets.begin(), widgets.end(),
                                      [](const QWidget *widget) { return !widget->isHidden(); });
    setVisible(m_isRowVisible && hasShown);
    m_hasPlace = m_hasPlace && !isHidden();
    if (hasShown == m_isFilled)
        return;
    m_isFilled = hasShown;
    Q_EMIT filled(hasShown);
}

} // namespace VelUI
