// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutObject.h"

ShortcutObject::ShortcutObject(const QString &name, QShortcut *shortcut, const QString &text,
                               const QString &group)
    : WrappedObject(name, shortcut, group)
    , m_text(text)
{
    m_defaultKey = shortcut->key();
}

ShortcutObject::~ShortcutObject() = default;

QKeySequence ShortcutObject::objectKeySequence() const
{
    return m_wrapped ? m_wrapped->key() : QKeySequence();
}

void ShortcutObject::setObjectKeySequence(const QKeySequence &key)
{
    if (m_wrapped)
        m_wrapped->setKey(key);
}

QString ShortcutObject::text() const
{
    return m_text;
}

QIcon ShortcutObject::icon() const
{
    return {};
}
