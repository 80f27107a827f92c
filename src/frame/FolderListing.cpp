// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderListing.h"

#include <QByteArray>
#include <QFile>

#include <system_error>

namespace fs = std::filesystem;

FolderListing::FolderListing(const QString &folder, DotFiles dotFiles)
    : m_prefix(folder.endsWith(QLatin1Char('/')) ? folder : folder + QLatin1Char('/'))
    , m_dotFiles(dotFiles)
{
    std::error_code error;
    if (!folder.isEmpty())
        m_entries = fs::directory_iterator(QFile::encodeName(folder).toStdString(), error);
}

std::optional<FolderListing::Item> FolderListing::next()
{
    std::optional<Item> item;
    std::error_code error;
    while (!item && m_entries != fs::directory_iterator()) {
        item = itemOf(*m_entries);
        m_entries.increment(error);
    }
    return item;
}

// Of most files no more is asked than what stands in the folder.
std::optional<FolderListing::Item> FolderListing::itemOf(const fs::directory_entry &entry) const
{
    const std::string bytes = entry.path().filename().string();
    if (m_dotFiles == Without && bytes.front() == '.')
        return std::nullopt;
    const QByteArray raw = QByteArray::fromStdString(bytes);
    Item item;
    item.name = QFile::decodeName(raw);
    if (QFile::encodeName(item.name) != raw)
        return std::nullopt;
    item.path = m_prefix + item.name;
    std::error_code error;
    item.isLink = entry.is_symlink(error);
    item.isFolder = entry.is_directory(error);
    const bool isShown = item.isFolder || (item.isLink ? entry.exists(error) : entry.is_regular_file(error));
    return isShown ? std::optional<Item>(item) : std::nullopt;
}
