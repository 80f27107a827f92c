// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FolderStamp.h"

#include <QString>

#include <string>
#include <vector>

class VelUIDesktopEntry;

/// An application that belongs into a start menu.
struct MenuApplication
{
    std::string id; ///< as of InstalledApplication
    std::string path; ///< of its entry
    std::string fileName; ///< of its entry
    int category = 0; ///< the place in menuCategories()
    QString shownName;
    QString name; ///< without a language
    QString exec;
    std::string digest; ///< of its entry; see ContentsDigest.h
};

/// The applications that belong into a start menu, and where that was found.
struct MenuApplications
{
    std::vector<MenuApplication> all; ///< in the order of installedApplications()
    std::vector<FolderStamp> stamps; ///< of the folders, from before they were looked through
    std::vector<std::string> programFolders; ///< where the programs were looked for that TryExec names
    bool usesSearchPath = false; ///< whether PATH is where some of them were looked for
};

/// Finds the applications that are installed and displayable.
MenuApplications findMenuApplications();

/// The name that an entry is shown by.
QString shownNameOf(const VelUIDesktopEntry &entry);
