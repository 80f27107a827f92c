// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PreviousFolder.h"

#include "FolderRemoval.h"

#include <velcore/folderlock.h>

#include <cerrno>
#include <charconv>
#include <cstdio>
#include <string_view>
#include <system_error>
#include <vector>

#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

ino_t inodeOf(const fs::path &path)
{
    struct stat status = {};
    return lstat(path.c_str(), &status) == 0 ? status.st_ino : 0;
}

bool isOurs(const fs::path &path)
{
    struct stat status = {};
    return lstat(path.c_str(), &status) == 0 && status.st_uid == geteuid();
}

bool move(const fs::path &from, const fs::path &to)
{
    return std::rename(from.c_str(), to.c_str()) == 0;
}

// The number that \a text consists of; 0 for anything else.
ino_t numberIn(std::string_view text)
{
    ino_t number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    return error == std::errc() && end == text.data() + text.size() ? number : 0;
}

} // namespace

PreviousFolder::PreviousFolder(const fs::path &target, Exchange exchange)
    : m_target(target)
    , m_path(target)
    , m_exchange(exchange)
{
    m_path += ".previous";
}

// Where the copy before the last lies meanwhile, with the number of the new folder: by it can be
// told later how far a killed program came.
std::string PreviousFolder::keptName() const
{
    return "." + m_target.filename().string() + ".kept";
}

bool PreviousFolder::replaceTarget(const fs::path &folder) const
{
    const Vel::FolderLock turn(m_target.parent_path().string());
    const fs::path kept = m_target.parent_path() / (keptName() + std::to_string(inodeOf(folder)));
    if (pathExists(kept)) {
        errno = EEXIST;
        return false;
    }
    if (!replaceAtOnce(folder, kept)) {
        const bool isUnknown = errno == EINVAL || errno == ENOSYS || errno == EOPNOTSUPP;
        if (!isUnknown || !replaceInSteps(folder, kept))
            return false;
    }
    removeAll(kept);
    return true;
}

// The new folder first takes the place of the copy, then that of the target in one step. When that
// fails, errno tells why.
bool PreviousFolder::replaceAtOnce(const fs::path &folder, const fs::path &kept) const
{
    const bool hasCopy = pathExists(m_path);
    if (!move(folder, kept))
        return false;
    const bool isInPlace = hasCopy ? m_exchange(kept.c_str(), m_path.c_str()) == 0 : move(kept, m_path);
    if (isInPlace && m_exchange(m_path.c_str(), m_target.c_str()) == 0)
        return true;
    const int reason = errno;
    if (isInPlace && hasCopy)
        m_exchange(kept.c_str(), m_path.c_str());
    else if (isInPlace)
        move(m_path, kept);
    move(kept, folder);
    errno = reason;
    return false;
}

// For a file system that cannot exchange anything. For a moment there is no target, but the copy.
bool PreviousFolder::replaceInSteps(const fs::path &folder, const fs::path &kept) const
{
    const bool hasCopy = pathExists(m_path);
    if (hasCopy && !move(m_path, kept))
        return false;
    const bool isAway = move(m_target, m_path);
    if (isAway && move(folder, m_target))
        return true;
    const int reason = errno;
    if (isAway)
        move(m_path, m_target);
    if (hasCopy)
        move(kept, m_path);
    errno = reason;
    return false;
}

void PreviousFolder::recover() const
{
    const std::string start = keptName();
    std::vector<fs::path> found;
    std::error_code error;
    for (fs::directory_iterator it(m_target.parent_path(), error), end; !error && it != end;
         it.increment(error)) {
        if (it->path().filename().string().compare(0, start.size(), start) == 0 && isOurs(it->path()))
            found.push_back(it->path());
    }
    if (found.empty())
        return;
    const Vel::FolderLock turn(m_target.parent_path().string());
    for (const fs::path &kept : found) {
        const ino_t made = numberIn(std::string_view(kept.filename().native()).substr(start.size()));
        if (turn.isHeld() && made != 0 && pathExists(kept))
            recover(kept, made);
    }
}

// \a made is the number of the folder that was new when \a kept was given its name.
void PreviousFolder::recover(const fs::path &kept, ino_t made) const
{
    if (inodeOf(kept) != made && !pathExists(m_path)) {
        move(kept, m_path);
        return;
    }
    if (inodeOf(m_path) == made && m_exchange(kept.c_str(), m_path.c_str()) != 0)
        return;
    removeAll(kept);
}
