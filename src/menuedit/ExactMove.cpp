// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExactMove.h"

#include "FileDescriptor.h"

#include <QFile>

#include <array>
#include <cstdio>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

namespace fs = std::filesystem;
using TreeCopy::Path;

std::error_code renameTo(const Path &from, const Path &to)
{
    if (::renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), RENAME_NOREPLACE) == 0)
        return {};
    if (errno != EINVAL && errno != ENOSYS)
        return lastError();
    // A file system that does not know the flag.
    struct stat status = {};
    if (::lstat(to.c_str(), &status) == 0)
        return std::make_error_code(std::errc::file_exists);
    return ::rename(from.c_str(), to.c_str()) == 0 ? std::error_code() : lastError();
}

std::error_code carryOver(const Path &from, const Path &to, FileProgress &progress)
{
    std::error_code error;
    if (!fs::is_symlink(fs::symlink_status(from, error)))
        return TreeCopy::move(from, to, progress);
    const Path text = fs::read_symlink(from, error);
    return error ? error : ExactMove::moveLink(from, to, text);
}

} // namespace

Path ExactMove::native(const QString &path)
{
    return Path(QFile::encodeName(path).toStdString());
}

std::error_code ExactMove::move(const Path &from, const Path &to, FileProgress &progress)
{
    const std::error_code error = renameTo(from, to);
    return error == std::errc::cross_device_link ? carryOver(from, to, progress) : error;
}

std::error_code ExactMove::exchange(const Path &one, const Path &other)
{
    if (::renameat2(AT_FDCWD, one.c_str(), AT_FDCWD, other.c_str(), RENAME_EXCHANGE) == 0)
        return {};
    return lastError();
}

std::error_code ExactMove::moveLink(const Path &from, const Path &to, const Path &linkText)
{
    struct stat status = {};
    if (::lstat(from.c_str(), &status) != 0 || ::symlink(linkText.c_str(), to.c_str()) != 0)
        return lastError();
    const std::array<timespec, 2> stamps{status.st_atim, status.st_mtim};
    ::utimensat(AT_FDCWD, to.c_str(), stamps.data(), AT_SYMLINK_NOFOLLOW);
    if (::unlink(from.c_str()) == 0)
        return {};
    const std::error_code error = lastError();
    ::unlink(to.c_str());
    return error;
}
