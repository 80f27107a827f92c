// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFile.h"

#include "ContentsDigest.h"
#include "FolderRemoval.h"

#include <velcore/files.h>
#include <velcore/folderlock.h>

#include <cerrno>
#include <cstdio>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

// A dot file without the suffix of an entry: no menu shows it.
constexpr char TemporaryName[] = ".velmenu-";
constexpr mode_t PlainBits = 0777;

bool writeAll(int file, const std::string &bytes)
{
    for (std::size_t done = 0; done < bytes.size();) {
        const ssize_t count = ::write(file, bytes.data() + done, bytes.size() - done);
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return false;
        done += std::size_t(count);
    }
    return true;
}

// New contents beside where they belong; gone with this object unless they took that place.
class Replacement
{
public:
    Replacement(const fs::path &target, const MenuFile::Contents &contents)
        : m_path(MenuFile::temporaryIn(target.parent_path()))
        , m_file(::open(m_path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC,
                        mode_t(contents.permissions)))
        , m_isReady(m_file >= 0 && writeAll(m_file, contents.bytes) && fsync(m_file) == 0)
    {
    }
    ~Replacement()
    {
        if (m_file < 0)
            return;
        close(m_file);
        unlink(m_path.c_str());
    }
    Replacement(const Replacement &) = delete;
    Replacement &operator=(const Replacement &) = delete;

    bool isReady() const { return m_isReady; }
    const fs::path &path() const { return m_path; }

    // Nobody else gets rights by it.
    bool takePermissions(const fs::path &from) const
    {
        struct stat old = {};
        struct stat now = {};
        if (stat(from.c_str(), &old) != 0 || fstat(m_file, &now) != 0)
            return false;
        const bool isSame = old.st_uid == now.st_uid && old.st_gid == now.st_gid;
        return fchmod(m_file, old.st_mode & (isSame ? PlainBits : S_IRWXU)) == 0;
    }

private:
    fs::path m_path;
    int m_file;
    bool m_isReady;
};

} // namespace

bool MenuFile::read(const fs::path &path, Contents *contents)
{
    const Vel::SmallFile file(path.string());
    struct stat status = {};
    if (!file.isRead() || stat(path.c_str(), &status) != 0)
        return false;
    *contents = {file.bytes(), unsigned((status.st_mode & PlainBits) | S_IRUSR | S_IWUSR)};
    return true;
}

bool MenuFile::add(const fs::path &path, const Contents &contents)
{
    const Replacement added(path, contents);
    return added.isReady() && renameToFree(added.path(), path);
}

bool MenuFile::replace(const fs::path &path, const std::string &digest, const std::string &bytes)
{
    const Replacement replacement(path, {bytes, S_IRUSR | S_IWUSR});
    if (!replacement.isReady())
        return false;
    const Vel::FolderLock lock(path.parent_path().string());
    return fileDigest(path) == digest && replacement.takePermissions(path)
        && std::rename(replacement.path().c_str(), path.c_str()) == 0;
}

bool MenuFile::remove(const fs::path &path, const std::string &digest)
{
    const Vel::FolderLock lock(path.parent_path().string());
    return fileDigest(path) == digest && unlink(path.c_str()) == 0;
}

bool MenuFile::move(const fs::path &from, const std::string &digest, const fs::path &to,
                    const Contents &contents)
{
    const Replacement added(to, contents);
    if (!added.isReady())
        return false;
    const Vel::FolderLock lock(from.parent_path().string());
    if (fileDigest(from) != digest || !renameToFree(added.path(), to))
        return false;
    if (unlink(from.c_str()) == 0)
        return true;
    unlink(to.c_str());
    return false;
}

bool MenuFile::renameToFree(const fs::path &from, const fs::path &to)
{
    if (renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), RENAME_NOREPLACE) == 0)
        return true;
    // Not every file system knows how.
    return (errno == EINVAL || errno == ENOSYS) && !pathExists(to)
        && std::rename(from.c_str(), to.c_str()) == 0;
}

fs::path MenuFile::temporaryIn(const fs::path &folder)
{
    for (int i = 0;; ++i) {
        fs::path path = folder / (TemporaryName + std::to_string(getpid()) + '-' + std::to_string(i));
        if (!pathExists(path))
            return path;
    }
}

bool MenuFile::isTemporary(const std::string &name)
{
    return name.compare(0, sizeof TemporaryName - 1, TemporaryName) == 0;
}
