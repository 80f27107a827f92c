// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MessageLine.h"

#include <frame/QtMajor.h>

#include <QAccessible>
#include <QAction>
#include <QCoreApplication>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QStyle>

namespace {

constexpr int Warning = 1;
constexpr int Failure = 2;

} // namespace

MessageLine::MessageLine(QWidget *parent)
    : QWidget(parent)
    , m_icon(new QLabel(this))
    , m_label(new QLabel(this))
    , m_button(new QPushButton(QCoreApplication::translate("VelMenuDialog", "Undo"), this))
{
    setObjectName(QStringLiteral("messageLine"));
    m_icon->setObjectName(QStringLiteral("messageIcon"));
    m_icon->hide();
    m_label->setObjectName(QStringLiteral("messageLabel"));
    m_label->setTextFormat(Qt::PlainText);
    m_label->setWordWrap(true);
    m_label->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_label->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    m_button->setObjectName(QStringLiteral("messageUndoButton"));
    m_button->setAutoDefault(false);
    // A click leaves the keyboard where it is.
    m_button->setFocusPolicy(Qt::TabFocus);
    // The tree must not move up and down with what is told.
    QSizePolicy policy = m_button->sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    m_button->setSizePolicy(policy);
    m_button->hide();

    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_icon);
    layout->addWidget(m_label, 1);
    layout->addWidget(m_button);
    connect(m_button, &QPushButton::clicked, this, [this] {
        if (m_undo)
            m_undo->trigger();
    });
}

MessageLine::~MessageLine() = default;

void MessageLine::tell(const QString &text, int kind, MenuVoice::Subject subject)
{
    const bool isRest = subject == MenuVoice::Subject::Rest && m_isUndoable;
    m_isAtRest = false;
    m_isUndoable = isRest || subject == MenuVoice::Subject::Step;
    show(isRest ? m_label->text() + QLatin1Char('\n') + text : text, kind);
    QAccessibleEvent event(m_label, QAccessible::Alert);
    QAccessible::updateAccessibility(&event);
}

void MessageLine::setTabOrderAfter(QWidget *previous)
{
    setTabOrder(previous, m_button);
    m_previous = previous;
}

void MessageLine::setRest(const QString &text, int kind)
{
    m_restText = text;
    m_restKind = kind;
    if (m_isAtRest)
        show(text, kind);
}

void MessageLine::clear()
{
    m_isAtRest = true;
    m_isUndoable = false;
    show(m_restText, m_restKind);
}

void MessageLine::show(const QString &text, int kind)
{
    m_label->setText(text);
    m_label->setAccessibleName(text);
    m_icon->setVisible(kind >= Warning && !text.isEmpty());
    const QStyle::StandardPixmap picture =
        kind >= Failure ? QStyle::SP_MessageBoxCritical : QStyle::SP_MessageBoxWarning;
    const int size = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    const QIcon icon = style()->standardIcon(picture, nullptr, this);
    m_icon->setPixmap(QtMajor::pixmapFor(*this, icon, {size, size}));
    m_icon->setAccessibleName(kind >= Failure ? QCoreApplication::translate("VelMenuDialog", "Error")
                                              : QCoreApplication::translate("VelMenuDialog", "Warning"));
    updateButton();
}

void MessageLine::setUndoAction(QAction *action)
{
    m_undo = action;
    if (action)
        connect(action, &QAction::changed, this, &MessageLine::updateButton);
    updateButton();
}

void MessageLine::updateButton()
{
    const bool isOffered = m_undo && m_isUndoable;
    const bool isEnabled = m_undo && m_undo->isEnabled();
    // Else the next one would have it, which closes the dialog.
    if (m_button->hasFocus() && !(isOffered && isEnabled) && m_previous)
        m_previous->setFocus(Qt::OtherFocusReason);
    m_button->setVisible(isOffered);
    m_button->setEnabled(isEnabled);
    m_button->setToolTip(m_undo ? m_undo->toolTip() : QString());
}
