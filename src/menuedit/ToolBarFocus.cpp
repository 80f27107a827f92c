// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ToolBarFocus.h"

#include <QAction>
#include <QKeyEvent>
#include <QToolBar>
#include <QToolButton>

#include <functional>

namespace {

void forEachButton(const QToolBar *toolBar, const std::function<void(QToolButton *)> &use)
{
    const QList<QAction *> actions = toolBar->actions();
    for (QAction *action : actions) {
        if (auto *button = qobject_cast<QToolButton *>(toolBar->widgetForAction(action)))
            use(button);
    }
}

} // namespace

ToolBarFocus::ToolBarFocus(QToolBar *toolBar, QWidget *next)
    : m_toolBar(toolBar)
{
    QWidget *former = nullptr;
    forEachButton(toolBar, [this, &former](QToolButton *button) {
        // A click leaves the keyboard where it is.
        button->setFocusPolicy(Qt::TabFocus);
        button->installEventFilter(this);
        if (former)
            QWidget::setTabOrder(former, button);
        former = button;
    });
    if (former)
        QWidget::setTabOrder(former, next);
}

ToolBarFocus::~ToolBarFocus()
{
    forEachButton(m_toolBar, [](QToolButton *button) { button->setFocusPolicy(Qt::NoFocus); });
}

bool ToolBarFocus::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() != QEvent::KeyPress)
        return false;
    const auto *press = static_cast<QKeyEvent *>(event);
    if ((press->key() != Qt::Key_Return && press->key() != Qt::Key_Enter)
        || (press->modifiers() & ~Qt::KeypadModifier))
        return false;
    // A key that is held does it once.
    if (!press->isAutoRepeat())
        static_cast<QToolButton *>(watched)->click();
    return true;
}
