// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "IShortcutObject.h"

#include <QPointer>

/**
 * What all objects do alike that wrap something of Qt: keep the pending key and the group, and
 * ask for their removal when the wrapped thing goes.
 *
 * Where the key stands in the wrapped thing, and what the user sees of it, derived classes say.
 */
template <typename Wrapped>
class WrappedObject : public IShortcutObject
{
public:
    void setKeySequence(const QKeySequence &key) override { m_key = key; }
    void reset() override { m_key = objectKeySequence(); }
    QKeySequence keySequence() const override { return m_key; }
    void apply() override { setObjectKeySequence(m_key); }
    QString group() const override { return m_group; }

protected:
    /// Wraps \a wrapped, which is not owned. Without a \a group its parent's object name is it.
    WrappedObject(const QString &name, Wrapped *wrapped, const QString &group)
        : IShortcutObject(name)
        , m_wrapped(wrapped)
        , m_group(group.isEmpty() && wrapped->parent() ? wrapped->parent()->objectName() : group)
    {
        connect(wrapped, &QObject::destroyed, this, &IShortcutObject::deleteMe);
    }

    const QPointer<Wrapped> m_wrapped;

private:
    const QString m_group;
};
