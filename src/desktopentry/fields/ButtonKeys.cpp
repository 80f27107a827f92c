// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ButtonKeys.h"

#include <QAbstractButton>
#include <QKeyEvent>

namespace VelUI {

namespace {

bool isTyping(const QKeyEvent &event)
{
    const auto modifiers =
        event.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier | Qt::GroupSwitchModifier);
    return modifiers == Qt::NoModifier && !event.text().isEmpty() && event.text().at(0).isPrint();
}

} // namespace

ButtonKeys::ButtonKeys(QWidget *widget)
    : QObject(widget)
{
    widget->installEventFilter(this);
}

void ButtonKeys::add(Qt::Key key, QAbstractButton *button)
{
    m_buttons.insert(key, button);
}

void ButtonKeys::addTyping(QAbstractButton *button)
{
    m_typing = button;
}

QAbstractButton *ButtonKeys::buttonFor(const QKeyEvent &event) const
{
    QAbstractButton *button = isTyping(event) ? m_typing : nullptr;
    if ((event.modifiers() & ~Qt::KeypadModifier) == Qt::NoModifier)
        button = m_buttons.value(event.key(), button);
    return button && button->isEnabled() && !button->isHidden() ? button : nullptr;
}

bool ButtonKeys::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() != QEvent::KeyPress && event->type() != QEvent::ShortcutOverride)
        return QObject::eventFilter(watched, event);
    const auto *key = static_cast<QKeyEvent *>(event);
    QAbstractButton *const button = buttonFor(*key);
    if (!button)
        return QObject::eventFilter(watched, event);
    event->accept();
    // What the button opens may take this object away.
    if (event->type() == QEvent::KeyPress && !key->isAutoRepeat())
        button->click();
    return true;
}

} // namespace VelUI
