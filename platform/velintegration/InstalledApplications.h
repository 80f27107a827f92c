// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <functional>
#include <string>
#include <vector>

/// A desktop entry in one of the "applications" folders.
struct InstalledApplication
{
    std::string id; ///< its path below "applications" with "-" for "/", ".desktop" included
    std::string path;
};

/**
 * The applications that are installed: the ".desktop" files in "applications" of XDG_DATA_HOME
 * and XDG_DATA_DIRS, in that order, sorted by path within each. A file whose id was seen before
 * is left out, whatever stands in the one that hides it; so are dot files, which no menu shows.
 *
 * @param onFolder called with the path of each folder before it is looked through, and with those of
 *        the "applications" folders that do not exist; may be empty
 */
std::vector<InstalledApplication> installedApplications(
    const std::function<void(const std::string &)> &onFolder = {});

/// The "applications" folders that are looked through, whether they exist or not.
std::vector<std::string> applicationFolders();
