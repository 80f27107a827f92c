// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StagingFolder.h"

#include "FileDescriptor.h"
#include "OpenFolder.h"
#include "TreeRemoval.h"

#include <algorithm>
#include <cstdlib>
#include <ctime>
#include <string>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

constexpr std::string_view StagingName = ".velcopy-";
constexpr std::size_t StagingLetters = 6;
constexpr time_t LeftoverAge = 60 * 60;

// Whether a copy of this user was killed that made this folder.
bool isLeftover(int parent, const std::string &name)
{
    struct stat status = {};
    if (!StagingFolder::isNameOfOne(name)
        || ::fstatat(parent, name.c_str(), &status, AT_SYMLINK_NOFOLLOW) != 0 || !S_ISDIR(status.st_mode)
        || status.st_uid != ::geteuid() || status.st_mtime >= ::time(nullptr) - LeftoverAge)
        return false;
    const OpenFolder::Stream folder = OpenFolder::open(parent, name.c_str());
    return folder && ::flock(::dirfd(folder.get()), LOCK_EX | LOCK_NB) == 0;
}

} // namespace

StagingFolder::StagingFolder(const std::filesystem::path &directory, FileProgress &progress)
    : m_progress(progress)
{
    const std::string letters(StagingLetters, 'X');
    std::string name = (directory / StagingName).string() + letters;
    if (!mkdtemp(name.data())) {
        m_error = lastError();
        return;
    }
    m_path = name;
    m_folder = ::open(name.c_str(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC);
    if (m_folder >= 0)
        ::flock(m_folder, LOCK_SH | LOCK_NB);
}

StagingFolder::~StagingFolder()
{
    if (!m_path.empty())
        TreeRemoval::removeOwn(m_path, m_progress);
    if (m_folder >= 0)
        ::close(m_folder);
}

bool StagingFolder::isNameOfOne(std::string_view name)
{
    if (name.substr(0, StagingName.size()) != StagingName)
        return false;
    name.remove_prefix(StagingName.size());
    return name.size() == StagingLetters && std::all_of(name.begin(), name.end(), [](char c) {
               return (c >= '0' && c <= '9') || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
           });
}

void StagingFolder::removeLeftovers(const std::filesystem::path &directory)
{
    const OpenFolder::Stream folder(::opendir(directory.c_str()), ::closedir);
    if (!folder)
        return;
    for (const std::string &name : OpenFolder::namesIn(folder.get())) {
        if (isLeftover(::dirfd(folder.get()), name))
            TreeRemoval::removeOwnAt(::dirfd(folder.get()), name);
    }
}
