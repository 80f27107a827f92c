// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <functional>

struct MenuItem;

/// A menu as a window manager or a launcher is to have it.
namespace ListedMenu {

/// Gives the file of the icon of that name; empty for none.
using IconFile = std::function<QString(const QString &name)>;

/**
 * Returns \a menu without entries that are hidden, not installed or no entries at all, and without
 * folders in which nothing is left. A folder without a name has that of its directory.
 *
 * @param iconFile replaces the name of every icon; where there is none, the items keep no icon
 */
MenuItem of(const MenuItem &menu, const IconFile &iconFile);

/// Adds to \a menu as it is the files of all icons.
void addIconFiles(MenuItem *menu, const IconFile &iconFile);

} // namespace ListedMenu
