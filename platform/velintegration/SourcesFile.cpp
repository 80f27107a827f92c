// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SourcesFile.h"

#include "ResolvedFolder.h"

#include <array>
#include <cerrno>
#include <chrono>
#include <thread>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

using namespace std::chrono_literals;

namespace fs = std::filesystem;

namespace {

constexpr auto LongestWait = 10s;
constexpr auto Pause = 5ms;
constexpr std::size_t LargestSize = 16 * 1024 * 1024;
constexpr mode_t NewFile = 0666;

std::string readAll(int file)
{
    std::string bytes;
    std::array<char, 1 << 16> buffer;
    for (;;) {
        const ssize_t count = ::read(file, buffer.data(), buffer.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return count == 0 ? bytes : std::string();
        bytes.append(buffer.data(), std::size_t(count));
        if (bytes.size() > LargestSize)
            return {};
    }
}

bool writeAll(int file, const std::string &bytes)
{
    for (std::size_t done = 0; done < bytes.size();) {
        const ssize_t count = ::write(file, bytes.data() + done, bytes.size() - done);
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return false;
        done += std::size_t(count);
    }
    return true;
}

} // namespace

SourcesFile::SourcesFile(const fs::path &menu)
    : m_path(resolvedFolder(menu.string() + ".sources"))
{
}

SourcesFile::~SourcesFile()
{
    struct stat status = {};
    if (m_isMade && m_file >= 0 && isStillThere() && fstat(m_file, &status) == 0 && status.st_size == 0)
        unlink(m_path.c_str());
    unlock();
}

bool SourcesFile::exists() const
{
    std::error_code error;
    return !m_path.empty() && fs::is_regular_file(fs::symlink_status(m_path, error));
}

std::string SourcesFile::read() const
{
    const int file = open(m_path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOFOLLOW);
    struct stat status = {};
    std::string bytes;
    if (file >= 0 && fstat(file, &status) == 0 && S_ISREG(status.st_mode))
        bytes = readAll(file);
    if (file >= 0)
        close(file);
    return bytes;
}

bool SourcesFile::lock()
{
    const auto end = std::chrono::steady_clock::now() + LongestWait;
    for (bool isLast = false; !isLast;) {
        if (openAndLock(&isLast))
            return true;
        if (std::chrono::steady_clock::now() > end)
            return false;
        std::this_thread::sleep_for(Pause);
    }
    return false;
}

// Who had the lock may have replaced or removed the file: then the lock on it is worth nothing.
bool SourcesFile::openAndLock(bool *isLast)
{
    if (!m_path.empty()) {
        m_file = open(m_path.c_str(), O_RDWR | O_CREAT | O_EXCL | O_CLOEXEC, NewFile);
        m_isMade = m_file >= 0;
        if (!m_isMade && errno == EEXIST)
            m_file = open(m_path.c_str(), O_RDWR | O_CLOEXEC | O_NONBLOCK | O_NOFOLLOW);
    }
    struct stat status = {};
    *isLast = m_file < 0 ? m_path.empty() || errno != ENOENT
                         : fstat(m_file, &status) != 0 || !S_ISREG(status.st_mode);
    if (m_file < 0 || *isLast) {
        unlock();
        return false;
    }
    const bool isLocked = flock(m_file, LOCK_EX | LOCK_NB) == 0;
    m_isAlone = isLocked;
    if ((isLocked || (errno != EWOULDBLOCK && errno != EINTR)) && isStillThere())
        return true;
    unlock();
    return false;
}

bool SourcesFile::isStillThere() const
{
    struct stat ours = {};
    struct stat now = {};
    return fstat(m_file, &ours) == 0 && lstat(m_path.c_str(), &now) == 0 && ours.st_dev == now.st_dev
        && ours.st_ino == now.st_ino;
}

void SourcesFile::unlock()
{
    if (m_file >= 0)
        close(m_file);
    m_file = -1;
    m_isAlone = false;
}

bool SourcesFile::write(const std::string &bytes)
{
    if (m_file < 0 || bytes.size() > LargestSize)
        return false;
    const std::string path = (m_path.parent_path() / ("." + m_path.filename().string() + ".new")).string();
    const int file = makeReplacement(path, bytes);
    if (file < 0 || rename(path.c_str(), m_path.c_str()) != 0) {
        const int reason = errno;
        unlink(path.c_str());
        errno = reason;
        if (file >= 0)
            close(file);
        return false;
    }
    close(m_file);
    m_file = file;
    return true;
}

// It is locked before it takes the name, so that there is no moment without a lock.
int SourcesFile::makeReplacement(const std::string &path, const std::string &bytes) const
{
    struct stat status = {};
    unlink(path.c_str()); // one that was left by a killed program
    const int file = open(path.c_str(), O_RDWR | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC, NewFile);
    if (file < 0)
        return -1;
    flock(file, LOCK_EX | LOCK_NB);
    const bool isWritten = fstat(m_file, &status) == 0 && writeAll(file, bytes) && fsync(file) == 0;
    // As private as the one before.
    if (isWritten && fchmod(file, status.st_mode & (S_IRUSR | S_IWUSR | S_IRGRP | S_IROTH)) == 0)
        return file;
    const int reason = errno;
    close(file);
    errno = reason;
    return -1;
}
