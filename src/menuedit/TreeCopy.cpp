// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeCopy.h"

#include "TreeLimits.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <dirent.h>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace TreeCopy {

namespace {

namespace fs = std::filesystem;

// A copy is a new file of the user's; what is moved stays what it was.
enum class Kind { Copy, Move };

constexpr std::string_view StagingName = ".velcopy-";
constexpr std::size_t StagingLetters = 6;
constexpr time_t LeftoverAge = 60 * 60;
constexpr mode_t AllBits = 07777;
constexpr mode_t PlainBits = 0777;

using Stream = std::unique_ptr<DIR, int (*)(DIR *)>;

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

// A hidden folder of ours in the target directory, in which a copy is made ready. The lock on it
// tells that it is in use, however long the copying takes.
class StagingFolder
{
public:
    explicit StagingFolder(const Path &directory)
    {
        const std::string letters(StagingLetters, 'X');
        std::string name = (directory / StagingName).string() + letters;
        if (!mkdtemp(name.data())) {
            m_error = lastError();
            return;
        }
        m_path = name;
        m_folder = ::open(name.c_str(), O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC);
        if (m_folder >= 0)
            ::flock(m_folder, LOCK_SH | LOCK_NB);
    }
    ~StagingFolder()
    {
        if (!m_path.empty())
            removeTree(m_path);
        if (m_folder >= 0)
            ::close(m_folder);
    }
    StagingFolder(const StagingFolder &) = delete;
    StagingFolder &operator=(const StagingFolder &) = delete;

