// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FaultySystem.h"

#include <fcntl.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <climits>
#include <cstdarg>

namespace {

struct State
{
    QByteArray failing;
    int error = 0;
    bool inPieces = false;
    bool interrupt = false;
    bool logging = false;
    QByteArrayList log;
};

State &state()
{
    static State state;
    return state;
}

bool fails(const char *call, const QByteArray &entry)
{
    if (state().logging)
        state().log.append(entry);
    if (state().failing != call)
        return false;
    errno = state().error;
    return true;
}

// The path of a name in an open folder.
QByteArray whole(int folder, const char *name)
{
    if (folder == AT_FDCWD || *name == '/')
        return name;
    std::array<char, PATH_MAX> path;
    const QByteArray link = "/proc/self/fd/" + QByteArray::number(folder);
    const ssize_t length = ::readlink(link.constData(), path.data(), path.size());
    return QByteArray(path.data(), int(std::max(length, ssize_t(0)))) + '/' + name;
}

} // namespace

void FaultySystem::failAt(const QByteArray &call, int error)
{
    state() = {};
    state().failing = call;
    state().error = error;
    state().logging = true;
}

void FaultySystem::writeInPieces()
{
    state() = {};
    state().inPieces = true;
}

void FaultySystem::reset()
{
    state() = {};
    state().logging = true;
}

QByteArrayList FaultySystem::log()
{
    state().logging = false;
    return state().log;
}

// Only what is visible stands in front of the C library.
#pragma GCC visibility push(default)
extern "C" {

int openat(int folder, const char *path, int flags, ...)
{
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
    va_end(arguments);
    if ((flags & O_CREAT) != 0 && fails("open", "open " + whole(folder, path)))
        return -1;
    return int(::syscall(SYS_openat, folder, path, flags, mode));
}

int openat64(int folder, const char *path, int flags, ...)
{
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
    va_end(arguments);
    return openat(folder, path, flags, mode);
}

int open(const char *path, int flags, ...)
{
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
    va_end(arguments);
    return openat(AT_FDCWD, path, flags, mode);
}

int open64(const char *path, int flags, ...)
{
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
    va_end(arguments);
    return open(path, flags, mode);
}

ssize_t write(int file, const void *bytes, size_t size)
{
    if (file > STDERR_FILENO && fails("write", "write"))
        return -1;
    if (state().inPieces && file > STDERR_FILENO) {
        state().interrupt = !state().interrupt;
        if (state().interrupt) {
            errno = EINTR;
            return -1;
        }
        size = size ? 1 : 0;
    }
    return ::syscall(SYS_write, file, bytes, size);
}

int fsync(int file)
{
    return fails("fsync", "fsync") ? -1 : int(::syscall(SYS_fsync, file));
}

int fchmod(int file, mode_t mode) noexcept
{
    return fails("fchmod", "fchmod") ? -1 : int(::syscall(SYS_fchmod, file, mode));
}

int fsetxattr(int file, const char *name, const void *value, size_t size, int flags) noexcept
{
    return fails("fsetxattr", "fsetxattr") ? -1
                                           : int(::syscall(SYS_fsetxattr, file, name, value, size, flags));
}

int renameat(int fromFolder, const char *from, int toFolder, const char *to) noexcept
{
    return fails("rename", "rename " + whole(fromFolder, from) + " " + whole(toFolder, to))
        ? -1
        : int(::syscall(SYS_renameat, fromFolder, from, toFolder, to));
}

int rename(const char *from, const char *to) noexcept
{
    return renameat(AT_FDCWD, from, AT_FDCWD, to);
}
}
#pragma GCC visibility pop
