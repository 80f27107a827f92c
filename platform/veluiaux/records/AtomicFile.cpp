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

// The new file gets what the old one allows to whom.
bool takeOver(int file, const struct stat &old)
{
    struct stat status;
    if (::fstat(file, &status) != 0)
        return false;
    if (status.st_uid != old.st_uid || status.st_gid != old.st_gid) {
        // Giving a file away is only for the privileged; the group may still be kept.
        if (::fchown(file, old.st_uid, old.st_gid) != 0 && ::fchown(file, uid_t(-1), old.st_gid) != 0)
            errno = 0;
    }
    return ::fchmod(file, old.st_mode & PermissionBits) == 0;
}

} // namespace

QByteArray AtomicFile::target(const QByteArray &path)
{
    if (path.contains('\0'))
        return {};
    QByteArray at = path;
    for (int i = 0; i < MostLinks; ++i) {
        std::array<char, PATH_MAX> link;
        const ssize_t length = ::readlink(at.constData(), link.data(), link.size());
        if (length < 0)
            return at;
        const QByteArray to(link.data(), int(length));
        at = to.startsWith('/') ? to : folderOf(at) + to;
    }
    return {};
}

std::optional<FileStamp> AtomicFile::replace(const QByteArray &target, std::string_view bytes)
{
    struct stat status;
    const bool exists = ::lstat(target.constData(), &status) == 0;
    if (!exists && errno != ENOENT)
        return std::nullopt;
    // Renaming would replace a file that is write-protected, too.
    if (exists && (!S_ISREG(status.st_mode) || ::access(target.constData(), W_OK) != 0))
        return std::nullopt;

    TemporaryFile file(folderOf(target), exists ? OwnerOnly : NewFile);
    if (!file.isOpen() || !file.write(bytes) || (exists && !takeOver(file.get(), status))
        || ::fsync(file.get()) != 0 || !file.rename(target) || ::fstat(file.get(), &status) != 0)
        return std::nullopt;
    return FileStamp(status);
}
