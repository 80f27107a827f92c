// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionObject.h"

#include "ShortcutGroup.h"

ActionObject::ActionObject(const QString &name, QAction *action, const QString &group)
    : IShortcutObject(name)
    , m_action(action)
    , m_group(ShortcutGroup::nameFor(group, action))
{
    m_defaultKey = action->shortcut();
    connect(action, &QObject::destroyed, this, &IShortcutObject::deleteMe);
}

ActionObject::~ActionObject() = default;

QKeySequence ActionObject::objectKeySequence() const
{
    return m_action ? m_action->shortcut() : QKeySequence();
}

void ActionObject::setObjectKeySequence(const QKeySequence &key)
{
    if (m_action)
        m_action->setShortcut(key);
}

void ActionObject::setKeySequence(const QKeySequence &key)
{
    m_key = key;
}

void ActionObject::reset()
{
    m_key = objectKeySequence();
}

QKeySequence ActionObject::keySequence() const
{
    return m_key;
}

void ActionObject::apply()
{
    // A copy: whoever hears of the new key may destroy the action and so this object.
    const QKeySequence key = m_key;
    setObjectKeySequence(key);
}

QString ActionObject::group() const
{
    return m_group;
}

QString ActionObject::text() const
{
    if (!m_action)
        return {};
    // What the expression "&(?!&)" matches goes. Views ask often, and it is ten times as slow.
    const QString marked = m_action->text();
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
    return m_action ? m_action->icon() : QIcon();
}
