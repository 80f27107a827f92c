// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velcore/velcore_export.h>

#include <functional>
#include <string>
#include <string_view>

#include <sys/stat.h>

namespace Vel {

/**
 * A small regular file, read whole.
 *
 * What is no regular file (a named pipe, a device) or larger than the limit is not read. The file
 * stays open for as long as this object lives, so that no later file can be mistaken for it.
 *
 * Different objects may be used in different threads; one object may not.
 *
 * \since 1.0
 */
class VELCORE_EXPORT SmallFile
{
public:
    /// A larger file is not read, in bytes.
    static constexpr std::size_t LargestSize = 1024 * 1024;

    /// Reads what \a path leads to.
    explicit SmallFile(const std::string &path);
    ~SmallFile();
    SmallFile(const SmallFile &) = delete;
    SmallFile &operator=(const SmallFile &) = delete;

    /// Whether there is no such file.
    bool isMissing() const { return m_isMissing; }
    /// Whether the file was read.
    bool isRead() const { return m_isRead; }
    /// What stood in the file; empty when it was not read.
    const std::string &bytes() const { return m_bytes; }
    /// Whether the path still leads to the same file as it was then, or still to none.
    bool isUnchanged() const;

private:
    bool read();

    std::string m_path;
    std::string m_bytes;
    struct stat m_status = {};
    int m_file;
    bool m_isMissing = false;
    bool m_isRead = false;
};

/**
 * Whether \a path is a symbolic link that somebody else may have planted, or leads through one.
 *
 * Such a link lies in a sticky folder that everybody may write to (as /tmp is), and belongs neither
 * to this user nor to the folder's owner. Whoever writes through it writes where another user
 * wanted it. Many kernels refuse to follow such a link by themselves; this asks where they don't.
 */
VELCORE_EXPORT bool leadsThroughPlantedLink(const std::string &path);

/// What an operation may leave behind when it is killed.
enum class Leftover {
    File, ///< a regular file
    Folder ///< a folder with everything in it
};

/**
 * Removes what killed operations left in \a folder: what belongs to this user, was last modified
 * more than an hour ago and is held by nobody with a lock (flock). Links are not followed.
 *
 * @param isName tells by its name what such an operation made
 */
VELCORE_EXPORT void removeLeftovers(const std::string &folder, Leftover kind,
                                    const std::function<bool(std::string_view)> &isName);

} // namespace Vel
