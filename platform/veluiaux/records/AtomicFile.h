// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileDescriptor.h"

#include <QByteArray>

#include <sys/stat.h>

#include <memory>
#include <optional>
#include <string>
#include <string_view>

/**
 * Replaces files whole: the new contents stand beside the old file, are on disk, and then
 * take its name. When anything fails the old file is untouched and nothing is left beside it.
 * All of it happens in the folder that was opened first, whatever that is called meanwhile.
 */
namespace AtomicFile {

/// A place for a file, whatever links led there.
struct Target
{
    QByteArray path;
    bool exists = false;
    struct stat status = {}; ///< of what exists
    std::shared_ptr<const FileDescriptor> folder; ///< open; null if there is no such folder

    /// The last part of the path.
    const char *name() const { return path.constData() + path.lastIndexOf('/') + 1; }
    /// The path of the folder; empty for the current one.
    std::string_view folderPath() const { return {path.constData(), std::size_t(path.lastIndexOf('/') + 1)}; }
};

/// The file that \a path leads to through any symbolic links, which need not exist; none if
/// they lead in a circle, one may have been planted by another user (see
/// Vel::leadsThroughPlantedLink) or it cannot be told what is there.
std::optional<Target> find(const QByteArray &path);

/// Whether the same file stands at the target, or still none, as when it was found.
bool isUnchanged(const Target &target);

/**
 * New contents that stand on disk beside their target, ready to take its place; gone with this
 * object unless they did.
 *
 * Keeps the rights of an existing file (see FileRights), which has to be a regular one that the
 * caller may write to. Makes no folder. Removes, once an hour in each folder, what such
 * replacements left there when they were killed.
 */
class Replacement
{
public:
    /// \a target has to live for as long as this object.
    Replacement(const Target &target, std::string_view bytes);
    ~Replacement();
    Replacement(const Replacement &) = delete;
    Replacement &operator=(const Replacement &) = delete;

    /// Whether the contents are there; if not, nothing is.
    bool isReady() const { return m_isReady; }
    /// Takes the target's place; false if that failed.
    bool commit();

private:
    int create(mode_t mode);

    const Target &m_target;
    std::string m_name; ///< empty when there is no such file
    bool m_isReady = false;
};

} // namespace AtomicFile
