// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderReplacement.h"

#include "FolderRemoval.h"
#include "ResolvedFolder.h"

#include <velcore/files.h>

#include <algorithm>
#include <cerrno>
#include <string>
#include <string_view>
#include <system_error>

#include <fcntl.h>
#include <stdio.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

// Whether \a text is made of two numbers with a "-" between them.
bool isPair(std::string_view text)
{
    const std::size_t middle = text.find('-');
    const auto isNumber = [](std::string_view part) {
        return !part.empty() && part.find_first_not_of("0123456789") == std::string_view::npos;
    };
    return middle != std::string_view::npos && isNumber(text.substr(0, middle))
        && isNumber(text.substr(middle + 1));
}

// What the new folder may get of the old one's permissions: none that hold for another owner or
// group than before.
mode_t permissionsFor(const struct stat &folder, const struct stat &old, bool hasAccessList)
{
    const bool isGroup = folder.st_gid == old.st_gid;
    mode_t bits = old.st_mode & (S_IRWXU | S_IRWXG | S_IRWXO);
    // With an access list the group's bits are its mask, and the list goes.
    if (!isGroup || hasAccessList)
        bits = (bits & S_IRWXU) | (bits & (bits >> 3) & S_IRWXO) * 011;
    return isGroup && folder.st_uid == old.st_uid ? bits | (old.st_mode & 07000) : bits;
}

// Gives a folder the permissions of the one that it is to replace.
bool takePermissions(const fs::path &folder, const fs::path &old)
{
    struct stat status = {};
    struct stat oldStatus = {};
    if (stat(old.c_str(), &oldStatus) != 0 || stat(folder.c_str(), &status) != 0)
        return false;
    if (status.st_gid != oldStatus.st_gid && lchown(folder.c_str(), uid_t(-1), oldStatus.st_gid) == 0)
        status.st_gid = oldStatus.st_gid;
    const bool hasAccessList = getxattr(old.c_str(), "system.posix_acl_access", nullptr, 0) > 0;
    return chmod(folder.c_str(), permissionsFor(status, oldStatus, hasAccessList)) == 0;
}

} // namespace

int FolderReplacement::exchangePaths(const char *first, const char *second)
{
    return renameat2(AT_FDCWD, first, AT_FDCWD, second, RENAME_EXCHANGE);
}

FolderReplacement::FolderReplacement(const fs::path &target, Exchange exchange)
    : m_target(resolvedFolder(target))
    , m_exchange(exchange)
{
    if (!isReplaceable())
        return;
    PreviousFolder(m_target, m_exchange).recover();
    removeLeftovers();
    if (makeParents() && makeFolder())
        return;
    m_error = errno;
    m_folder.clear();
}

bool FolderReplacement::isReplaceable()
{
    std::error_code error;
    if (m_target.empty())
        m_error = EPERM;
    else if (!m_target.has_filename())
        m_error = EBUSY;
    else if (pathExists(m_target) && !fs::is_directory(fs::symlink_status(m_target, error)))
        m_error = ENOTDIR;
    return m_error == 0;
}

FolderReplacement::~FolderReplacement()
{
    if (isOpen())
        removeAll(m_folder);
    if (m_lock >= 0)
        close(m_lock);
    std::error_code error;
    for (auto it = m_madeParents.rbegin(); it != m_madeParents.rend(); ++it)
        fs::remove(*it, error);
}

bool FolderReplacement::makeParents()
{
    std::vector<fs::path> missing;
    for (fs::path path = m_target.parent_path(); !pathExists(path); path = path.parent_path())
        missing.push_back(path);
    for (auto it = missing.rbegin(); it != missing.rend(); ++it) {
        if (mkdir(it->c_str(), 0777) == 0)
            m_madeParents.push_back(*it);
        else if (errno != EEXIST)
            return false;
    }
    return true;
}

std::string FolderReplacement::nameFor(const char *purpose) const
{
    return "." + m_target.filename().string() + "." + purpose;
}

// As long as the target is gone, the old folder is the only one that there is.
void FolderReplacement::removeLeftovers() const
{
    const auto isOurs = [this](std::string_view name) {
        const auto isOf = [name](const std::string &start) {
            return name.substr(0, start.size()) == start && isPair(name.substr(start.size()));
        };
        return isOf(nameFor("new")) || (isOf(nameFor("old")) && pathExists(m_target));
    };
    Vel::removeLeftovers(m_target.parent_path().string(), Vel::Leftover::Folder, isOurs);
}

fs::path FolderReplacement::freeName(const char *purpose) const
{
    const std::string start = nameFor(purpose) + std::to_string(getpid());
    for (int i = 0;; ++i) {
        fs::path path = m_target.parent_path() / (start + "-" + std::to_string(i));
        if (!pathExists(path))
            return path;
    }
}

bool FolderReplacement::makeFolder()
{
    do {
        m_folder = freeName("new");
        if (mkdir(m_folder.c_str(), 0777) == 0) {
            // Tells that it is in use, however long the building takes.
            m_lock = open(m_folder.c_str(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC);
            if (m_lock >= 0)
                flock(m_lock, LOCK_SH | LOCK_NB);
            return true;
        }
    } while (errno == EEXIST);
    return false;
}

bool FolderReplacement::commit()
{
    const bool done = pathExists(m_target) ? replaceOld() : rename(m_folder.c_str(), m_target.c_str()) == 0;
    if (!done) {
        m_error = errno;
        return false;
    }
    m_folder.clear();
    m_madeParents.clear();
    return true;
}

bool FolderReplacement::replaceOld()
{
    return takePermissions(m_folder, m_target)
        && PreviousFolder(m_target, m_exchange).replaceTarget(m_folder);
}
