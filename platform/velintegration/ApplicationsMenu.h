// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>

/**
 * Fills a folder with a menu of the applications that are installed: a folder for each main
 * category that has any, with copies of their entries.
 *
 * @param folder an existing, empty folder
 * @return false when there is no application (errno is ENODATA then), or something could not be copied or
 *         written (errno tells why)
 */
bool buildApplicationsMenu(const std::filesystem::path &folder);
