// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <memory>
#include <string>
#include <vector>

#include <dirent.h>

/**
 * Folders that are open: what is done in them happens there, whatever comes to stand at their path.
 */
namespace OpenFolder {

using Stream = std::unique_ptr<DIR, int (*)(DIR *)>;

/// The folder \a name in the open folder \a parent; null where it cannot be read or is none, as
/// links are.
Stream open(int parent, const char *name);

/// The names of all that \a folder holds, as the file system knows them.
std::vector<std::string> namesIn(DIR *folder);

} // namespace OpenFolder
