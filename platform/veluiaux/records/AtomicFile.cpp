// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "AtomicFile.h"

#include "FileDescriptor.h"

#include <QRandomGenerator>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <climits>
#include <cstdio>

namespace {

constexpr int MostLinks = 40;
constexpr int MostNames = 100;
constexpr mode_t PermissionBits = 07777;
constexpr mode_t NewFile = 0666;
constexpr mode_t OwnerOnly = 0600;

QByteArray folderOf(const QByteArray &path)
{
    return path.left(path.lastIndexOf('/') + 1);
}

// A file of a free name in a folder; gone with this object unless it was renamed.
class TemporaryFile
{
public:
    TemporaryFile(const QByteArray &folder, mode_t mode)
        : m_file(create(folder, mode))
    {
    }
    TemporaryFile(const TemporaryFile &) = delete;
    TemporaryFile &operator=(const TemporaryFile &) = delete;
    ~TemporaryFile()
    {
        if (m_file.isOpen() && !m_name.isEmpty())
            ::unlink(m_name.constData());
    }

    bool isOpen() const { return m_file.isOpen(); }
    int get() const { return m_file.get(); }

    bool write(std::string_view bytes)
    {
        while (!bytes.empty()) {
            const ssize_t count = ::write(m_file.get(), bytes.data(), bytes.size());
            if (count < 0 && errno == EINTR)
                continue;
            if (count <= 0)
                return false;
            bytes.remove_prefix(std::size_t(count));
        }
        return true;
    }

    bool rename(const QByteArray &target)
    {
        if (::rename(m_name.constData(), target.constData()) != 0)
            return false;
        m_name.clear();
        return true;
    }

private:
    int create(const QByteArray &folder, mode_t mode)
    {
        // A dot file without the suffix of an entry: no menu shows it.
        for (int i = 0; i < MostNames; ++i) {
            m_name = folder + ".velentry-" + QByteArray::number(QRandomGenerator::global()->generate(), 36);
            const int file = ::open(m_name.constData(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode);
            if (file >= 0 || errno != EEXIST)
                return file;
        }
        return -1;
    }

    QByteArray m_name;
    FileDescriptor m_file;
};

// The bits of a file whose owner and group are not those of the old one yet: nobody may do more
// than he might with the old one.
mode_t firstBits(mode_t old)
{
    const mode_t others = old & S_IRWXO;
    const bool groupIsAsOthers = (old & S_IRWXG) == others << 3;
    return groupIsAsOthers ? old & (S_IRWXU | S_IRWXG | S_IRWXO) : OwnerOnly;
}

// The new file gets what the old one allows to whom.
bool takeOver(int file, const struct stat &old)
{
    struct stat status;
    if (::fstat(file, &status) != 0)
        return false;
    bool sameBits = ((status.st_mode ^ old.st_mode) & PermissionBits) == 0;
    if (status.st_uid != old.st_uid || status.st_gid != old.st_gid) {
        // Giving a file away is only for the privileged; the group may still be kept.
        if (::fchown(file, old.st_uid, old.st_gid) != 0 && ::fchown(file, uid_t(-1), old.st_gid) != 0)
            errno = 0;
        sameBits = false; // A new owner costs some.
    }
    return sameBits || ::fchmod(file, old.st_mode & PermissionBits) == 0;
}

// Renaming would replace a file that is write-protected, too.
bool isWritable(const AtomicFile::Target &target)
{
    if (!S_ISREG(target.status.st_mode))
        return false;
    const bool byOwner = (target.status.st_mode & S_IWUSR) != 0 && target.status.st_uid == ::geteuid();
    return byOwner || ::access(target.path.constData(), W_OK) == 0;
}

} // namespace

std::optional<AtomicFile::Target> AtomicFile::find(const QByteArray &path)
{
    if (path.contains('\0'))
        return std::nullopt;
    Target target{path, false, {}};
    for (int i = 0; i < MostLinks; ++i) {
        target.exists = ::lstat(target.path.constData(), &target.status) == 0;
        if (!target.exists)
            return errno == ENOENT ? std::make_optional(target) : std::nullopt;
        if (!S_ISLNK(target.status.st_mode))
            return target;
        std::array<char, PATH_MAX> link;
        const ssize_t length = ::readlink(target.path.constData(), link.data(), link.size());
        if (length < 0)
            return std::nullopt;
        const QByteArray to(link.data(), int(length));
        target.path = to.startsWith('/') ? to : folderOf(target.path) + to;
    }
    return std::nullopt;
}

bool AtomicFile::replace(const Target &target, std::string_view bytes)
{
    if (target.exists && !isWritable(target))
        return false;
    TemporaryFile file(folderOf(target.path), target.exists ? firstBits(target.status.st_mode) : NewFile);
    return file.isOpen() && file.write(bytes) && (!target.exists || takeOver(file.get(), target.status))
        && ::fsync(file.get()) == 0 && file.rename(target.path);
}
