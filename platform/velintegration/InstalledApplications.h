// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

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
 */
std::vector<InstalledApplication> installedApplications();
