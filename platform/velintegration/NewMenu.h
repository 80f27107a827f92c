// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ApplicationsLook.h"
#include "MenuSources.h"

#include <filesystem>

/// A start menu that is made anew, and what an update of it has to know later.
namespace NewMenu {

enum class Outcome {
    Made,
    Failed, ///< what there was is as it was
    Found ///< there is a menu already
};

/// A new menu in the place of whatever is there. What is remembered of the menu is brought up to date
/// where something is remembered. When it fails, errno tells why, as after CreateStartMenu().
Outcome replace(const std::filesystem::path &menu, const char *templateDir, const ApplicationsLook &look);

/// A new menu where there is none; what an update has to know is remembered from now on. When it
/// fails, errno tells why.
Outcome makeMissing(const std::filesystem::path &menu, const char *templateDir, const ApplicationsLook &look);

/// Sets what tells that there is nothing to do, as of now.
void setStamps(const std::filesystem::path &menu, const ApplicationsLook &look, MenuSources *sources);

} // namespace NewMenu
