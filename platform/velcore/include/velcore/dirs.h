// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velcore/velcore_export.h>

#include <string>

/**
 * The standard directories of the desktop, by the numbers that its programs use.
 */
enum class VelDir {
    WindowManagerConfig = 2, ///< files of the window manager, the shortcut file among them
    StartMenu = 4, ///< the user's start menu
    Desktop = 6, ///< the user's desktop folder
    Pictures = 15, ///< pictures that stand in where the icon theme lacks one
    ToolBar = 17 ///< the user's tool bar
};

/**
 * Returns the absolute path of a standard directory, in UTF-8 and without a trailing "/".
 *
 * The configuration root is VEL_CONFIG_HOME, else "vel" in XDG_CONFIG_HOME, else ".config/vel"
 * in HOME: the window manager's files lie in it, "startmenu" and "toolbar" below it. The
 * desktop folder is the one of user-dirs.dirs, else "Desktop" in HOME. The pictures lie in
 * "pixmaps" below VEL_DATA_DIR, else below the installed data. A variable that holds no
 * absolute path counts as not set.
 *
 * The environment is read at every call and nothing is created by asking.
 *
 * @param kind the directory asked for
 * @return the path; empty for a kind that is not listed in VelDir
 */
VELCORE_EXPORT std::string GetVelDir(VelDir kind);

/**
 * Returns the folder of what is installed for the desktop's programs: its pictures and help pages.
 *
 * It is found from where this library lies, so that a prefix may be moved; where nothing is
 * installed there, it is the folder that the library was built for. The environment has no say.
 *
 * @return the absolute path, in UTF-8 and without a trailing "/"; it need not exist
 */
VELCORE_EXPORT std::string velInstalledDataDir();
