// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFilterBar.h"

#include "VelMenuView.h"

#include <QCheckBox>
#include <QCoreApplication>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLineEdit>

MenuFilterBar::MenuFilterBar(VelMenuView *view, QWidget *parent)
    : QWidget(parent)
    , m_view(view)
    , m_line(new QLineEdit(this))
    , m_hiddenButton(new QCheckBox(QCoreApplication::translate("VelMenuDialog", "Show hidden"), this))
{
    setObjectName(QStringLiteral("filterBar"));
    m_line->setObjectName(QStringLiteral("filterEdit"));
    m_line->setPlaceholderText(
        QCoreApplication::translate("VelMenuDialog", "Filter by name, command or keyword"));
    m_line->setAccessibleName(QCoreApplication::translate("VelMenuDialog", "Filter"));
    m_line->setClearButtonEnabled(true);
    m_hiddenButton->setObjectName(QStringLiteral("hiddenButton"));
    m_hiddenButton->setToolTip(
        QCoreApplication::translate("VelMenuDialog", "Also show the entries that the menu leaves out"));

    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_line, 1);
    layout->addWidget(m_hiddenButton);

    // Before the view has to say anything about it.
    connect(m_line, &QLineEdit::textChanged, this, &MenuFilterBar::textChanged);
    connect(m_line, &QLineEdit::textChanged, m_view, &VelMenuView::setFilter);
    connect(m_hiddenButton, &QCheckBox::toggled, m_view, &VelMenuView::setHiddenShown);
    m_line->installEventFilter(this);
    parent->installEventFilter(this);
}

MenuFilterBar::~MenuFilterBar() = default;

void MenuFilterBar::setTabOrderBefore(QWidget *next)
{
    setTabOrder(next->previousInFocusChain(), m_line);
    setTabOrder(m_line, m_hiddenButton);
    setTabOrder(m_hiddenButton, next);
}

void MenuFilterBar::focusLine()
{
    m_line->setFocus(Qt::ShortcutFocusReason);
    m_line->selectAll();
}

// What no widget of the window has a use for comes to the window.
bool MenuFilterBar::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() != QEvent::KeyPress)
        return false;
    const auto *press = static_cast<QKeyEvent *>(event);
    if (press->modifiers() & ~Qt::KeypadModifier)
        return false;
    if (press->key() == Qt::Key_Escape)
        return clear();
    return watched == m_line && lineKey(press->key());
}

// In a dialog Return presses a button.
bool MenuFilterBar::lineKey(int key)
{
    switch (key) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
        m_view->slotFindNext();
        return true;
    case Qt::Key_Down:
        goToView();
        return true;
    default:
        return false;
    }
}

bool MenuFilterBar::clear()
{
    if (m_line->text().isEmpty())
        return false;
    m_line->clear();
    return true;
}

void MenuFilterBar::goToView()
{
    if (!m_view->selectedItem().isValid() && !m_line->text().isEmpty())
        m_view->slotFindNext();
    m_view->setFocus(Qt::OtherFocusReason);
}
