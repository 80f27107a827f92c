// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <system_error>

/**
 * Changes of one file or folder that are done in one step, however large it is. Nothing is overwritten.
 */
namespace OneStep {

using Path = std::filesystem::path;

/// Renames \a source to \a target, which is errc::file_exists if it does.
std::error_code rename(const Path &source, const Path &target);

/// Whether \a path is a link with a relative text, which would point elsewhere from another folder.
bool isRelativeLink(const Path &path);

/// Makes \a target a link to what the link \a source points to.
std::error_code copyLink(const Path &source, const Path &target);

/// The same, and takes \a source away.
std::error_code moveLink(const Path &source, const Path &target);

} // namespace OneStep
