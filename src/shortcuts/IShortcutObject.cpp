// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IShortcutObject.h"

IShortcutObject::IShortcutObject(const QString &name)
    : m_name(name)
{
}

IShortcutObject::~IShortcutObject() = default;

QKeySequence IShortcutObject::defaultKeySequence() const
{
    return m_defaultKey;
}

QString IShortcutObject::name() const
{
    return m_name;
}

QString IShortcutObject::group() const
{
    return {};
}
