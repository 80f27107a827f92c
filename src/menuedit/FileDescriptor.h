// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <cerrno>
#include <system_error>
#include <utility>

#include <unistd.h>

/// What the system said last.
inline std::error_code lastError()
{
    return {errno, std::generic_category()};
}

/**
 * An open file or folder, closed in the end.
 */
class FileDescriptor
{
public:
    /// Takes \a fd, which may be that of a file that could not be opened.
    explicit FileDescriptor(int fd)
        : m_fd(fd)
    {
    }
    ~FileDescriptor()
    {
        if (m_fd >= 0)
            ::close(m_fd);
    }
    FileDescriptor(const FileDescriptor &) = delete;
    FileDescriptor &operator=(const FileDescriptor &) = delete;

    int fd() const { return m_fd; }
    bool isOpen() const { return m_fd >= 0; }
    /// Closing tells of errors that writing could not know yet.
    bool close() { return ::close(std::exchange(m_fd, -1)) == 0; }

private:
    int m_fd;
};
