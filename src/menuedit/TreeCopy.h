// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <system_error>

class FileProgress;

/**
 * Copying and moving of one file or folder with everything in it, on the bytes that
 * the file system knows: names that are no valid text are carried along like any other.
 *
 * No operation overwrites anything; a target that exists is errc::file_exists. Each takes back all
 * that it did when its progress says no, which is errc::operation_canceled.
 */
namespace TreeCopy {

using Path = std::filesystem::path;

/// Copies \a source to \a target, which appears when the copy is complete. A copy is a new file of
/// the user's: it has the permissions of the source as far as the umask lets it, never set-id bits.
std::error_code copy(const Path &source, const Path &target, FileProgress &progress);

/// Moves \a source to \a target, by copying where they lie on different file systems. The permissions
/// stay, set-id bits only together with owner and group.
std::error_code move(const Path &source, const Path &target, FileProgress &progress);

/// The same where that takes one step; errc::cross_device_link where a copy has to be made.
std::error_code moveAtOnce(const Path &source, const Path &target, FileProgress &progress);

} // namespace TreeCopy
