// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileCopy.h"

#include "FileDescriptor.h"
#include "FileProgress.h"

#include <array>
#include <cerrno>

#include <fcntl.h>
#include <unistd.h>

namespace FileCopy {

namespace {

using Path = std::filesystem::path;

constexpr mode_t AllBits = 07777;
constexpr mode_t PlainBits = 0777;

bool writeAll(int fd, const char *bytes, size_t size)
{
    while (size > 0) {
        const ssize_t written = ::write(fd, bytes, size);
        if (written < 0 && errno == EINTR)
            continue;
        if (written < 0)
            return false;
        bytes += written;
        size -= size_t(written);
    }
    return true;
}

std::error_code copyContents(int from, int to, FileProgress &progress)
{
    std::array<char, 1 << 16> buffer;
    for (;;) {
        if (!progress.goOn())
            return std::make_error_code(std::errc::operation_canceled);
        const ssize_t count = ::read(from, buffer.data(), buffer.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return lastError();
        if (count == 0)
            return {};
        if (!writeAll(to, buffer.data(), size_t(count)))
            return lastError();
    }
}

// What is moved keeps owner and group where it may, and its permissions; but set-id bits lend the
// rights of the owner, and would lend those of another one.
bool keepRights(int fd, const struct stat &old)
{
    struct stat now = {};
    if (::fchown(fd, old.st_uid, old.st_gid) != 0 && ::fchown(fd, uid_t(-1), old.st_gid) != 0)
        errno = 0;
    if (::fstat(fd, &now) != 0)
        return false;
    const bool isSame = now.st_uid == old.st_uid && now.st_gid == old.st_gid;
    return ::fchmod(fd, old.st_mode & (isSame ? AllBits : PlainBits)) == 0;
}

} // namespace

std::error_code copy(const Path &source, const Path &target, Kind kind, FileProgress &progress)
{
    // Not blocking: something else may have taken the file's place since it was looked at.
    const FileDescriptor from(::open(source.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOFOLLOW));
    struct stat status = {};
    if (!from.isOpen() || ::fstat(from.fd(), &status) != 0)
        return lastError();
    if (!S_ISREG(status.st_mode))
        return std::make_error_code(std::errc::not_supported);
    // The system takes the umask off what a new file is made with.
    const mode_t mode = kind == Kind::Copy ? status.st_mode & PlainBits : S_IRUSR | S_IWUSR;
    FileDescriptor to(::open(target.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode));
    if (!to.isOpen())
        return lastError();
    if (const std::error_code error = copyContents(from.fd(), to.fd(), progress))
        return error;
    if ((kind == Kind::Move && !keepRights(to.fd(), status)) || ::fsync(to.fd()) != 0 || !to.close())
        return lastError();
    return {};
}

bool makeFolder(const Path &target, const struct stat &source, Kind kind)
{
    const mode_t mode = kind == Kind::Copy ? (source.st_mode & PlainBits) | S_IRWXU : S_IRWXU;
    return ::mkdir(target.c_str(), mode) == 0;
}

bool finishFolder(const Path &target, const struct stat &source, Kind kind)
{
    if (kind == Kind::Copy && (source.st_mode & S_IRWXU) == S_IRWXU)
        return true;
    const FileDescriptor folder(::open(target.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC | O_NOFOLLOW));
    struct stat status = {};
    if (!folder.isOpen() || ::fstat(folder.fd(), &status) != 0)
        return false;
    if (kind == Kind::Move)
        return keepRights(folder.fd(), source);
    return ::fchmod(folder.fd(), status.st_mode & AllBits & ~(S_IRWXU & ~source.st_mode)) == 0;
}

} // namespace FileCopy
