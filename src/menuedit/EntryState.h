// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class VelUIDesktopEntry;

/**
 * Whether the menu shows an entry and, if not, why.
 */
namespace EntryState {

enum class Kind {
    Shown,
    Deleted, ///< marked as deleted
    NotDisplayed, ///< marked not to be displayed
    ForOtherDesktops,
    NotInstalled, ///< what has to be there for it is not
    Malformed, ///< no entry at all
    Nameless,
};

Kind of(const VelUIDesktopEntry &entry);

/// Whether an entry in that state is left out of the tree, too, unless the user asks for it.
constexpr bool isHidden(Kind kind)
{
    return kind == Kind::Deleted || kind == Kind::ForOtherDesktops;
}

/// Whether the menu does not show an entry in that state, although it is one.
constexpr bool isOutsideMenu(Kind kind)
{
    return kind != Kind::Shown && kind != Kind::Malformed && kind != Kind::Nameless;
}

/// Why the menu does not show the entry at \a path, or what is wrong with it, for the user to read,
/// in plain text; empty for an entry that the menu shows.
QString explanation(const QString &path);

/// Has the menu leave the entry at \a path out, by its own mark; false when it cannot be saved.
bool hide(const QString &path);
/// Takes away every mark that keeps the entry at \a path out of the menu of this desktop; false
/// when it cannot be saved.
bool showAgain(const QString &path);

} // namespace EntryState
