// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileStamp.h"

#include <ctime>
#include <sys/stat.h>

namespace {

constexpr std::int64_t Second = 1000000000;
constexpr std::int64_t SettlingTime = Second / 20;
constexpr std::int64_t CoarseSettlingTime = 2 * Second;

std::int64_t nanoseconds(const timespec &time)
{
    return std::int64_t(time.tv_sec) * Second + time.tv_nsec;
}

} // namespace

FileStamp::FileStamp(const struct stat &status)
    : device(status.st_dev)
    , inode(status.st_ino)
    , size(status.st_size)
    , modified(nanoseconds(status.st_mtim))
    , changed(nanoseconds(status.st_ctim))
{
}

bool FileStamp::operator==(const FileStamp &other) const
{
    return device == other.device && inode == other.inode && size == other.size && modified == other.modified
        && changed == other.changed;
}

bool FileStamp::isSettled(std::int64_t now) const
{
    // A second that was written to once can be written to again without another stamp.
    const bool isWhole = modified % Second == 0 && changed % Second == 0;
    const bool isEven = modified % (2 * Second) == 0;
    const std::int64_t latest = now - (isWhole || isEven ? CoarseSettlingTime : SettlingTime);
    return modified <= latest && changed <= latest;
}

bool FileStamp::isSettled() const
{
    timespec now;
    ::clock_gettime(CLOCK_REALTIME, &now);
    return isSettled(nanoseconds(now));
}
