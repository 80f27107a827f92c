// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderStamp.h"

#include "ContentsDigest.h"

#include <algorithm>
#include <ctime>
#include <memory>
#include <vector>

#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>

namespace {

// Some file systems keep no more of a time than every second second.
constexpr time_t SettledAfter = 2;

std::string text(const timespec &time)
{
    return std::to_string(time.tv_sec) + '.' + std::to_string(time.tv_nsec);
}

std::string timesOf(const struct stat &status)
{
    return text(status.st_mtim) + ',' + text(status.st_ctim) + ',' + std::to_string(status.st_dev) + ':'
        + std::to_string(status.st_ino);
}

bool isFolder(const std::string &path, struct stat *status)
{
    return stat(path.c_str(), status) == 0 && S_ISDIR(status->st_mode);
}

// A clock that was set back must not make a folder old.
bool isYoung(const struct stat &status)
{
    const time_t now = time(nullptr);
    return status.st_ctim.tv_sec + SettledAfter >= now;
}

std::string contentsOf(const std::string &path)
{
    const std::unique_ptr<DIR, int (*)(DIR *)> folder(opendir(path.c_str()), closedir);
    if (!folder)
        return "unreadable";
    std::vector<std::string> lines;
    while (const dirent *entry = readdir(folder.get())) {
        struct stat status = {};
        const std::string name = entry->d_name;
        if (name == "." || name == "..")
            continue;
        const bool isThere = fstatat(dirfd(folder.get()), entry->d_name, &status, 0) == 0;
        // A folder has a stamp of its own.
        lines.push_back(isThere && !S_ISDIR(status.st_mode)
                            ? name + '/' + timesOf(status) + ',' + std::to_string(status.st_size)
                            : name);
    }
    std::sort(lines.begin(), lines.end());
    std::string all;
    for (const std::string &line : lines)
        all += line + '\n';
    return contentsDigest(all);
}

} // namespace

FolderStamp FolderStamp::of(const std::string &path)
{
    FolderStamp stamp = withoutContents(path);
    struct stat status = {};
    if (isFolder(path, &status) && isYoung(status))
        stamp.contents = contentsOf(path);
    return stamp;
}

FolderStamp FolderStamp::withoutContents(const std::string &path)
{
    struct stat status = {};
    return {path, isFolder(path, &status) ? timesOf(status) : std::string(), {}};
}

bool FolderStamp::isCurrent() const
{
    return times == withoutContents(path).times && (contents.empty() || contents == contentsOf(path));
}

bool FolderStamp::canSettle() const
{
    struct stat status = {};
    return !contents.empty() && isFolder(path, &status) && !isYoung(status);
}
