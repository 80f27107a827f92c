// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileRights.h"

#include "FileDescriptor.h"

#include <acl/libacl.h>
#include <attr/libattr.h>
#include <fcntl.h>
#include <sys/acl.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstring>
#include <string_view>
#include <utility>

namespace {

constexpr mode_t OwnerOnly = 0600;
constexpr mode_t PlainBits = S_IRWXU | S_IRWXG | S_IRWXO;
constexpr mode_t PermissionBits = 07777;
constexpr const char *AccessListName = "system.posix_acl_access";

// The system's own attributes (capabilities, labels) hold for one file and none that replaces it.
int isOfUsers(const char *name, struct error_context *)
{
    return std::strncmp(name, "user.", 5) == 0;
}

mode_t bitsOf(acl_entry_t entry)
{
    acl_permset_t set;
    if (::acl_get_permset(entry, &set) != 0)
        return 0;
    return mode_t((::acl_get_perm(set, ACL_READ) ? S_IROTH : 0)
                  | (::acl_get_perm(set, ACL_WRITE) ? S_IWOTH : 0)
                  | (::acl_get_perm(set, ACL_EXECUTE) ? S_IXOTH : 0));
}

} // namespace

struct FileRights::AccessList
{
    explicit AccessList(acl_t all)
        : list(all)
    {
    }
    AccessList(const AccessList &) = delete;
    AccessList &operator=(const AccessList &) = delete;
    ~AccessList() { ::acl_free(list); }

    acl_t list;
};

FileRights::FileRights(QByteArray path, const struct stat &status)
    : m_path(std::move(path))
    , m_status(status)
{
    look();
    if (!m_hasAccessList)
        return;
    const FileDescriptor file(::open(m_path.constData(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    if (file.isOpen())
        readAccessList(file.get());
}

// One call tells of most files that they have neither.
void FileRights::look()
{
    if (::llistxattr(m_path.constData(), nullptr, 0) == 0)
        return;
    std::array<char, 1024> names;
    const ssize_t size = ::llistxattr(m_path.constData(), names.data(), names.size());
    if (size < 0) {
        // Too many to tell, or the folder has been renamed: then it is not known that there is no list.
        m_hasAccessList = m_hasAttributes = errno == ERANGE || errno == ENOENT || errno == ENOTDIR;
        return;
    }
    for (const char *name = names.data(); name < names.data() + size; name += std::strlen(name) + 1) {
        m_hasAccessList = m_hasAccessList || std::strcmp(name, AccessListName) == 0;
        m_hasAttributes = m_hasAttributes || isOfUsers(name, nullptr);
    }
}

void FileRights::readAccessList(int file)
{
    if (const acl_t list = ::acl_get_fd(file))
        m_accessList = std::make_shared<AccessList>(list);
}

mode_t FileRights::firstBits() const
{
    const mode_t others = m_status.st_mode & S_IRWXO;
    const bool groupIsAsOthers = (m_status.st_mode & S_IRWXG) == others << 3;
    return groupIsAsOthers && !m_hasAccessList ? m_status.st_mode & PlainBits : OwnerOnly;
}

// What everybody but the owner could do. With an access list the group's bits are its mask, which
// may allow more than the group itself could do.
mode_t FileRights::leastBits() const
{
    mode_t least = m_status.st_mode & (m_status.st_mode >> 3) & S_IRWXO;
    if (!m_hasAccessList)
        return least;
    acl_entry_t entry;
    bool isRead = m_accessList != nullptr;
    for (int which = ACL_FIRST_ENTRY; isRead && ::acl_get_entry(m_accessList->list, which, &entry) == 1;
         which = ACL_NEXT_ENTRY) {
        acl_tag_t tag = ACL_UNDEFINED_TAG;
        isRead = ::acl_get_tag_type(entry, &tag) == 0;
        if (tag != ACL_USER_OBJ)
            least &= bitsOf(entry);
    }
    return isRead ? least : 0;
}

// A folder may give a list of its own to each new file in it.
bool FileRights::giveAccessList(int file) const
{
    if (m_accessList)
        return ::acl_set_fd(file, m_accessList->list) == 0;
    return !m_hasAccessList
        && (::fgetxattr(file, AccessListName, nullptr, 0) <= 0 || ::fremovexattr(file, AccessListName) == 0);
}

void FileRights::giveAttributes(int file) const
{
    const FileDescriptor old(::open(m_path.constData(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    if (old.isOpen())
        ::attr_copy_fd(m_path.constData(), old.get(), "", file, isOfUsers, nullptr);
}

bool FileRights::giveTo(int file) const
{
    struct stat now;
    if (::fstat(file, &now) != 0)
        return false;
    bool isOwner = now.st_uid == m_status.st_uid;
    bool isGroup = now.st_gid == m_status.st_gid;
    const bool isGiven = !isOwner || !isGroup;
    if (isGiven && ::fchown(file, m_status.st_uid, m_status.st_gid) == 0)
        isOwner = isGroup = true;
    else if (!isGroup) // Giving a file away is only for the privileged; the group may still be kept.
        isGroup = ::fchown(file, uid_t(-1), m_status.st_gid) == 0;
    if (m_hasAttributes)
        giveAttributes(file);

    mode_t bits = m_status.st_mode & PlainBits;
    const bool isWhole = isGroup && giveAccessList(file);
    if (!isWhole)
        bits = (bits & S_IRWXU) | leastBits() * 011;
    if (isOwner && isGroup)
        bits |= m_status.st_mode & (S_ISUID | S_ISGID | S_ISVTX);
    // A new owner costs some, and a list changes what the group's bits mean.
    const bool asIs = !isGiven && isWhole && !m_hasAccessList && (now.st_mode & PermissionBits) == bits;
    return asIs || ::fchmod(file, bits) == 0;
}
