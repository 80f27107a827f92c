// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "NoMatchLabel.h"

#include <QAbstractItemView>
#include <QAccessible>
#include <QEvent>

NoMatchLabel::NoMatchLabel(QAbstractItemView *view)
    : QLabel(view->viewport())
{
    setObjectName(QStringLiteral("noMatchLabel"));
    setTextFormat(Qt::PlainText);
    setAlignment(Qt::AlignCenter);
    setWordWrap(true);
    setAttribute(Qt::WA_TransparentForMouseEvents);
    view->viewport()->installEventFilter(this);
    hide();
}

NoMatchLabel::~NoMatchLabel() = default;

void NoMatchLabel::say(const QString &message)
{
    const bool isNew = message != text();
    setText(message);
    setGeometry(parentWidget()->rect());
    setVisible(!message.isEmpty());
    if (isNew && !message.isEmpty()) {
        QAccessibleEvent event(this, QAccessible::Alert);
        QAccessible::updateAccessibility(&event);
    }
}

bool NoMatchLabel::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == parentWidget() && event->type() == QEvent::Resize)
        setGeometry(parentWidget()->rect());
    return QLabel::eventFilter(watched, event);
}
