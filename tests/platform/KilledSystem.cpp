// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KilledSystem.h"

#include <csignal>
#include <cstdarg>
#include <cstddef>

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace {

int made = 0;
int last = -1;

void count()
{
    if (made++ == last)
        ::raise(SIGKILL);
}

} // namespace

void KilledSystem::killAt(int call)
{
    last = made + call;
}

int KilledSystem::calls()
{
    return made;
}

// Only what is visible stands in front of the C library.
#pragma GCC visibility push(default)
extern "C" {

int open(const char *path, int flags, ...)
{
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
    va_end(arguments);
    if ((flags & O_CREAT) != 0)
        count();
    return int(::syscall(SYS_openat, AT_FDCWD, path, flags, mode));
}

ssize_t write(int file, const void *bytes, size_t size)
{
    if (file > STDERR_FILENO)
        count();
    return ::syscall(SYS_write, file, bytes, size);
}

int fsync(int file)
{
    count();
    return int(::syscall(SYS_fsync, file));
}

int rename(const char *from, const char *to) noexcept
{
    count();
    return int(::syscall(SYS_renameat2, AT_FDCWD, from, AT_FDCWD, to, 0));
}

int renameat2(int fromFolder, const char *from, int toFolder, const char *to, unsigned flags) noexcept
{
    count();
    return int(::syscall(SYS_renameat2, fromFolder, from, toFolder, to, flags));
}

int unlink(const char *path) noexcept
{
    count();
    return int(::syscall(SYS_unlinkat, AT_FDCWD, path, 0));
}

int unlinkat(int folder, const char *path, int flags) noexcept
{
    count();
    return int(::syscall(SYS_unlinkat, folder, path, flags));
}

int mkdir(const char *path, mode_t mode) noexcept
{
    count();
    return int(::syscall(SYS_mkdirat, AT_FDCWD, path, mode));
}

int rmdir(const char *path) noexcept
{
    count();
    return int(::syscall(SYS_unlinkat, AT_FDCWD, path, AT_REMOVEDIR));
}
}
#pragma GCC visibility pop
