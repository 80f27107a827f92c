// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ChooserButton.h"

#include <QKeyEvent>

namespace VelUI {

ChooserButton::ChooserButton(const QString &text, QWidget *field, bool takesKey)
    : m_field(field)
    , m_fieldButton(field->findChild<QToolButton *>())
{
    setText(text);
    m_field->installEventFilter(this);
    m_fieldButton->installEventFilter(this);
    if (takesKey)
        m_field->focusProxy()->installEventFilter(this);
    // Shown without a parent it would be a window.
    setEnabled(m_field->isEnabled());
    if (m_fieldButton->isHidden())
        hide();
}

bool ChooserButton::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::EnabledChange:
    case QEvent::ShowToParent:
    case QEvent::HideToParent:
        follow();
        break;
    case QEvent::KeyPress:
        if (watched == m_field->focusProxy() && takesKey(static_cast<const QKeyEvent &>(*event))) {
            click();
            return true;
        }
        break;
    default:
        break;
    }
    return QToolButton::eventFilter(watched, event);
}

bool ChooserButton::takesKey(const QKeyEvent &event) const
{
    const Qt::KeyboardModifiers modifiers = event.modifiers() & ~Qt::KeypadModifier;
    return event.key() == Qt::Key_Down && modifiers == Qt::AltModifier && !isHidden();
}

void ChooserButton::follow()
{
    setEnabled(m_field->isEnabled());
    setHidden(m_fieldButton->isHidden());
}

} // namespace VelUI
