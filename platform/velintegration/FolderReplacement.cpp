// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderReplacement.h"

#include <algorithm>
#include <cerrno>
#include <string>
#include <system_error>

#include <fcntl.h>
#include <stdio.h>
#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

constexpr int MostLinks = 40;

// Where a path leads, with all links followed; empty when they lead in a circle.
fs::path resolved(const fs::path &path)
{
    std::error_code error;
    fs::path result = fs::canonical(path, error);
    if (!error)
        return result;
    result = fs::absolute(path, error);
    if (!result.has_filename()) // a trailing "/"
        result = result.parent_path();
    for (int i = 0; i < MostLinks; ++i) {
        if (!fs::is_symlink(fs::symlink_status(result, error)))
            return result;
        const fs::path next = fs::read_symlink(result, error);
        if (error)
            return {};
        result = next.is_absolute() ? next : result.parent_path() / next;
    }
    return {};
}

bool pathExists(const fs::path &path)
{
    std::error_code error;
    return fs::exists(fs::symlink_status(path, error));
}

// Removes a folder even where a folder in it is read-only; links are removed, not followed.
void removeAll(const fs::path &folder)
{
    std::error_code error;
    const auto makeWritable = [](const fs::path &path) {
        std::error_code ignored;
        fs::permissions(path, fs::perms::owner_all, fs::perm_options::add, ignored);
    };
    makeWritable(folder);
    for (fs::recursive_directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
        if (fs::is_directory(it->symlink_status(error)))
            makeWritable(it->path());
    }
    fs::remove_all(folder, error);
}

} // namespace

int FolderReplacement::exchangePaths(const char *first, const char *second)
{
    return renameat2(AT_FDCWD, first, AT_FDCWD, second, RENAME_EXCHANGE);
}

FolderReplacement::FolderReplacement(const fs::path &target, Exchange exchange)
    : m_target(resolved(target))
    , m_exchange(exchange)
{
    std::error_code error;
    const bool isReplaceable = m_target.has_filename()
        && (!pathExists(m_target) || fs::is_directory(fs::symlink_status(m_target, error)));
    if (!isReplaceable || !makeParents() || !makeFolder())
        m_folder.clear();
}

FolderReplacement::~FolderReplacement()
{
    if (isOpen())
        removeAll(m_folder);
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

fs::path FolderReplacement::freeName(const char *purpose) const
{
    const std::string start = "." + m_target.filename().string() + "." + purpose + std::to_string(getpid());
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
        if (mkdir(m_folder.c_str(), 0777) == 0)
            return true;
    } while (errno == EEXIST);
    return false;
}

bool FolderReplacement::commit()
{
    const bool done = pathExists(m_target) ? replaceOld() : rename(m_folder.c_str(), m_target.c_str()) == 0;
    if (!done)
        return false;
    m_folder.clear();
    m_madeParents.clear();
    return true;
}

bool FolderReplacement::replaceOld()
{
    struct stat old = {};
    if (stat(m_target.c_str(), &old) != 0 || chmod(m_folder.c_str(), old.st_mode & 07777) != 0)
        return false;
    if (m_exchange(m_folder.c_str(), m_target.c_str()) != 0) {
        const bool isUnknown = errno == EINVAL || errno == ENOSYS || errno == EOPNOTSUPP;
        return isUnknown && replaceInTwoSteps();
    }
    removeAll(m_folder); // the old one lies there now
    return true;
}

bool FolderReplacement::replaceInTwoSteps()
{
    const fs::path old = freeName("old");
    if (rename(m_target.c_str(), old.c_str()) != 0)
        return false;
    if (rename(m_folder.c_str(), m_target.c_str()) != 0) {
        rename(old.c_str(), m_target.c_str());
        return false;
    }
    removeAll(old);
    return true;
}
