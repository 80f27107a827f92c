// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "AtomicFile.h"

#include "EntryFile.h"
#include "FileDescriptor.h"
#include "FileRights.h"

#include <velcore/files.h>

#include <QHash>
#include <QRandomGenerator>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <climits>
#include <cstdio>
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
    return byOwner || ::access(target.path.constData(), W_OK) == 0;
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
bool isLookDue(const QByteArray &folder)
{
    using Clock = std::chrono::steady_clock;
    static std::mutex mutex;
    static auto *const looks = new QHash<QByteArray, Clock::time_point>; // outlives every static
    const Clock::time_point now = Clock::now();
    const std::lock_guard<std::mutex> lock(mutex);
    const auto last = looks->constFind(folder);
    if (last != looks->constEnd() && now - *last < std::chrono::hours(1))
        return false;
    if (looks->size() >= MostFolders)
        looks->clear();
    looks->insert(folder, now);
    return true;
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
        if (i == 0 && Vel::leadsThroughPlantedLink(path.toStdString()))
            return std::nullopt;
        std::array<char, PATH_MAX> link;
        const ssize_t length = ::readlink(target.path.constData(), link.data(), link.size());
        if (length < 0)
            return std::nullopt;
        const QByteArray to(link.data(), int(length));
        target.path = to.startsWith('/') ? to : target.folder() + to;
    }
    return std::nullopt;
}

bool AtomicFile::isUnchanged(const Target &target)
{
    struct stat now;
    if (::lstat(target.path.constData(), &now) != 0)
        return errno == ENOENT && !target.exists;
    return target.exists && FileStamp(now) == FileStamp(target.status);
}

AtomicFile::Replacement::Replacement(const Target &target, std::string_view bytes)
    : m_target(target.path)
{
    if (target.exists && !isWritable(target))
        return;
    const QByteArray folder = target.folder();
    if (isLookDue(folder))
        Vel::removeLeftovers(folder.toStdString(), Vel::Leftover::File, isTemporaryName);
    std::optional<FileRights> rights;
    if (target.exists)
        rights.emplace(target.path, target.status);
    const FileDescriptor file(create(folder, rights ? rights->firstBits() : NewFile));
    m_isReady = file.isOpen() && writeAll(file.get(), bytes) && (!rights || rights->giveTo(file.get()))
        && ::fsync(file.get()) == 0;
}

AtomicFile::Replacement::~Replacement()
{
    if (!m_name.isEmpty())
        ::unlink(m_name.constData());
}

bool AtomicFile::Replacement::commit()
{
    if (!m_isReady || ::rename(m_name.constData(), m_target.constData()) != 0)
        return false;
    m_name.clear();
    return true;
}

int AtomicFile::Replacement::create(const QByteArray &folder, mode_t mode)
{
    for (int i = 0; i < MostNames; ++i) {
        m_name = folder + QByteArray(TemporaryName.data(), int(TemporaryName.size()))
            + QByteArray::number(QRandomGenerator::global()->generate(), 36);
        const int file = ::open(m_name.constData(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode);
        if (file >= 0)
            return file;
        if (errno != EEXIST)
            break;
    }
    m_name.clear();
    return -1;
}
