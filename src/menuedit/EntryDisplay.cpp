// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDisplay.h"

#include <frame/DesktopEntryRecord.h>

namespace {

// Why a record says that it is not to be displayed, as far as it matters here.
constexpr VelUIDesktopEntry::DisplayableError MarkedAsDeleted = 1;
constexpr VelUIDesktopEntry::DisplayableError MeantForOtherDesktops = 3;

} // namespace

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
    VelUIDesktopEntry::DisplayableError reason = 0;
    return !entry.isDisplayable(&reason) && (reason == MarkedAsDeleted || reason == MeantForOtherDesktops);
}
