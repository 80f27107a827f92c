// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <string>
#include <system_error>

class FileProgress;

/**
 * Removing of one file or folder with everything in it, on the bytes that the file system knows:
 * names that are no valid text go like any other. Links are removed, not followed.
 */
namespace TreeRemoval {

using Path = std::filesystem::path;

/// What came of a removal.
struct Result
{
    /// Why something is still there; no error when nothing is.
    std::error_code error;
    /// The first path that could not be removed.
    Path path;

    bool succeeded() const { return !error; }
};

/// Removes \a path as far as the user may; goes on after what cannot be removed. When \a progress
/// says no, it is errc::operation_canceled, and what is not yet removed stays.
Result remove(const Path &path, FileProgress &progress);

/// Removes what is ours, folders that may not be written included, whatever \a progress says.
void removeOwn(const Path &path, FileProgress &progress);

/// The same for \a name in the open folder \a parent, which nobody follows.
void removeOwnAt(int parent, const std::string &name);

} // namespace TreeRemoval
