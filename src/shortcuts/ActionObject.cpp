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
    if (!m_wrapped)
        return;
    QList<QKeySequence> keys = keysAfterTheFirst();
    m_placeOfDoubled = int(keys.indexOf(key));
    m_doubled = m_placeOfDoubled < 0 ? QKeySequence() : key;
    // By a key that an action has twice nothing is triggered.
    keys.removeAll(key);
    if (!key.isEmpty() || !keys.isEmpty())
        keys.prepend(key);
    m_wrapped->setShortcuts(keys);
}

QList<QKeySequence> ActionObject::furtherKeys() const
{
    if (!m_wrapped)
        return {};
    QList<QKeySequence> keys = keysAfterTheFirst();
    if (!keys.isEmpty())
        keys.removeAll(keySequence());
    return keys;
}

// With the one in its place that became the first, unless the application chose another first one.
QList<QKeySequence> ActionObject::keysAfterTheFirst() const
{
    const QKeySequence first = m_wrapped->shortcut();
    QList<QKeySequence> keys = m_wrapped->shortcuts();
    if (!keys.isEmpty() && keys.constFirst() == first)
        keys.removeFirst();
    // Hardly an action has more keys, and a dialog asks all of them.
    if (!keys.isEmpty())
        keys.removeAll(QKeySequence());
    if (!m_doubled.isEmpty() && first == m_doubled && !keys.contains(m_doubled))
        keys.insert(qMin(m_placeOfDoubled, int(keys.size())), m_doubled);
    return keys;
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
