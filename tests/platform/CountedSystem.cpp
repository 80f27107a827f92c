// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CountedSystem.h"

#include <cstdarg>

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

struct __dirstream; // NOLINT(bugprone-reserved-identifier)

namespace {

bool noting = false;
QByteArrayList noted;

void note(const char *call, const char *path)
{
    if (noting)
        noted.append(QByteArray(call) + ' ' + path);
}

template <typename Function>
Function original(const char *name)
{
    return reinterpret_cast<Function>(dlsym(RTLD_NEXT, name));
}

} // namespace

void CountedSystem::begin()
{
    noted.clear();
    noting = true;
}

QByteArrayList CountedSystem::end()
{
    noting = false;
    return noted;
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
    note("open", path);
    return int(::syscall(SYS_openat, AT_FDCWD, path, flags, mode));
}

int open64(const char *path, int flags, ...)
{
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
    va_end(arguments);
    return open(path, flags, mode);
}

int openat(int folder, const char *path, int flags, ...)
{
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
    va_end(arguments);
    note("open", path);
    return int(::syscall(SYS_openat, folder, path, flags, mode));
}

int stat(const char *path, struct stat *status) noexcept
{
    note("stat", path);
    static const auto next = original<int (*)(const char *, struct stat *)>("stat");
    return next(path, status);
}

int lstat(const char *path, struct stat *status) noexcept
{
    note("stat", path);
    static const auto next = original<int (*)(const char *, struct stat *)>("lstat");
    return next(path, status);
}

int fstatat(int folder, const char *path, struct stat *status, int flags) noexcept
{
    note("stat", path);
    static const auto next = original<int (*)(int, const char *, struct stat *, int)>("fstatat");
    return next(folder, path, status, flags);
}

__dirstream *opendir(const char *path)
{
    note("open", path);
    static const auto next = original<__dirstream *(*)(const char *)>("opendir");
    return next(path);
}
}
#pragma GCC visibility pop
