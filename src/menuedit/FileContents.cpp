// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileContents.h"

#include "ExactMove.h"
#include "FileDescriptor.h"
#include "FileProgress.h"
#include "StagingFolder.h"

#include <QList>

#include <algorithm>
#include <array>

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

namespace {

constexpr off_t MostBytes = 16 << 20; // of a large menu what its entries were made from; a record has 1 MiB
constexpr mode_t AllBits = 07777;
constexpr mode_t PlainBits = 0777;

QByteArray attributeOf(int fd, const QByteArray &name)
{
    const ssize_t size = ::fgetxattr(fd, name.constData(), nullptr, 0);
    QByteArray value(int(std::max<ssize_t>(size, 0)), '\0');
    const ssize_t got = ::fgetxattr(fd, name.constData(), value.data(), size_t(value.size()));
    return value.left(int(std::max<ssize_t>(got, 0)));
}

// What a security module puts on files by itself.
bool isOfTheSystem(const QByteArray &attribute)
{
    return attribute.startsWith("security.");
}

// What was found in place of what was expected.
std::error_code unexpected(const std::optional<FileContents> &found)
{
    return std::make_error_code(found && !found->exists() ? std::errc::no_such_file_or_directory
                                                          : std::errc::file_exists);
}

} // namespace

std::optional<FileContents> FileContents::of(const TreeCopy::Path &path)
{
    FileContents contents;
    // Not blocking: it may be a pipe.
    const FileDescriptor file(::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_NOFOLLOW | O_CLOEXEC));
    if (!file.isOpen())
        return errno == ENOENT ? std::make_optional(contents) : std::nullopt;
    contents.m_exists = true;
    return contents.read(file.fd()) ? std::make_optional(contents) : std::nullopt;
}

bool FileContents::read(int fd)
{
    struct stat status = {};
    if (::fstat(fd, &status) != 0 || !S_ISREG(status.st_mode) || status.st_size > MostBytes)
        return false;
    m_mode = status.st_mode & AllBits;
    m_owner = status.st_uid;
    m_group = status.st_gid;
    m_modified = status.st_mtim;
    std::array<char, 1 << 14> buffer;
    for (;;) {
        const ssize_t count = ::read(fd, buffer.data(), buffer.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0 || m_bytes.size() > MostBytes)
            return false;
        if (count == 0)
            return readAttributes(fd);
        m_bytes.append(buffer.data(), int(count));
    }
}

bool FileContents::readAttributes(int fd)
{
    const ssize_t size = ::flistxattr(fd, nullptr, 0);
    if (size <= 0)
        return size == 0 || errno == ENOTSUP;
    QByteArray names(int(size), '\0');
    const ssize_t got = ::flistxattr(fd, names.data(), size_t(size));
    if (got < 0)
        return false;
    const QList<QByteArray> all = names.left(int(got)).split('\0');
    for (const QByteArray &name : all) {
        if (!name.isEmpty() && !isOfTheSystem(name))
            m_attributes.insert(name, attributeOf(fd, name));
    }
    return true;
}

bool FileContents::operator==(const FileContents &other) const
{
    return m_exists == other.m_exists && m_bytes == other.m_bytes && m_mode == other.m_mode
        && m_attributes == other.m_attributes;
}

// What is there leaves its place before it is looked at, and goes back when it is not what was expected:
// so nobody can put another file there in between.
std::error_code FileContents::replace(const TreeCopy::Path &path, const FileContents &expected) const
{
    FileProgress nobody;
    const StagingFolder folder(path.parent_path(), nobody);
    if (folder.error())
        return folder.error();
    if (m_exists && !write(folder.item()))
        return lastError();
    if (!expected.m_exists)
        return m_exists ? ExactMove::move(folder.item(), path, nobody) : std::error_code();

    const auto swap = [&] {
        return m_exists ? ExactMove::exchange(folder.item(), path)
                        : ExactMove::move(path, folder.item(), nobody);
    };
    if (const std::error_code error = swap())
        return error;
    const std::optional<FileContents> found = of(folder.item());
    if (found && *found == expected)
        return {};
    if (m_exists)
        ExactMove::exchange(folder.item(), path);
    else
        ExactMove::move(folder.item(), path, nobody);
    return unexpected(found);
}

bool FileContents::write(const TreeCopy::Path &path) const
{
    const FileDescriptor file(
        ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC, S_IRUSR | S_IWUSR));
    const char *bytes = m_bytes.constData();
    for (qint64 left = file.isOpen() ? m_bytes.size() : 0; left > 0;) {
        const ssize_t count = ::write(file.fd(), bytes, size_t(left));
        if (count < 0 && errno != EINTR)
            return false;
        bytes += std::max<ssize_t>(count, 0);
        left -= std::max<ssize_t>(count, 0);
    }
    const std::array<timespec, 2> stamps{m_modified, m_modified};
    return file.isOpen() && giveRights(file.fd()) && ::futimens(file.fd(), stamps.data()) == 0
        && ::fsync(file.fd()) == 0;
}

// Nobody gets rights that they had not: set-id bits and the group's belong to owner and group, which not
// everybody may give.
bool FileContents::giveRights(int fd) const
{
    struct stat status = {};
    if (::fchown(fd, m_owner, m_group) != 0 && ::fchown(fd, uid_t(-1), m_group) != 0)
        errno = 0;
    if (::fstat(fd, &status) != 0)
        return false;
    for (auto it = m_attributes.begin(); it != m_attributes.end(); ++it) {
        if (::fsetxattr(fd, it.key().constData(), it->constData(), size_t(it->size()), 0) != 0)
            return false;
    }
    mode_t mode = m_mode;
    if (status.st_uid != m_owner || status.st_gid != m_group)
        mode &= PlainBits;
    if (status.st_gid != m_group)
        mode &= ~mode_t(S_IRWXG) | ((mode & S_IRWXO) << 3);
    return ::fchmod(fd, mode) == 0;
}
