// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class VelUIDesktopEntry;

/**
 * How the menu shows an entry.
 */
namespace EntryDisplay {

/// The file that tells how the item at \a path is shown; empty for a file that is no entry and for
/// a folder without a record file.
QString describingFile(const QString &path, bool isFolder);

/**
 * The name under which the menu shows \a entry, which may be a folder's record as well: its name
 * in the user's language as it stands; without one, the untranslated name (empty or not) followed
 * by a blank and the generic name in the user's language where there is one. Empty when there is
 * none of them.
 */
QString shownName(const VelUIDesktopEntry &entry);

/**
 * Whether the menu leaves \a entry out: it is marked as deleted, or is not meant for this desktop.
 * An entry that is left out of menus for any other reason is shown, so that it can be edited; so is
 * one with `NoDisplay` that is meant for another desktop, as the first reason counts.
 */
bool isHidden(const VelUIDesktopEntry &entry);

} // namespace EntryDisplay
