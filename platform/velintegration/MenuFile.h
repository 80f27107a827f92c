// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <string>

/**
 * How the entries of a menu are changed by themselves, while others may edit them: whole or not at
 * all, and only where there still stands what is expected. The last look and the change lie under the
 * lock on the folder that all savings take.
 *
 * What is being written stands in a file beside it whose name no menu shows; see isTemporary().
 */
namespace MenuFile {

/// A desktop entry as it is to stand in a menu.
struct Contents
{
    std::string bytes;
    unsigned permissions = 0666; ///< as far as the umask lets them
};

/// What a file holds and who may use it, and its owner to write to it; false if it cannot be read.
bool read(const std::filesystem::path &path, Contents *contents);

/// Makes a file where there is nothing.
bool add(const std::filesystem::path &path, const Contents &contents);

/// Replaces a file with that digest; it keeps its permissions.
bool replace(const std::filesystem::path &path, const std::string &digest, const std::string &bytes);

/// Removes a file with that digest.
bool remove(const std::filesystem::path &path, const std::string &digest);

/// Makes a file at \a to, where there is nothing, and removes the one at \a from, which has that digest.
bool move(const std::filesystem::path &from, const std::string &digest, const std::filesystem::path &to,
          const Contents &contents);

/// Gives a file or folder a name that nothing has.
bool renameToFree(const std::filesystem::path &from, const std::filesystem::path &to);

/// A name for something that is not finished yet, in \a folder.
std::filesystem::path temporaryIn(const std::filesystem::path &folder);

/// Whether a file or folder of that name was made by temporaryIn().
bool isTemporary(const std::string &name);

} // namespace MenuFile
