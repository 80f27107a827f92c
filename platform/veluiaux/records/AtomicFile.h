// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFile.h"

#include <QByteArray>

#include <optional>
#include <string_view>

/**
 * Replaces files whole: the new contents stand beside the old file, are on disk, and then
 * take its name. When anything fails the old file is untouched and nothing is left beside it.
 */
namespace AtomicFile {

/// The file that \a path leads to through any symbolic links, which need not exist; empty if
/// they lead in a circle.
QByteArray target(const QByteArray &path);

/**
 * Gives \a target, which is no symbolic link, the contents \a bytes.
 *
 * Keeps the permissions (and, where it may, the owner) of an existing file, which has to be a
 * regular one that the caller may write to. Makes no folder.
 *
 * @return the stamp of the new file; none if it could not be written
 */
std::optional<FileStamp> replace(const QByteArray &target, std::string_view bytes);

} // namespace AtomicFile
