// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <system_error>

class FileProgress;

/**
 * How much a menu's folder may hold that is copied in one go. A folder of the disk that was dropped by
 * mistake would keep the user waiting for hours.
 */
namespace TreeLimits {

constexpr int MostLevels = 100;
constexpr int MostItems = 100000;

/// Whether \a items were met, the last of them \a levels folders deep.
constexpr bool areMet(int levels, int items)
{
    return levels >= MostLevels || items >= MostItems;
}

/// Why \a path, with everything below it and links not followed, is too much to copy; no error when
/// it is not. Has \a progress expect it.
std::error_code check(const std::filesystem::path &path, FileProgress &progress);

} // namespace TreeLimits
