// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HeldFile.h"

#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <system_error>
#include <vector>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

bool isInGroup(gid_t group)
{
    if (group == getegid())
        return true;
    const int count = getgroups(0, nullptr);
    std::vector<gid_t> groups(std::size_t(count > 0 ? count : 0));
    if (count <= 0 || getgroups(count, groups.data()) != count)
        return false;
    for (const gid_t own : groups) {
        if (own == group)
            return true;
    }
    return false;
}

// For a file of another user's.
bool mayExecute(const struct stat &file)
{
    if (geteuid() == 0)
        return (file.st_mode & (S_IXUSR | S_IXGRP | S_IXOTH)) != 0;
    return (file.st_mode & (isInGroup(file.st_gid) ? S_IXGRP : S_IXOTH)) != 0;
}

bool isInDataFolder(const QString &path)
{
    const QStringList folders = QStandardPaths::standardLocations(QStandardPaths::GenericDataLocation);
    for (const QString &folder : folders) {
        const QString canonical = QFileInfo(folder).canonicalFilePath();
        if (folder.startsWith(QLatin1Char('/')) && !canonical.isEmpty()
            && path.startsWith(canonical + QLatin1Char('/')))
            return true;
    }
    return false;
}

// Where the system sees the held file, with all links followed; empty when it does not tell.
QString placeOf(const QString &heldPath)
{
    std::error_code error;
    const std::filesystem::path place =
        std::filesystem::read_symlink(QFile::encodeName(heldPath).constData(), error);
    return error ? QString() : QFile::decodeName(place.c_str());
}

} // namespace

HeldFile::HeldFile(const QString &path)
    : m_descriptor(open(QFile::encodeName(path).constData(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY))
    , m_error(m_descriptor < 0 ? QString::fromLocal8Bit(std::strerror(errno)) : QString())
{
}

HeldFile::~HeldFile()
{
    if (isOpen())
        close(m_descriptor);
}

QString HeldFile::path() const
{
    return QStringLiteral("/proc/self/fd/%1").arg(m_descriptor);
}

QString HeldFile::whyNotTrusted() const
{
    struct stat status = {};
    if (fstat(m_descriptor, &status) != 0)
        return QString::fromLocal8Bit(std::strerror(errno));
    const bool isOurs = status.st_uid == 0 || status.st_uid == geteuid();
    if (isOurs || mayExecute(status) || isInDataFolder(placeOf(path())))
        return {};
    return QStringLiteral("it belongs to another user and is not executable; "
                          "if you trust it, run it with vel-open --trust --exec");
}
