// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <filesystem>
#include <map>
#include <set>
#include <string>

/// What a menu holds, as far as an update has to know.
struct MenuSnapshot
{
    struct File
    {
        std::string digest; ///< empty for what is no regular file
        QString name; ///< these two only when everything was read
        QString exec;
    };

    std::map<std::string, File> files; ///< the entries by their paths below the menu
    std::set<std::string> folders; ///< the folders that are named after a main category
    std::set<std::string> names; ///< the paths of all that is in those folders
    bool isEmpty = true; ///< there is nothing in it that a menu shows

    /// Reads the folders that are named after a main category.
    static MenuSnapshot ofCategories(const std::filesystem::path &menu);
    /// Reads everything.
    static MenuSnapshot ofAll(const std::filesystem::path &menu);
};
