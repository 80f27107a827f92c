// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

/**
 * Builds a start menu anew. The menu that was there before stays beside it, as the folder of the
 * same name with ".previous" behind it; the one that was kept there goes. What \a menuDir leads to
 * counts where it is a link.
 *
 * The menu holds the applications that are installed: the entries in "applications" of
 * XDG_DATA_HOME and XDG_DATA_DIRS, where an id in an earlier directory hides later ones;
 * entries that are not displayable are left out. They are grouped by the first of their main
 * categories into folders named after the category; what has none goes into "Other", the last
 * one. Every folder has a ".directory" file with its name in several languages, an icon and
 * the order of its children. The entries are copies that no longer depend on the originals; they
 * have their permissions as far as the umask lets them, never set-id bits.
 *
 * The new menu is built beside the old one and takes its place in the end: when anything
 * fails, or no application at all is installed and there is no template, the old one is left as it
 * was, and so is the previous one. What a killed program left beside it an hour ago is removed.
 *
 * @param menuDir the folder of the menu. Missing parents are made, a link is followed, unless
 *        another user may have planted it (see Vel::leadsThroughPlantedLink)
 * @param templateDir a folder that is copied instead of all that; may be null or empty
 * @return whether the new menu stands; when it does not, errno tells why: ENODATA when no application is
 *         installed, ENOTDIR when something else than a folder is in the place of the menu, EPERM where a
 *         link was not followed, 0 where no reason is known, else what the system said
 */
VELINTEGRATION_EXPORT bool CreateStartMenu(const char *menuDir, const char *templateDir);
