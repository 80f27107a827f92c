// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>

/// Copies a regular file, following links. The copy has its permissions as far as the umask lets it,
/// never set-id bits, and can be written by its owner. When it fails, errno tells why.
bool copyFile(const std::filesystem::path &from, const std::filesystem::path &to);

/**
 * Copies what is in a folder into another one. Links are followed, so that the copies stand
 * alone; links that lead nowhere or back to a folder around them are left out, and so is
 * what is neither file nor folder.
 *
 * @param from the folder to copy
 * @param to an existing folder; is left out where it lies in \a from
 * @return false when something could not be read or written, or when there is more of it than
 *         FolderLimits lets pass
 */
bool copyFolderContents(const std::filesystem::path &from, const std::filesystem::path &to);