    std::error_code error() const { return m_error; }
    Path item() const { return m_path / "item"; }

private:
    Path m_path;
    int m_folder = -1;
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

// What is moved keeps owner and group where it may, and its permissions; but set-id bits lend the
// rights of the owner, and would lend those of another one.
bool keepRights(int fd, const struct stat &old)
{
    struct stat now = {};
    if (::fchown(fd, old.st_uid, old.st_gid) != 0 && ::fchown(fd, uid_t(-1), old.st_gid) != 0)
        errno = 0;
    if (::fstat(fd, &now) != 0)
        return false;
    const bool isSame = now.st_uid == old.st_uid && now.st_gid == old.st_gid;
    return ::fchmod(fd, old.st_mode & (isSame ? AllBits : PlainBits)) == 0;
}

std::error_code copyFile(const Path &source, const Path &target, Kind kind)
{
    // Not blocking: something else may have taken the file's place since it was looked at.
    const Descriptor from(::open(source.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOFOLLOW));
    struct stat status = {};
    if (!from.isOpen() || ::fstat(from.fd(), &status) != 0)
        return lastError();
    if (!S_ISREG(status.st_mode))
        return std::make_error_code(std::errc::not_supported);
    // The system takes the umask off what a new file is made with.
    const mode_t mode = kind == Kind::Copy ? status.st_mode & PlainBits : S_IRUSR | S_IWUSR;
    Descriptor to(::open(target.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode));
    if (!to.isOpen())
        return lastError();
    if (const std::error_code error = copyContents(from.fd(), to.fd()))
        return error;
    if ((kind == Kind::Move && !keepRights(to.fd(), status)) || ::fsync(to.fd()) != 0 || !to.close())
        return lastError();
    return {};
}

std::error_code copyTree(const Path &source, const Path &target, Kind kind);

// Takes away what the owner was given for the time of filling.
bool finishFolder(const Path &target, const struct stat &source, Kind kind)
{
    if (kind == Kind::Copy && (source.st_mode & S_IRWXU) == S_IRWXU)
        return true;
    const Descriptor folder(::open(target.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC | O_NOFOLLOW));
    struct stat status = {};
    if (!folder.isOpen() || ::fstat(folder.fd(), &status) != 0)
        return false;
    if (kind == Kind::Move)
        return keepRights(folder.fd(), source);
    return ::fchmod(folder.fd(), status.st_mode & AllBits & ~(S_IRWXU & ~source.st_mode)) == 0;
}

std::error_code copyFolder(const Path &source, const Path &target, const struct stat &status, Kind kind)
{
    const mode_t mode = kind == Kind::Copy ? (status.st_mode & PlainBits) | S_IRWXU : S_IRWXU;
    if (::mkdir(target.c_str(), mode) != 0)
        return lastError();
    std::error_code error;
    fs::directory_iterator it(source, error);
    while (!error && it != fs::directory_iterator()) {
        if (const std::error_code failed = copyTree(it->path(), target / it->path().filename(), kind))
            return failed;
        it.increment(error);
    }
    if (!error && !finishFolder(target, status, kind))
        return lastError();
    return error;
}

std::error_code copyTree(const Path &source, const Path &target, Kind kind)
{
    struct stat status = {};
    if (::lstat(source.c_str(), &status) != 0)
        return lastError();
    std::error_code error;
    if (S_ISLNK(status.st_mode))
        fs::copy_symlink(source, target, error);
    else if (S_ISREG(status.st_mode))
        error = copyFile(source, target, kind);
    else if (S_ISDIR(status.st_mode))
        error = copyFolder(source, target, status, kind);
    else
        error = std::make_error_code(std::errc::not_supported);
    if (!error && kind == Kind::Move) {
        const std::array<timespec, 2> stamps{status.st_atim, status.st_mtim};
        ::utimensat(AT_FDCWD, target.c_str(), stamps.data(), AT_SYMLINK_NOFOLLOW);
    }
    return error;
}

std::vector<std::string> namesIn(DIR *folder)
{
    std::vector<std::string> names;
    while (const dirent *entry = ::readdir(folder)) {
        const std::string_view name = entry->d_name;
        if (name != "." && name != "..")
            names.emplace_back(name);
    }
    return names;
}

// A folder that may be read; null for what is none, links included.
Stream openFolder(int parent, const char *name)
{
    const int fd = ::openat(parent, name, O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC);
    DIR *const stream = fd < 0 ? nullptr : ::fdopendir(fd);
    if (!stream && fd >= 0)
        ::close(fd);
    return Stream(stream, ::closedir);
}

// By open folders, not by paths: another user may put a link in the place of what was looked at.
void removeAt(int parent, const std::string &name)
{
    if (::unlinkat(parent, name.c_str(), 0) == 0 || errno != EISDIR)
        return;
    ::fchmodat(parent, name.c_str(), S_IRWXU, AT_SYMLINK_NOFOLLOW);
    if (const Stream folder = openFolder(parent, name.c_str())) {
        for (const std::string &child : namesIn(folder.get()))
            removeAt(::dirfd(folder.get()), child);
    }
    ::unlinkat(parent, name.c_str(), AT_REMOVEDIR);
}

bool isStagingName(std::string_view name)
{
    if (name.substr(0, StagingName.size()) != StagingName)
        return false;
    name.remove_prefix(StagingName.size());
    return name.size() == StagingLetters && std::all_of(name.begin(), name.end(), [](char c) {
               return (c >= '0' && c <= '9') || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
           });
}

// Whether a copy of this user was killed that made this folder.
bool isLeftover(int parent, const std::string &name)
{
    struct stat status = {};
    if (!isStagingName(name) || ::fstatat(parent, name.c_str(), &status, AT_SYMLINK_NOFOLLOW) != 0
        || !S_ISDIR(status.st_mode) || status.st_uid != ::geteuid()
        || status.st_mtime >= ::time(nullptr) - LeftoverAge)
        return false;
    const Stream folder = openFolder(parent, name.c_str());
    return folder && ::flock(::dirfd(folder.get()), LOCK_EX | LOCK_NB) == 0;
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

std::error_code copyByStaging(const Path &source, const Path &target, Kind kind)
{
    const StagingFolder staging(target.parent_path());
    if (staging.error())
        return staging.error();
    if (const std::error_code error = copyTree(source, staging.item(), kind))
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
    int items = 0;
    while (!error && it != fs::recursive_directory_iterator()) {
        const bool isFolder = fs::is_directory(it->symlink_status(error));
        if (!error && isFolder && !isWritableFolder(it->path()))
            return lastError();
        if (!error && TreeLimits::areMet(it.depth() + 1, ++items))
            return std::make_error_code(std::errc::file_too_large);
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
    removeLeftovers(source.parent_path());
    const StagingFolder leaving(source.parent_path());
    if (leaving.error())
        return leaving.error();
    if ((error = copyByStaging(source, target, Kind::Move)))
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
        return copyByStaging(source, target, Kind::Copy);
    if (fs::is_directory(status))
        return remakeLink(source, target);
    const Path file = fs::canonical(source, error);
    return error ? error : copyByStaging(file, target, Kind::Copy);
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
    removeAt(AT_FDCWD, path.string());
}

void removeLeftovers(const Path &directory)
{
    const Stream folder(::opendir(directory.c_str()), ::closedir);
    if (!folder)
        return;
    for (const std::string &name : namesIn(folder.get())) {
        if (isLeftover(::dirfd(folder.get()), name))
            removeAt(::dirfd(folder.get()), name);
    }
}

} // namespace TreeCopy
