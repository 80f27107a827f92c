// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Preloaded: what is looked up below $VEL_REDIRECT_FROM is looked up below $VEL_REDIRECT_TO, so that
// a fixed directory of the system can be tested without writing to it.

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdarg>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

std::string redirected(const char *path)
{
    const char *from = std::getenv("VEL_REDIRECT_FROM");
    const char *to = std::getenv("VEL_REDIRECT_TO");
    if (path && from && to && !std::strncmp(path, from, std::strlen(from)))
        return std::string(to) + (path + std::strlen(from));
    return path ? path : "";
}

template <typename Function>
Function next(const char *name)
{
    return reinterpret_cast<Function>(dlsym(RTLD_NEXT, name));
}

} // namespace

extern "C" {

int access(const char *path, int mode)
{
    return next<int (*)(const char *, int)>("access")(redirected(path).c_str(), mode);
}

int open64(const char *path, int flags, ...)
{
    mode_t mode = 0;
    if (flags & O_CREAT) {
        va_list arguments;
        va_start(arguments, flags);
        mode = va_arg(arguments, mode_t);
        va_end(arguments);
    }
    return next<int (*)(const char *, int, mode_t)>("open64")(redirected(path).c_str(), flags, mode);
}

int statx(int directory, const char *path, int flags, unsigned mask, struct statx *buffer)
{
    return next<int (*)(int, const char *, int, unsigned, struct statx *)>("statx")(
        directory, redirected(path).c_str(), flags, mask, buffer);
}

} // extern "C"
