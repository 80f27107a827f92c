// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSet>
#include <QString>

#include <memory>
#include <optional>

#include <dirent.h>

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

    /// The names of all that \a folder holds: dot files, links that lead nowhere, and what stands for
    /// names that are no text are among them; nothing when it cannot be listed. Looks at no file.
    static std::optional<QSet<QString>> namesIn(const QString &folder);

    /// Whether a name that \a folder holds may be no text in UTF-8; a text with the character that stands for
    /// such bytes counts as well. Looks no further than the first one.
    static bool holdsOddName(const QString &folder);

    /// Lists nothing if \a folder cannot be read.
    explicit FolderListing(const QString &folder, DotFiles dotFiles = Without);

    /// The next item; nothing when there is none left.
    std::optional<Item> next();

private:
    using Stream = std::unique_ptr<DIR, int (*)(DIR *)>;

    static Stream open(const QString &folder);
    static const dirent *read(DIR *folder);

    std::optional<Item> itemOf(const dirent &entry) const;

    QString m_prefix;
    DotFiles m_dotFiles;
    Stream m_folder; // null where it cannot be read
};
