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

// The order is there for the user to see only when it is there for the menu, too.
QString FolderOrder::notSaved(const QString &folder)
{
    return QCoreApplication::translate("VelMenuView",
                                       "The order of the folder %1 could not be saved. Make sure that the "
                                       "folder may be written and that the disk is not full, then try again.")
        .arg(folder);
}
