// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderStamp.h"

#include "ContentsDigest.h"

#include <algorithm>
#include <charconv>
#include <ctime>
#include <iterator>
#include <limits>
#include <memory>
#include <string_view>
#include <vector>

#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>

namespace {

// Some file systems keep no more of a time than every second second.
constexpr time_t SettledAfter = 2;

constexpr std::size_t UsualNumbers = 80; // bytes that they take in a line

// A folder may have hundreds of files with six numbers each: they are written where they are to stand.
template <typename Number>
void append(Number number, std::string *text)
{
    char digits[std::numeric_limits<Number>::digits10 + 2];
    text->append(digits, std::to_chars(std::begin(digits), std::end(digits), number).ptr);
}

void append(const timespec &time, std::string *text)
{
    append(time.tv_sec, text);
    *text += '.';
    append(time.tv_nsec, text);
}

void appendTimes(const struct stat &status, std::string *text)
{
    append(status.st_mtim, text);
    *text += ',';
    append(status.st_ctim, text);
    *text += ',';
    append(status.st_dev, text);
    *text += ':';
    append(status.st_ino, text);
}

std::string timesOf(const struct stat &status)
{
    std::string text;
    appendTimes(status, &text);
    return text;
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
        const std::string_view name = entry->d_name;
        if (name == "." || name == "..")
            continue;
        std::string &line = lines.emplace_back();
        line.reserve(name.size() + UsualNumbers);
        line = name;
        // A folder has a stamp of its own.
        if (fstatat(dirfd(folder.get()), entry->d_name, &status, 0) != 0 || S_ISDIR(status.st_mode))
            continue;
        line += '/';
        appendTimes(status, &line);
        line += ',';
        append(status.st_size, &line);
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
