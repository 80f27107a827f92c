// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/files.h>

#include <array>
#include <cerrno>
#include <climits>

#include <fcntl.h>
#include <unistd.h>

namespace {

constexpr int MostLinks = 40;

bool isSameTime(const timespec &left, const timespec &right)
{
    return left.tv_sec == right.tv_sec && left.tv_nsec == right.tv_nsec;
}

std::string folderOf(const std::string &path)
{
    return path.substr(0, path.rfind('/') + 1);
}

bool isPlanted(const struct stat &link, const std::string &folder)
{
    struct stat status = {};
    if (link.st_uid == geteuid())
        return false;
    if (stat(folder.empty() ? "." : folder.c_str(), &status) != 0)
        return true;
    constexpr mode_t OpenToAll = S_ISVTX | S_IWOTH;
    return (status.st_mode & OpenToAll) == OpenToAll && status.st_uid != link.st_uid;
}

} // namespace

Vel::SmallFile::SmallFile(const std::string &path)
    : m_path(path)
    // Without O_NONBLOCK a named pipe would wait for a writer.
    , m_file(open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY))
{
    m_isMissing = m_file < 0 && errno == ENOENT;
    m_isRead = m_file >= 0 && fstat(m_file, &m_status) == 0 && S_ISREG(m_status.st_mode)
        && m_status.st_size <= off_t(LargestSize) && read();
    if (!m_isRead)
        m_bytes.clear();
}

Vel::SmallFile::~SmallFile()
{
    if (m_file >= 0)
        close(m_file);
}

// The size may be wrong: some files of the kernel have none, others grow.
bool Vel::SmallFile::read()
{
    std::array<char, 4096> buffer;
    for (;;) {
        const ssize_t count = ::read(m_file, buffer.data(), buffer.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return count == 0;
        m_bytes.append(buffer.data(), std::size_t(count));
        if (m_bytes.size() > LargestSize)
            return false;
    }
}

bool Vel::SmallFile::isUnchanged() const
{
    struct stat now = {};
    if (stat(m_path.c_str(), &now) != 0)
        return errno == ENOENT && m_isMissing;
    return !m_isMissing && now.st_dev == m_status.st_dev && now.st_ino == m_status.st_ino
        && now.st_size == m_status.st_size && isSameTime(now.st_mtim, m_status.st_mtim)
        && isSameTime(now.st_ctim, m_status.st_ctim);
}

bool Vel::leadsThroughPlantedLink(const std::string &path)
{
    std::string at = path;
    for (int i = 0; i < MostLinks; ++i) {
        struct stat status = {};
        if (lstat(at.c_str(), &status) != 0 || !S_ISLNK(status.st_mode))
            return false;
        if (isPlanted(status, folderOf(at)))
            return true;
        std::array<char, PATH_MAX> text;
        const ssize_t length = readlink(at.c_str(), text.data(), text.size());
        if (length <= 0)
            return false;
        const std::string to(text.data(), std::size_t(length));
        at = to.front() == '/' ? to : folderOf(at) + to;
    }
    return false;
}
