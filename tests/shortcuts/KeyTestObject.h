// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "IShortcutObject.h"

#include <functional>

/**
 * A shortcut object of an application's own, with its key in force in a member.
 */
class KeyTestObject : public IShortcutObject
{
public:
    KeyTestObject(const QString &name, const QString &group, const QKeySequence &key = QKeySequence())
        : IShortcutObject(name)
        , inForce(key)
        , m_group(group)
    {
        m_defaultKey = key;
        m_key = key;
    }

    QKeySequence objectKeySequence() const override { return inForce; }
    void setObjectKeySequence(const QKeySequence &key) override
    {
        inForce = key;
        if (onApply)
            onApply();
    }
    void setKeySequence(const QKeySequence &key) override { m_key = key; }
    void reset() override { m_key = objectKeySequence(); }
    QKeySequence keySequence() const override { return m_key; }
    void apply() override { setObjectKeySequence(m_key); }
    QString group() const override { return m_group; }
    QString text() const override { return QStringLiteral("Text of ") + name(); }
    QIcon icon() const override { return {}; }

    QKeySequence inForce;
    std::function<void()> onApply;

private:
    const QString m_group;
};
