// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StagedCopies.h"

#include "FileDescriptor.h"
#include "FileProgress.h"
#include "OneStep.h"
#include "StagingFolder.h"
#include "TreeLimits.h"

#include <array>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

namespace fs = std::filesystem;
using FileCopy::Kind;
using Path = StagedCopies::Path;

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

} // namespace

StagedCopies::StagedCopies(Kind kind, FileProgress &progress)
    : m_kind(kind)
    , m_progress(progress)
{
}

StagedCopies::~StagedCopies() = default;

// Finds a free path in a hidden folder in \a directory.
std::error_code StagedCopies::findPlace(const Path &directory, Path *place)
{
    std::unique_ptr<StagingFolder> &folder = m_folders[directory];
    if (!folder) {
        StagingFolder::removeLeftovers(directory);
        folder = std::make_unique<StagingFolder>(directory, m_progress);
    }
    *place = folder->item(m_places++);
    return folder->error();
}

std::error_code StagedCopies::add(const Path &source, const Path &target)
{
    std::error_code error;
    Item item{source, target, {}, {}};
    if (m_kind == Kind::Move) {
        if (fs::is_directory(fs::symlink_status(source, error)))
            error = canBeRemoved(source, m_progress);
        if (!error)
            error = findPlace(source.parent_path(), &item.leaving);
    }
    if (!error)
        error = findPlace(target.parent_path(), &item.staged);
    if (!error)
        error = copy(source, item.staged);
    if (!error)
        m_items.push_back(item);
    return error;
}

// A copy of a link to a file is a copy of that file; one of a link to a folder is a link.
std::error_code StagedCopies::copy(const Path &source, const Path &target)
{
    std::error_code error;
    const bool isLink = fs::is_symlink(fs::symlink_status(source, error));
    if (m_kind == Kind::Move || !isLink)
        return copyTree(source, target, m_kind, m_progress);
    const fs::file_status status = fs::status(source, error);
    if (!error && !fs::is_directory(status)) {
        const Path file = fs::canonical(source, error);
        return error ? error : copyTree(file, target, m_kind, m_progress);
    }
    if (!error)
        error = OneStep::copyLink(source, target);
    if (!error)
        m_progress.advance();
    return error;
}

std::error_code StagedCopies::reveal()
{
    for (auto item = m_items.begin(); item != m_items.end(); ++item) {
        if (const std::error_code error = revealOne(*item)) {
            m_failed = item->source;
            while (item != m_items.begin())
                hide(*--item);
            return error;
        }
    }
    return {};
}

std::error_code StagedCopies::revealOne(const Item &item) const
{
    std::error_code error = OneStep::rename(item.staged, item.target);
    if (error || m_kind == Kind::Copy)
        return error;
    error = OneStep::rename(item.source, item.leaving);
    if (error)
        OneStep::rename(item.target, item.staged);
    return error;
}

void StagedCopies::hide(const Item &item) const
{
    if (m_kind == Kind::Move)
        OneStep::rename(item.leaving, item.source);
    OneStep::rename(item.target, item.staged);
}
