// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

#include <sys/stat.h>

#include <optional>
#include <string_view>

/**
 * Replaces files whole: the new contents stand beside the old file, are on disk, and then
 * take its name. When anything fails the old file is untouched and nothing is left beside it.
 */
namespace AtomicFile {

/// A place for a file, whatever links led there.
struct Target
{
    QByteArray path;
    bool exists = false;
    struct stat status = {}; ///< of what exists
};

/// The file that \a path leads to through any symbolic links, which need not exist; none if
/// they lead in a circle or it cannot be told what is there.
std::optional<Target> find(const QByteArray &path);

/**
 * Gives \a target the contents \a bytes; false if that failed.
 *
 * Keeps the permissions (and, where it may, the owner) of an existing file, which has to be a
 * regular one that the caller may write to. Makes no folder.
 */
bool replace(const Target &target, std::string_view bytes);

} // namespace AtomicFile
