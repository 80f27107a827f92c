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
 * What UpdateStartMenu() remembers is brought up to date.
 *
 * @param menuDir the folder of the menu. Missing parents are made, a link is followed, unless
 *        another user may have planted it (see Vel::leadsThroughPlantedLink)
 * @param templateDir a folder that is copied instead of all that; may be null or empty
 * @return whether the new menu stands; when it does not, errno tells why: ENODATA when no application is
 *         installed, ENOTDIR when something else than a folder is in the place of the menu, EPERM where a
 *         link was not followed, 0 where no reason is known, else what the system said
 */
VELINTEGRATION_EXPORT bool CreateStartMenu(const char *menuDir, const char *templateDir);

/**
 * Has a start menu follow what is installed. Where there is none yet, one is made as by
 * CreateStartMenu().
 *
 * Applications that came get an entry in the folder of their category, in its place in the order; an
 * entry whose application changed is brought up to date, and moved when the category is another one;
 * an entry whose application went is removed, and the folder with it that came empty by this. All of
 * that happens only to what the user did not touch. An entry is touched when any of its bytes, its
 * name or its folder is another; its place in the order is nobody's business but the user's. What the
 * user deleted does not come back, also when the application is installed anew.
 *
 * What that takes is remembered in the file of the menu's name with ".sources" behind it. It is plain
 * text and may be deleted: then nothing is removed or doubled, but what the user had deleted may come
 * back once. To a menu without a folder of a main category, which somebody made by hand or from a
 * template, only those applications are added that come from then on.
 *
 * When nothing is to be done, no more than the times of folders is looked at, as long as nothing in
 * them changed in the last two seconds before. Several updates may run at a time, and programs may
 * edit the menu meanwhile. What a killed update began, the next one ends.
 *
 * @param menuDir the folder of the menu; see CreateStartMenu()
 * @param templateDir what is copied where there is no menu yet; may be null or empty
 * @return false when no application is installed, which changes nothing and for which errno is ENODATA,
 *         or not everything could be done; errno tells why then, 0 where no reason is known
 */
VELINTEGRATION_EXPORT bool UpdateStartMenu(const char *menuDir, const char *templateDir);
