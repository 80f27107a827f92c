// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

#include <string>
#include <vector>

/**
 * What a program needs that has a start menu follow the applications all the time. Others call
 * UpdateStartMenu() when they begin.
 *
 * The functions may be called from any thread, while none changes the environment.
 *
 * \since 1.0
 */
namespace VelStartMenu {

/// How it is found out whether there is anything to do.
enum class Look {
    Folders, ///< by the times of the folders alone, which do not tell that a file was written to
    Files ///< by all files
};

/// What came of an update.
enum class Result {
    Failed, ///< not everything could be done, or no application was found; errno tells why
    Unchanged, ///< the menu was as it should be
    Changed ///< the menu has changed
};

/**
 * What UpdateStartMenu() does.
 *
 * @param menuDir the folder of the menu
 * @param templateDir what is copied where there is no menu; may be null or empty
 * @param look how closely to look
 */
VELINTEGRATION_EXPORT Result update(const char *menuDir, const char *templateDir, Look look);

/**
 * The folders in which it shows that applications came, went or changed: the "applications" folders
 * with all below them. Those that do not exist are among them, for they may come.
 */
VELINTEGRATION_EXPORT std::vector<std::string> followedFolders();

} // namespace VelStartMenu
