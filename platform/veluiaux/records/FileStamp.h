// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <cstdint>

struct stat;

/// What tells one state of a file on disk from another.
struct FileStamp
{
    std::uint64_t device = 0;
    std::uint64_t inode = 0;
    std::int64_t size = 0;
    std::int64_t modified = 0; ///< nanoseconds since 1970
    std::int64_t changed = 0; ///< nanoseconds since 1970

    FileStamp() = default;
    explicit FileStamp(const struct stat &status);

    bool operator==(const FileStamp &other) const;

    /// Whether a change after \a now, in nanoseconds since 1970, is sure to give another stamp:
    /// neither time is younger than 50 ms then, or 2 s where the file system seems to keep whole
    /// seconds only, or every second one.
    bool isSettled(std::int64_t now) const;
    /// The same for this moment.
    bool isSettled() const;
};
