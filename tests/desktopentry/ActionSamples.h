// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

#include <QList>

/// Actions for the tests of their editors.
namespace ActionSamples {

inline VelUIDesktopAction action(const char *id)
{
    const QString name = QString::fromLatin1(id);
    VelUIDesktopAction action(name);
    action.setName(QStringLiteral("Name of ") + name);
    action.setExec(QStringLiteral("run-") + name);
    return action;
}

inline QList<VelUIDesktopAction> actions(std::initializer_list<const char *> ids)
{
    QList<VelUIDesktopAction> list;
    for (const char *id : ids)
        list.append(action(id));
    return list;
}

inline QStringList ids(const QList<VelUIDesktopAction> &actions)
{
    QStringList list;
    for (const VelUIDesktopAction &action : actions)
        list.append(action.getId());
    return list;
}

} // namespace ActionSamples
