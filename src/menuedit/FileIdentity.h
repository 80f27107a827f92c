// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * What tells that a file is still the same: its place on disk, its size and its times.
 */
class FileIdentity
{
public:
    /// Of no file.
    FileIdentity() = default;
    /// Of the file at \a path as it is now; of no file when there is none. Follows links.
    explicit FileIdentity(const QString &path);

    bool operator==(const FileIdentity &other) const;
    /// Whether it is the same file, be it changed or not.
    bool isSameFile(const FileIdentity &other) const
    {
        return m_device == other.m_device && m_inode == other.m_inode;
    }

    /// A number that another identity has by a chance of one in 2^64 only, where thousands are kept.
    quint64 mark() const;

    bool isRegularFile() const { return m_isRegularFile; }
    /// Whether the last change is long enough ago that another would have another time.
    bool isSettled() const { return isSettledAt(now()); }
    /// The same of a moment in the past, behind which the file has not changed then.
    bool isSettledAt(qint64 time) const;
    /// This moment, in nanoseconds.
    static qint64 now();

private:
    quint64 m_device = 0;
    quint64 m_inode = 0;
    qint64 m_size = 0;
    qint64 m_modified = 0; // nanoseconds, as the next one
    qint64 m_changed = 0;
    bool m_isRegularFile = false;
};
