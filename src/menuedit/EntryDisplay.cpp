// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDisplay.h"

#include "EntryState.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <QFileInfo>

QString EntryDisplay::describingFile(const QString &path, bool isFolder)
{
    const QString recordFile = EntryPath::recordFileOf(path);
    if (isFolder && QFileInfo::exists(recordFile))
        return recordFile;
    return EntryPath::isEntry(path) || EntryPath::isRecordFile(path) ? path : QString();
}

QString EntryDisplay::shownName(const VelUIDesktopEntry &entry)
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

bool EntryDisplay::isHidden(const VelUIDesktopEntry &entry)
{
    return EntryState::isHidden(EntryState::of(entry));
}
