// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeCopy.h"

#include "FileCopy.h"
#include "FileDescriptor.h"
#include "FileProgress.h"
#include "StagingFolder.h"
#include "TreeLimits.h"
#include "TreeRemoval.h"

#include <array>
#include <cerrno>
#include <cstdio>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace TreeCopy {

namespace {

namespace fs = std::filesystem;
using FileCopy::Kind;

std::error_code copyTree(const Path &source, const Path &target, Kind kind, FileProgress &progress);

std::error_code copyFolder(const Path &source, const Path &target, const struct stat &status, Kind kind,
                           FileProgress &progress)
{
    if (!FileCopy::makeFolder(target, status, kind))
        return lastError();
    std::error_code error;
    fs::directory_iterator it(source, error);
    while (!error && it != fs::directory_iterator()) {
        if (const std::error_code failed =
                copyTree(it->path(), target / it->path().filename(), kind, progress))
            return failed;
        it.increment(error);
    }
    if (!error && !FileCopy::finishFolder(target, status, kind))
        return lastError();
    return error;
}

std::error_code copyTree(const Path &source, const Path &target, Kind kind, FileProgress &progress)
{
    if (!progress.goOn())
        return std::make_error_code(std::errc::operation_canceled);
    struct stat status = {};
    if (::lstat(source.c_str(), &status) != 0)
        return lastError();
    std::error_code error;
    if (S_ISLNK(status.st_mode))
        fs::copy_symlink(source, target, error);
    else if (S_ISREG(status.st_mode))
        error = FileCopy::copy(source, target, kind, progress);
    else if (S_ISDIR(status.st_mode))
        error = copyFolder(source, target, status, kind, progress);
    else
        error = std::make_error_code(std::errc::not_supported);
    if (!error && kind == Kind::Move) {
        const std::array<timespec, 2> stamps{status.st_atim, status.st_mtim};
        ::utimensat(AT_FDCWD, target.c_str(), stamps.data(), AT_SYMLINK_NOFOLLOW);
    }
    progress.advance();
    return error;
}

// rename() that fails where the target exists.
std::error_code renameToNew(const Path &source, const Path &target)
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

std::error_code copyByStaging(const Path &source, const Path &target, Kind kind, FileProgress &progress)
{
    const StagingFolder staging(target.parent_path(), progress);
    if (staging.error())
        return staging.error();
    if (const std::error_code error = copyTree(source, staging.item(), kind, progress))
        return error;
    return renameToNew(staging.item(), target);
}

bool isWritableFolder(const Path &path)
{
    return ::access(path.c_str(), W_OK | X_OK) == 0;
}

// Whether everything below the folder \a source may be removed.
std::error_code canBeRemoved(const Path &source, FileProgress &progress)
{
    std::error_code error;
    fs::recursive_directory_iterator it(source, fs::directory_options::none, error);
    if (!error && !isWritableFolder(source))
        return lastError();
    int items = 0;
    while (!error && it != fs::recursive_directory_iterator()) {
        const bool isFolder = fs::is_directory(it->symlink_status(error));
        if (!error && isFolder && !isWritableFolder(it->path()))
            return lastError();
        if (!error && TreeLimits::areMet(it.depth() + 1, ++items))
            return std::make_error_code(std::errc::file_too_large);
        if (!error && !progress.goOn())
            return std::make_error_code(std::errc::operation_canceled);
        progress.expect(1);
        if (!error)
            it.increment(error);
    }
    return error;
}

// The source goes only when the copy is complete, and leaves its place in one step: either
// both are there afterwards or only the copy.
std::error_code moveByCopying(const Path &source, const Path &target, FileProgress &progress)
{
    std::error_code error;
    if (fs::is_directory(fs::symlink_status(source, error)))
        error = canBeRemoved(source, progress);
    if (error)
        return error;
    StagingFolder::removeLeftovers(source.parent_path());
    const StagingFolder leaving(source.parent_path(), progress);
    if (leaving.error())
        return leaving.error();
    if ((error = copyByStaging(source, target, Kind::Move, progress)))
        return error;
    if ((error = renameToNew(source, leaving.item())))
        TreeRemoval::removeOwn(target, progress);
    return error;
}

// A link whose text is relative would point elsewhere from another folder.
bool isRelativeLink(const Path &path)
{
    std::error_code error;
    return fs::is_symlink(fs::symlink_status(path, error)) && fs::read_symlink(path, error).is_relative();
}

std::error_code remakeLink(const Path &source, const Path &target)
{
    std::error_code error;
    const Path text = fs::read_symlink(source, error);
    const Path folder = error ? Path() : fs::canonical(source.parent_path(), error);
    if (!error)
        fs::create_symlink(folder / text, target, error);
    return error;
}

std::error_code moveLink(const Path &source, const Path &target)
{
    if (const std::error_code error = remakeLink(source, target))
        return error;
    if (::unlink(source.c_str()) == 0)
        return {};
    const std::error_code error = lastError();
    ::unlink(target.c_str());
    return error;
}

// What was one step is done unless it failed.
std::error_code advanced(const std::error_code &error, FileProgress &progress)
{
    if (!error)
        progress.advance();
    return error;
}

} // namespace

std::error_code copy(const Path &source, const Path &target, FileProgress &progress)
{
    std::error_code error;
    const fs::file_status status = fs::status(source, error);
    if (error)
        return error;
    if (!fs::is_symlink(fs::symlink_status(source, error)))
        return copyByStaging(source, target, Kind::Copy, progress);
    if (fs::is_directory(status))
        return advanced(remakeLink(source, target), progress);
    const Path file = fs::canonical(source, error);
    return error ? error : copyByStaging(file, target, Kind::Copy, progress);
}

std::error_code move(const Path &source, const Path &target, FileProgress &progress)
{
    if (isRelativeLink(source))
        return advanced(moveLink(source, target), progress);
    const std::error_code error = renameToNew(source, target);
    return error == std::errc::cross_device_link ? moveByCopying(source, target, progress)
                                                 : advanced(error, progress);
}

} // namespace TreeCopy
