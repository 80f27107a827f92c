// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

/// What window managers need that know nothing of the channel.
namespace WindowManagers {

struct Settings
{
    const char *name;
    /// The command of a shell that has the window manager show the start menu as it is now; empty for one
    /// that asks for the menu each time it opens it.
    const char *startMenu;
    bool runsAtStart; ///< whether the command has to run before the menu is opened for the first time
};

/// The settings for the window manager \a name; null when there are none.
const Settings *find(const QString &name);
/// The names of all, in alphabetical order.
QStringList names();

} // namespace WindowManagers
