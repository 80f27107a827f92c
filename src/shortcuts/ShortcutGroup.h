// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QString>

namespace ShortcutGroup {

/// The group of a wrapped object: \a group, else the object name of its parent, else nothing.
inline QString nameFor(const QString &group, const QObject *wrapped)
{
    if (!group.isEmpty() || !wrapped->parent())
        return group;
    return wrapped->parent()->objectName();
}

} // namespace ShortcutGroup
