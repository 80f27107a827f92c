// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OneStep.h"

#include "FileDescriptor.h"

#include <cerrno>
#include <cstdio>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

std::error_code OneStep::rename(const Path &source, const Path &target)
{
    if (::renameat2(AT_FDCWD, source.c_str(), AT_FDCWD, target.c_str(), RENAME_NOREPLACE) == 0)
        return {};
    if (errno != EINVAL && errno != ENOSYS)
        return lastError();
    // A file system that does not know the flag.
    struct stat status = {};
    if (::lstat(target.c_str(), &status) == 0)
        return std::make_error_code(std::errc::file_exists);
    if (::rename(source.c_str(), target.c_str()) != 0)
        return lastError();
    return {};
}

bool OneStep::isRelativeLink(const Path &path)
{
    std::error_code error;
    return fs::is_symlink(fs::symlink_status(path, error)) && fs::read_symlink(path, error).is_relative();
}

std::error_code OneStep::copyLink(const Path &source, const Path &target)
{
    std::error_code error;
    const Path text = fs::read_symlink(source, error);
    const Path folder = error ? Path() : fs::canonical(source.parent_path(), error);
    if (!error)
        fs::create_symlink(folder / text, target, error);
    return error;
}

std::error_code OneStep::moveLink(const Path &source, const Path &target)
{
    if (const std::error_code error = copyLink(source, target))
        return error;
    if (::unlink(source.c_str()) == 0)
        return {};
    const std::error_code error = lastError();
    ::unlink(target.c_str());
    return error;
}
