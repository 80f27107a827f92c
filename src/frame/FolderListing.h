// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <filesystem>
#include <optional>

/**
 * What a folder holds, item by item, in the order of the file system: files, folders, and links
 * that lead somewhere.
 *
 * A name that is no text is left out and the rest is listed, where a QDirIterator may end.
 */
class FolderListing
{
public:
    enum DotFiles { Without, With };

    struct Item
    {
        QString path; ///< below the folder as it was given
        QString name;
        bool isFolder = false; ///< or a link to one
        bool isLink = false;
    };

    /// Lists nothing if \a folder cannot be read.
    explicit FolderListing(const QString &folder, DotFiles dotFiles = Without);

    /// The next item; nothing when there is none left.
    std::optional<Item> next();

private:
    std::optional<Item> itemOf(const std::filesystem::directory_entry &entry) const;

    QString m_prefix;
    DotFiles m_dotFiles;
    std::filesystem::directory_iterator m_entries;
};
