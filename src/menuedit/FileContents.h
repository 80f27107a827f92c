// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TreeCopy.h"

#include <QByteArray>
#include <QMap>

#include <sys/types.h>

#include <ctime>
#include <optional>

/**
 * A small file as it was at one time, to be put back exactly so: bytes, owner, permissions, extended
 * attributes and time. There may have been none.
 */
class FileContents
{
public:
    /// No file.
    FileContents() = default;
    /// What is at \a path; nullopt for what is no regular file, for one of more than 16 MiB and for one
    /// that cannot be read.
    static std::optional<FileContents> of(const TreeCopy::Path &path);

    bool exists() const { return m_exists; }
    /// Whether bytes, permissions and attributes are the same.
    bool operator==(const FileContents &other) const;
    bool operator!=(const FileContents &other) const { return !(*this == other); }

    /**
     * Puts this in place of \a expected at \a path, which is no link, in one step; takes the file
     * away when this is none.
     *
     * Something else that is found there stays; that is errc::file_exists or
     * errc::no_such_file_or_directory. So does \a expected after any other error.
     */
    std::error_code replace(const TreeCopy::Path &path, const FileContents &expected) const;

private:
    bool read(int fd);
    bool readAttributes(int fd);
    bool write(const TreeCopy::Path &path) const;
    bool giveRights(int fd) const;

    bool m_exists = false;
    QByteArray m_bytes;
    mode_t m_mode = 0;
    uid_t m_owner = 0;
    gid_t m_group = 0;
    timespec m_modified = {};
    QMap<QByteArray, QByteArray> m_attributes;
};
