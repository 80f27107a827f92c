// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionObject.h"

ActionObject::ActionObject(const QString &name, QAction *action, const QString &group)
    : WrappedObject(name, action, group)
{
    m_defaultKey = action->shortcut();
}

ActionObject::~ActionObject() = default;

QKeySequence ActionObject::objectKeySequence() const
{
    return m_wrapped ? m_wrapped->shortcut() : QKeySequence();
}

void ActionObject::setObjectKeySequence(const QKeySequence &key)
{
    if (m_wrapped)
        m_wrapped->setShortcut(key);
}

QString ActionObject::text() const
{
    if (!m_wrapped)
        return {};
    // What the expression "&(?!&)" matches goes. Views ask often, and it is ten times as slow.
    const QString marked = m_wrapped->text();
    QString text;
    text.reserve(marked.size());
    for (int i = 0; i < marked.size(); ++i) {
        const bool isMark = marked.at(i) == QLatin1Char('&')
            && (i + 1 == marked.size() || marked.at(i + 1) != QLatin1Char('&'));
        if (!isMark)
            text += marked.at(i);
    }
    return text;
}

QIcon ActionObject::icon() const
{
    return m_wrapped ? m_wrapped->icon() : QIcon();
}
