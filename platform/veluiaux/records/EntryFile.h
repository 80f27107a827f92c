// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DesktopEntryText.h"

#include <QByteArray>

#include <cstdint>
#include <memory>
#include <optional>

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

    /// Whether a later change is sure to give another stamp: neither time is younger than 50 ms.
    bool isSettled() const;
};

/// A desktop entry file as it was read.
struct EntryFile
{
    /// A larger file is no desktop entry and is not read.
    static constexpr std::int64_t LargestSize = std::int64_t(1024) * 1024;

    std::shared_ptr<const DesktopEntryText> text;
    FileStamp stamp;
    bool settled = false; ///< the stamp alone tells whether the file has changed since

    /// Reads \a path, from memory when it has not changed; none if it is no regular file,
    /// is too large or cannot be read.
    static std::optional<EntryFile> read(const QByteArray &path);
    /// Reads \a path from disk.
    static std::optional<EntryFile> readAnew(const QByteArray &path);
};
