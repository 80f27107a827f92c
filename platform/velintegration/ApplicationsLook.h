// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FolderStamp.h"
#include "MenuApplications.h"

#include <string>
#include <vector>

/// The applications that belong into a start menu, and by what it is noticed that they changed.
struct ApplicationsLook
{
    MenuApplications found;
    std::vector<FolderStamp> stamps; ///< of all folders on which it depends what is found
    std::string environment; ///< see MenuSources
    std::string searchPath;

    static ApplicationsLook now();

    /// A digest of the variables on which it depends what is found.
    static std::string environmentNow();
    /// A digest of PATH.
    static std::string searchPathNow();
};
