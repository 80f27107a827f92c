// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QStringList>
#include <QVector>

#include <filesystem>

/// A folder of the start menu: a main category of the desktop menu standard, or a folder of ours.
struct MenuCategory
{
    const char *folder; ///< the category's name, which is the folder's too; empty for the root
    const char *icon; ///< a name of the icon theme
    const char *name; ///< the English name that is shown
};

/// The main categories in the order of the standard; the last is the folder of all that has none.
const QVector<MenuCategory> &menuCategories();

/// The start menu itself.
const MenuCategory &menuRoot();

/// The place in menuCategories() of the first main category in \a categories, else the last.
int menuCategoryOf(const QStringList &categories);

/**
 * The contents of the ".directory" file of a folder.
 *
 * @param category the folder
 * @param sortOrder the file names of its children, in order
 */
QByteArray menuDirectoryEntry(const MenuCategory &category, const QStringList &sortOrder);

/// The file that holds the name, the icon and the order of a folder of a menu.
std::filesystem::path menuFolderRecord(const std::filesystem::path &folder);
