// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutObject.h"

#include "ShortcutGroup.h"

ShortcutObject::ShortcutObject(const QString &name, QShortcut *shortcut, const QString &text,
                               const QString &group)
    : IShortcutObject(name)
    , m_shortcut(shortcut)
    , m_group(ShortcutGroup::nameFor(group, shortcut))
    , m_text(text)
{
    m_defaultKey = shortcut->key();
    connect(shortcut, &QObject::destroyed, this, &IShortcutObject::deleteMe);
}

ShortcutObject::~ShortcutObject() = default;

QKeySequence ShortcutObject::objectKeySequence() const
{
    return m_shortcut ? m_shortcut->key() : QKeySequence();
}

void ShortcutObject::setObjectKeySequence(const QKeySequence &key)
{
    if (m_shortcut)
        m_shortcut->setKey(key);
}

void ShortcutObject::setKeySequence(const QKeySequence &key)
{
    m_key = key;
}

void ShortcutObject::reset()
{
    m_key = objectKeySequence();
}

QKeySequence ShortcutObject::keySequence() const
{
    return m_key;
}

void ShortcutObject::apply()
{
    // A copy: whoever hears of the new key may destroy the shortcut and so this object.
    const QKeySequence key = m_key;
    setObjectKeySequence(key);
}

QString ShortcutObject::group() const
{
    return m_group;
}

QString ShortcutObject::text() const
{
    return m_text;
}

QIcon ShortcutObject::icon() const
{
    return {};
}
