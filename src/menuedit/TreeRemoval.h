// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <string>

/**
 * Removing of one file or folder with everything in it, on the bytes that the file system knows.
 * Links are removed, not followed.
 */
namespace TreeRemoval {

/// Removes \a path, folders that may not be written included.
void remove(const std::filesystem::path &path);

/// The same for \a name in the open folder \a parent.
void removeAt(int parent, const std::string &name);

} // namespace TreeRemoval
