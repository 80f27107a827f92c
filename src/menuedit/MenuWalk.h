// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/FolderListing.h>

#include <QString>
#include <QVector>

#include <functional>
#include <optional>

/**
 * Goes through all that a menu directory holds, item by item, on disk: no model reads or watches a
 * folder for it.
 *
 * A link within the menu is followed, but not into a folder that it lies in. What a link outside
 * leads to is no part of the menu: of that only the folders are gone through which the user has
 * opened. Dot files are left out, and links that lead nowhere.
 */
class MenuWalk
{
public:
    struct Item
    {
        QString path; ///< below the menu directory as it was given
        bool isFolder = false;
    };

    /// Whether the user has opened the folder of that path.
    using IsOpened = std::function<bool(const QString &path)>;

    /// How many folders are gone through at most.
    static constexpr int MostFolders = 20000;

    MenuWalk(const QString &menuDirectory, IsOpened isOpened, int mostFolders = MostFolders);
    ~MenuWalk();
    MenuWalk(const MenuWalk &) = delete;
    MenuWalk &operator=(const MenuWalk &) = delete;

    /// The next item, folders before what they hold; nothing when there is none left.
    std::optional<Item> next();
    /// Whether no folder had to be left out because there are too many.
    bool isWhole() const { return m_isWhole; }

private:
    struct Folder
    {
        QString path;
        QString canonical;
        int above; ///< the index of the folder that it was met in, -1 for none
        bool isOutside;
    };

    bool enterNextFolder();
    void note(const FolderListing::Item &folder);
    bool isWithin(const QString &canonical) const;
    bool isGoneThrough(const QString &canonical) const;

    const IsOpened m_isOpened;
    const int m_mostFolders;
    QVector<Folder> m_folders;
    int m_current = -1;
    std::optional<FolderListing> m_files;
    bool m_isWhole = true;
};
