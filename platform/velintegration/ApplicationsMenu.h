// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuApplications.h"

#include <filesystem>
#include <vector>

/**
 * Fills a folder with a menu of applications: a folder for each main category that has any, with
 * copies of their entries.
 *
 * @param folder an existing, empty folder
 * @param applications as found by findMenuApplications()
 * @return false when there is no application (errno is ENODATA then), or something could not be copied or
 *         written (errno tells why)
 */
bool buildApplicationsMenu(const std::filesystem::path &folder,
                           const std::vector<MenuApplication> &applications);
