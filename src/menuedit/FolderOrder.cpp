// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderOrder.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <QCoreApplication>

bool FolderOrder::write(const QString &folder, const QStringList &list)
{
    VelUIDesktopEntry record(EntryPath::recordFileOf(folder));
    if (!record.load()) {
        record.setType(QStringLiteral("Directory"));
        record.setName(QStringLiteral("Group"));
        record.setLocalName(QCoreApplication::translate("VelMenuView", "Group"));
    }
    record.setSortOrder(list);
    return record.save();
}
