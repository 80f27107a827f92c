// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileCalls.h"

#include <cstdarg>

#include <dlfcn.h>
#include <sys/types.h>

namespace {

thread_local QList<QByteArray> *calls = nullptr;

void note(const char *function, const char *path)
{
    if (calls)
        calls->append(QByteArray(function) + ' ' + path);
}

// Calls the function of the C library that stands behind one of this program.
template <typename Result, typename... Arguments>
Result pass(const char *function, const char *path, Arguments... arguments)
{
    note(function, path);
    return reinterpret_cast<Result (*)(Arguments...)>(dlsym(RTLD_NEXT, function))(arguments...);
}

} // namespace

FileCalls::FileCalls()
{
    calls = new QList<QByteArray>;
}

FileCalls::~FileCalls()
{
    delete calls;
    calls = nullptr;
}

QList<QByteArray> FileCalls::all() const
{
    return *calls;
}

// Under names of their own, as their declarations say more than is needed here.
#pragma GCC visibility push(default)
extern "C" {

int watchedStat(const char *path, void *status) __asm__("stat");
int watchedStat64(const char *path, void *status) __asm__("stat64");
int watchedLstat(const char *path, void *status) __asm__("lstat");
int watchedLstat64(const char *path, void *status) __asm__("lstat64");
int watchedStatx(int directory, const char *path, int flags, unsigned mask, void *status) __asm__("statx");
int watchedAccess(const char *path, int mode) __asm__("access");
ssize_t watchedReadlink(const char *path, char *buffer, size_t size) __asm__("readlink");
char *watchedRealpath(const char *path, char *resolved) __asm__("realpath");
char *watchedRealpathChk(const char *path, char *resolved, size_t size) __asm__("__realpath_chk");
void *watchedOpendir(const char *path) __asm__("opendir");
int watchedOpen(const char *path, int flags, unsigned mode) __asm__("open");
int watchedOpen64(const char *path, int flags, unsigned mode) __asm__("open64");

int watchedStat(const char *path, void *status)
{
    return pass<int>("stat", path, path, status);
}

int watchedStat64(const char *path, void *status)
{
    return pass<int>("stat64", path, path, status);
}

int watchedLstat(const char *path, void *status)
{
    return pass<int>("lstat", path, path, status);
}

int watchedLstat64(const char *path, void *status)
{
    return pass<int>("lstat64", path, path, status);
}

int watchedStatx(int directory, const char *path, int flags, unsigned mask, void *status)
{
    return pass<int>("statx", path, directory, path, flags, mask, status);
}

int watchedAccess(const char *path, int mode)
{
    return pass<int>("access", path, path, mode);
}

ssize_t watchedReadlink(const char *path, char *buffer, size_t size)
{
    return pass<ssize_t>("readlink", path, path, buffer, size);
}

char *watchedRealpath(const char *path, char *resolved)
{
    return pass<char *>("realpath", path, path, resolved);
}

// What the compiler makes of it where the size of the buffer is known.
char *watchedRealpathChk(const char *path, char *resolved, size_t size)
{
    return pass<char *>("__realpath_chk", path, path, resolved, size);
}

void *watchedOpendir(const char *path)
{
    return pass<void *>("opendir", path, path);
}

// The third argument is there when it counts.
int watchedOpen(const char *path, int flags, unsigned mode)
{
    return pass<int>("open", path, path, flags, mode);
}

int watchedOpen64(const char *path, int flags, unsigned mode)
{
    return pass<int>("open64", path, path, flags, mode);
}

} // extern "C"
#pragma GCC visibility pop
