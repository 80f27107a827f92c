// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryName.h"

#include <frame/DesktopEntryRecord.h>

QString EntryName::of(const VelUIDesktopEntry &entry)
{
    QString name = entry.getLocalName();
    if (!name.isEmpty())
        return name;
    name = entry.getName();
    const QString genericName = entry.getLocalGenericName();
    if (!genericName.isEmpty())
        name += QLatin1Char(' ') + genericName;
    return name;
}
