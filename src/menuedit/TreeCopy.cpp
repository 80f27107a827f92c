// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeCopy.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <utility>
#include <vector>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace TreeCopy {

namespace {

namespace fs = std::filesystem;

enum class Times { New, Kept };

std::error_code lastError()
{
    return {errno, std::generic_category()};
}

class Descriptor
{
public:
    explicit Descriptor(int fd)
        : m_fd(fd)
    {
    }
    ~Descriptor()
    {
        if (m_fd >= 0)
            ::close(m_fd);
    }
    Descriptor(const Descriptor &) = delete;
    Descriptor &operator=(const Descriptor &) = delete;

    int fd() const { return m_fd; }
    bool isOpen() const { return m_fd >= 0; }
    // Closing tells of errors that writing could not know yet.
    bool close() { return ::close(std::exchange(m_fd, -1)) == 0; }

private:
    int m_fd;
};

// A hidden folder of ours in the target directory, in which a copy is made ready.
class StagingFolder
{
public:
    explicit StagingFolder(const Path &directory)
    {
        const std::string pattern = (directory / ".velcopy-XXXXXX").string();
        std::vector<char> name(pattern.begin(), pattern.end());
        name.push_back('\0');
        if (mkdtemp(name.data()))
            m_path = name.data();
        else
            m_error = lastError();
    }
    ~StagingFolder()
    {
        if (!m_path.empty())
            removeTree(m_path);
    }
    StagingFolder(const StagingFolder &) = delete;
    StagingFolder &operator=(const StagingFolder &) = delete;

    std::error_code error() const { return m_error; }
    Path item() const { return m_path / "item"; }

private:
    Path m_path;
    std::error_code m_error;
};

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

std::error_code copyContents(int from, int to)
{
    std::array<char, 1 << 16> buffer;
    for (;;) {
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

std::error_code copyFile(const Path &source, const Path &target, mode_t mode)
{
    // Not blocking: something else may have taken the file's place since it was looked at.
    const Descriptor from(::open(source.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    if (!from.isOpen())
        return lastError();
    Descriptor to(::open(target.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0600));
    if (!to.isOpen())
        return lastError();
    if (const std::error_code error = copyContents(from.fd(), to.fd()))
        return error;
    if (::fchmod(to.fd(), mode & 07777) != 0 || ::fsync(to.fd()) != 0 || !to.close())
        return lastError();
    return {};
}

std::error_code copyTree(const Path &source, const Path &target, Times times);

std::error_code copyFolder(const Path &source, const Path &target, mode_t mode, Times times)
{
    if (::mkdir(target.c_str(), 0700) != 0)
        return lastError();
    std::error_code error;
    fs::directory_iterator it(source, error);
    while (!error && it != fs::directory_iterator()) {
        if (const std::error_code failed = copyTree(it->path(), target / it->path().filename(), times))
            return failed;
        it.increment(error);
    }
    if (!error && ::chmod(target.c_str(), mode & 07777) != 0)
        return lastError();
    return error;
}

std::error_code copyTree(const Path &source, const Path &target, Times times)
{
    struct stat status = {};
    if (::lstat(source.c_str(), &status) != 0)
        return lastError();
    std::error_code error;
    if (S_ISLNK(status.st_mode))
        fs::copy_symlink(source, target, error);
    else if (S_ISREG(status.st_mode))
        error = copyFile(source, target, status.st_mode);
    else if (S_ISDIR(status.st_mode))
        error = copyFolder(source, target, status.st_mode, times);
    else
        error = std::make_error_code(std::errc::not_supported);
    if (!error && times == Times::Kept) {
        const std::array<timespec, 2> stamps{status.st_atim, status.st_mtim};
        ::utimensat(AT_FDCWD, target.c_str(), stamps.data(), AT_SYMLINK_NOFOLLOW);
    }
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

std::error_code copyByStaging(const Path &source, const Path &target, Times times)
{
    const StagingFolder staging(target.parent_path());
    if (staging.error())
        return staging.error();
    if (const std::error_code error = copyTree(source, staging.item(), times))
        return error;
    return renameToNew(staging.item(), target);
}

bool isWritableFolder(const Path &path)
{
    return ::access(path.c_str(), W_OK | X_OK) == 0;
}

// Whether everything below the folder \a source may be removed.
std::error_code canBeRemoved(const Path &source)
{
    std::error_code error;
    fs::recursive_directory_iterator it(source, fs::directory_options::none, error);
    if (!error && !isWritableFolder(source))
        return lastError();
    while (!error && it != fs::recursive_directory_iterator()) {
        const bool isFolder = fs::is_directory(it->symlink_status(error));
        if (!error && isFolder && !isWritableFolder(it->path()))
            return lastError();
        if (!error)
            it.increment(error);
    }
    return error;
}

// The source goes only when the copy is complete, and leaves its place in one step: either
// both are there afterwards or only the copy.
std::error_code moveByCopying(const Path &source, const Path &target)
{
    std::error_code error;
    if (fs::is_directory(fs::symlink_status(source, error)))
        error = canBeRemoved(source);
    if (error)
        return error;
    const StagingFolder leaving(source.parent_path());
    if (leaving.error())
        return leaving.error();
    if ((error = copyByStaging(source, target, Times::Kept)))
        return error;
    if ((error = renameToNew(source, leaving.item())))
        removeTree(target);
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

} // namespace

std::error_code copy(const Path &source, const Path &target)
{
    std::error_code error;
    const fs::file_status status = fs::status(source, error);
    if (error)
        return error;
    if (!fs::is_symlink(fs::symlink_status(source, error)))
        return copyByStaging(source, target, Times::New);
    if (fs::is_directory(status))
        return remakeLink(source, target);
    const Path file = fs::canonical(source, error);
    return error ? error : copyByStaging(file, target, Times::New);
}

std::error_code move(const Path &source, const Path &target)
{
    if (isRelativeLink(source)) {
        if (const std::error_code error = remakeLink(source, target))
            return error;
        if (::unlink(source.c_str()) == 0)
            return {};
        const std::error_code error = lastError();
        ::unlink(target.c_str());
        return error;
    }
    const std::error_code error = renameToNew(source, target);
    return error == std::errc::cross_device_link ? moveByCopying(source, target) : error;
}

void removeTree(const Path &path)
{
    std::error_code error;
    if (fs::is_directory(fs::symlink_status(path, error))) {
        ::chmod(path.c_str(), 0700);
        for (fs::directory_iterator it(path, error); !error && it != fs::directory_iterator();
             it.increment(error))
            removeTree(it->path());
    }
    ::remove(path.c_str());
}

} // namespace TreeCopy
