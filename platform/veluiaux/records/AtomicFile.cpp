// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "AtomicFile.h"

#include "EntryFile.h"
#include "FileDescriptor.h"
#include "FileRights.h"

#include <velcore/files.h>

#include <QRandomGenerator>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <charconv>
#include <chrono>
#include <climits>
#include <cstdint>
#include <functional>
#include <map>
#include <mutex>

namespace {

constexpr int MostLinks = 40;
constexpr int MostNames = 100;
constexpr mode_t NewFile = 0666;
// A dot file without the suffix of an entry: no menu shows it.
constexpr std::string_view TemporaryName = ".velentry-";
constexpr std::size_t MostDigits = 7; // of 32 bits in base 36
constexpr int MostFolders = 64;

// Renaming would replace a file that is write-protected, too.
bool isWritable(const AtomicFile::Target &target)
{
    if (!S_ISREG(target.status.st_mode))
        return false;
    const bool byOwner = (target.status.st_mode & S_IWUSR) != 0 && target.status.st_uid == ::geteuid();
    return byOwner || ::faccessat(target.folder->get(), target.name(), W_OK, 0) == 0;
}

bool isTemporaryName(std::string_view name)
{
    if (name.substr(0, TemporaryName.size()) != TemporaryName)
        return false;
    name.remove_prefix(TemporaryName.size());
    return !name.empty() && name.size() <= MostDigits && std::all_of(name.begin(), name.end(), [](char c) {
        return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'z');
    });
}

std::string temporaryName(std::uint32_t number)
{
    std::array<char, MostDigits> digits;
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), number, 36).ptr;
    return std::string(TemporaryName).append(digits.data(), end);
}

bool writeAll(int file, std::string_view bytes)
{
    while (!bytes.empty()) {
        const ssize_t count = ::write(file, bytes.data(), bytes.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return false;
        bytes.remove_prefix(std::size_t(count));
    }
    return true;
}

// Whether a folder has not been looked through for an hour; for large ones that takes its time.
bool isLookDue(std::string_view folder)
{
    using Clock = std::chrono::steady_clock;
    static std::mutex mutex;
    using Looks = std::map<std::string, Clock::time_point, std::less<>>;
    static auto *const looks = new Looks; // outlives every static
    const Clock::time_point now = Clock::now();
    const std::lock_guard<std::mutex> lock(mutex);
    const auto last = looks->find(folder);
    if (last != looks->end() && now - last->second < std::chrono::hours(1))
        return false;
    if (looks->size() >= MostFolders)
        looks->clear();
    looks->insert_or_assign(std::string(folder), now);
    return true;
}

// One that may not be read can still be written to.
std::shared_ptr<const FileDescriptor> openFolder(std::string_view path)
{
    const std::string name(path.empty() ? "." : path);
    int folder = ::open(name.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (folder < 0 && errno == EACCES)
        folder = ::open(name.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC);
    return folder < 0 ? nullptr : std::make_shared<const FileDescriptor>(folder);
}

// False when it cannot be told what is there.
bool look(AtomicFile::Target *target)
{
    target->exists = false;
    target->folder = openFolder(target->folderPath());
    if (!target->folder)
        return errno == ENOENT;
    target->exists =
        ::fstatat(target->folder->get(), target->name(), &target->status, AT_SYMLINK_NOFOLLOW) == 0;
    return target->exists || errno == ENOENT;
}

// Where the link at a target leads; empty if that cannot be told.
QByteArray linkedPath(const AtomicFile::Target &target)
{
    std::array<char, PATH_MAX> link;
    const ssize_t length = ::readlinkat(target.folder->get(), target.name(), link.data(), link.size());
    if (length <= 0)
        return {};
    const QByteArray to(link.data(), int(length));
    return to.startsWith('/') ? to : target.path.left(target.path.lastIndexOf('/') + 1) + to;
}

} // namespace

std::optional<AtomicFile::Target> AtomicFile::find(const QByteArray &path)
{
    if (path.contains('\0'))
        return std::nullopt;
    Target target{path, false, {}, nullptr};
    for (int i = 0; i < MostLinks; ++i) {
        if (target.path.isEmpty() || target.path.endsWith('/') || !look(&target))
            return std::nullopt;
        if (!target.exists || !S_ISLNK(target.status.st_mode))
            return target;
        if (i == 0 && Vel::leadsThroughPlantedLink(path.toStdString()))
            return std::nullopt;
        target.path = linkedPath(target);
    }
    return std::nullopt;
}

bool AtomicFile::isUnchanged(const Target &target)
{
    if (!target.folder)
        return false;
    struct stat now;
    if (::fstatat(target.folder->get(), target.name(), &now, AT_SYMLINK_NOFOLLOW) != 0)
        return errno == ENOENT && !target.exists;
    return target.exists && FileStamp(now) == FileStamp(target.status);
}

AtomicFile::Replacement::Replacement(const Target &target, std::string_view bytes)
    : m_target(target)
{
    if (!target.folder || (target.exists && !isWritable(target)))
        return;
    if (isLookDue(target.folderPath()))
        Vel::removeLeftovers(std::string(target.folderPath()), Vel::Leftover::File, isTemporaryName);
    std::optional<FileRights> rights;
    if (target.exists)
        rights.emplace(target.path, target.status);
    const FileDescriptor file(create(rights ? rights->firstBits() : NewFile));
    m_isReady = file.isOpen() && writeAll(file.get(), bytes) && (!rights || rights->giveTo(file.get()))
        && ::fsync(file.get()) == 0;
}

AtomicFile::Replacement::~Replacement()
{
    if (!m_name.empty())
        ::unlinkat(m_target.folder->get(), m_name.c_str(), 0);
}

bool AtomicFile::Replacement::commit()
{
    if (!m_isReady)
        return false;
    const int folder = m_target.folder->get();
    if (::renameat(folder, m_name.c_str(), folder, m_target.name()) != 0)
        return false;
    m_name.clear();
    return true;
}

int AtomicFile::Replacement::create(mode_t mode)
{
    for (int i = 0; i < MostNames; ++i) {
        m_name = temporaryName(QRandomGenerator::global()->generate());
        const int file =
            ::openat(m_target.folder->get(), m_name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode);
        if (file >= 0)
            return file;
        if (errno != EEXIST)
            break;
    }
    m_name.clear();
    return -1;
}
