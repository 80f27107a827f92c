// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderListing.h"

#include <QByteArray>
#include <QFile>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <string_view>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

// Its kind and rights; 0 where there is nothing.
mode_t modeOf(DIR *folder, const char *name, int flags)
{
    struct stat status = {};
    return ::fstatat(::dirfd(folder), name, &status, flags) == 0 ? status.st_mode : 0;
}

// Of most files no more is asked than what stands in the folder; but not every file system tells it there.
mode_t kindOf(DIR *folder, const dirent &entry)
{
    return entry.d_type != DT_UNKNOWN ? DTTOIF(entry.d_type)
                                      : modeOf(folder, entry.d_name, AT_SYMLINK_NOFOLLOW);
}

bool isOdd(const char *name)
{
    const auto isAscii = [](char byte) { return static_cast<unsigned char>(byte) < 0x80; };
    const std::string_view bytes(name);
    return !std::all_of(bytes.begin(), bytes.end(), isAscii)
        && QString::fromUtf8(name).contains(QChar(QChar::ReplacementCharacter));
}

} // namespace

FolderListing::Stream FolderListing::open(const QString &folder)
{
    return Stream(::opendir(QFile::encodeName(folder).constData()), ::closedir);
}

// Null at the end, and with errno set where it cannot be read on.
const dirent *FolderListing::read(DIR *folder)
{
    const dirent *entry = nullptr;
    do {
        errno = 0;
        entry = ::readdir(folder);
    } while (entry && (std::strcmp(entry->d_name, ".") == 0 || std::strcmp(entry->d_name, "..") == 0));
    return entry;
}

// A QDir would ask for the status of every file.
std::optional<QSet<QString>> FolderListing::namesIn(const QString &folder)
{
    const Stream stream = open(folder);
    if (!stream)
        return std::nullopt;
    QSet<QString> names;
    while (const dirent *entry = read(stream.get()))
        names.insert(QFile::decodeName(entry->d_name));
    return errno == 0 ? std::optional<QSet<QString>>(names) : std::nullopt;
}

bool FolderListing::holdsOddName(const QString &folder)
{
    const Stream stream = open(folder);
    while (const dirent *entry = stream ? read(stream.get()) : nullptr) {
        if (isOdd(entry->d_name))
            return true;
    }
    return false;
}

FolderListing::FolderListing(const QString &folder, DotFiles dotFiles)
    : m_prefix(folder.endsWith(QLatin1Char('/')) ? folder : folder + QLatin1Char('/'))
    , m_dotFiles(dotFiles)
    , m_folder(open(folder))
{
}

std::optional<FolderListing::Item> FolderListing::next()
{
    std::optional<Item> item;
    while (const dirent *entry = !item && m_folder ? read(m_folder.get()) : nullptr)
        item = itemOf(*entry);
    return item;
}

std::optional<FolderListing::Item> FolderListing::itemOf(const dirent &entry) const
{
    if (m_dotFiles == Without && entry.d_name[0] == '.')
        return std::nullopt;
    Item item;
    item.name = QFile::decodeName(entry.d_name);
    if (QFile::encodeName(item.name) != entry.d_name)
        return std::nullopt;
    item.path = m_prefix + item.name;
    const mode_t kind = kindOf(m_folder.get(), entry);
    item.isLink = S_ISLNK(kind);
    const mode_t target = item.isLink ? modeOf(m_folder.get(), entry.d_name, 0) : kind;
    item.isFolder = S_ISDIR(target);
    const bool isShown = item.isFolder || S_ISREG(target) || (item.isLink && target != 0);
    return isShown ? std::optional<Item>(item) : std::nullopt;
}
