// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <system_error>

#include <sys/stat.h>

class FileProgress;

/**
 * Copying of one file, and who may do what with the copy.
 */
namespace FileCopy {

/// A copy is a new file of the user's; what is moved stays what it was.
enum class Kind { Copy, Move };

/// Copies the contents of the regular file \a source to \a target, which must not exist yet. When
/// \a progress says no, it is errc::operation_canceled, and a part stays.
std::error_code copy(const std::filesystem::path &source, const std::filesystem::path &target, Kind kind,
                     FileProgress &progress);

/// Makes the folder \a target, which the owner can fill, for a copy of one of the status \a source.
bool makeFolder(const std::filesystem::path &target, const struct stat &source, Kind kind);

/// Takes away what the owner was given for the time of filling.
bool finishFolder(const std::filesystem::path &target, const struct stat &source, Kind kind);

} // namespace FileCopy
