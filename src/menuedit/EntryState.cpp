// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryState.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/DesktopNames.h>
#include <frame/Undisplayable.h>

#include <QCoreApplication>
#include <QFileInfo>

namespace {

QString desktopsOf(const VelUIDesktopEntry &entry)
{
    const QStringList only = entry.getOnlyShowIn();
    return only.isEmpty()
        ? QCoreApplication::translate("VelMenuView", "Not in the menu: it is not meant for this desktop.")
        : QCoreApplication::translate("VelMenuView",
                                      "Not in the menu: it is meant for other desktops only (%1).")
              .arg(only.join(QLatin1String(", ")));
}

} // namespace

EntryState::Kind EntryState::of(const VelUIDesktopEntry &entry)
{
    if (!entry.isValid())
        return Kind::Malformed;
    VelUIDesktopEntry::DisplayableError reason = 0;
    entry.isDisplayable(&reason);
    switch (reason) {
    case Undisplayable::Hidden:
        return Kind::Deleted;
    case Undisplayable::NoDisplay:
        return Kind::NotDisplayed;
    case Undisplayable::ForOtherDesktops:
        return Kind::ForOtherDesktops;
    case Undisplayable::NotInstalled:
        return Kind::NotInstalled;
    default:
        return entry.getName().isEmpty() && entry.getLocalName().isEmpty() ? Kind::Nameless : Kind::Shown;
    }
}

QString EntryState::explanation(const QString &path)
{
    const VelUIDesktopEntry entry(path);
    switch (of(entry)) {
    case Kind::Deleted:
        return QCoreApplication::translate("VelMenuView",
                                           "Not in the menu: it is marked as deleted (Hidden).");
    case Kind::NotDisplayed:
        return QCoreApplication::translate("VelMenuView",
                                           "Not in the menu: it is marked not to be displayed (NoDisplay).");
    case Kind::ForOtherDesktops:
        return desktopsOf(entry);
    case Kind::NotInstalled:
        return QCoreApplication::translate("VelMenuView",
                                           "Not in the menu: the program %1 is not installed (TryExec).")
            .arg(entry.getTryExec());
    case Kind::Malformed:
        return QFileInfo(path).isReadable()
            ? QCoreApplication::translate("VelMenuView",
                                          "This file is not a desktop entry, whatever its name says.")
            : QCoreApplication::translate("VelMenuView", "This file cannot be read.");
    case Kind::Nameless:
        return QCoreApplication::translate("VelMenuView",
                                           "This entry has no name. The name of its file is shown.");
    case Kind::Shown:
        break;
    }
    return {};
}

bool EntryState::hide(const QString &path)
{
    VelUIDesktopEntry entry(path);
    entry.setNoDisplay(true);
    return entry.save();
}

bool EntryState::showAgain(const QString &path)
{
    VelUIDesktopEntry entry(path);
    entry.setHidden(false);
    entry.setNoDisplay(false);
    if (of(entry) == Kind::ForOtherDesktops) {
        const QStringList desktops = DesktopNames::ofSession();
        QStringList others = entry.getNotShowIn();
        for (const QString &desktop : desktops)
            others.removeAll(desktop);
        entry.setNotShowIn(others);
        QStringList only = entry.getOnlyShowIn();
        if (of(entry) == Kind::ForOtherDesktops && !only.isEmpty()) {
            only.append(desktops.constFirst());
            entry.setOnlyShowIn(only);
        }
    }
    return entry.save();
}
