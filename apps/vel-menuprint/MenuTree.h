// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

/// One of the further actions of an entry.
struct MenuItemAction
{
    QString id;
    QString name;
    QString icon;
    QString exec;
    QString iconFile; ///< where it was looked for, empty else
};

/// What else an entry tells of itself, in the user's language; what it does not tell is empty.
struct MenuItemDetails
{
    QString genericName;
    QString comment;
    QStringList keywords;
    QStringList categories;
    QStringList mimeTypes;
    QString tryExec;
    QString workingDirectory;
    QString startupWMClass;
    QString url; ///< of a link
    bool terminal = false;
    bool startupNotify = false;
    QVector<MenuItemAction> actions;
};

/// One item of a menu directory, as the menu shows it.
struct MenuItem
{
    enum Kind {
        Folder, ///< a directory; its children follow in the menu's order
        Entry, ///< a desktop entry
        Separator, ///< a desktop entry whose command draws a line
        File ///< any other file
    };

    Kind kind = File;
    QString name; ///< the name shown
    QString path; ///< absolute
    QString icon; ///< the name of the icon or its path; may be empty
    QString iconFile; ///< where it was looked for, empty else
    QString exec; ///< the command of an entry, with its field codes
    bool isListed = true; ///< whether a menu for starting programs shows it, apart from its children
    QString whyUnlisted; ///< a word for programs: notDisplayed, notInstalled, malformed, nameless
    MenuItemDetails details; ///< of an entry
    QVector<MenuItem> children; ///< of a folder
};

/// Reads a menu directory with everything below it, in the order in which the menu shows it.
namespace MenuTree {

/// As many levels of folders are read, the first one included. Links can make a menu of any size of
/// a few folders.
constexpr int MostLevels = 32;
/// As many items are read.
constexpr int MostItems = 10000;

/**
 * Returns the folder \a path with its children.
 *
 * Dot files, entries that are not to be displayed, and links that lead back to a folder on the way
 * are left out. A folder that cannot be read has no children.
 *
 * @param isWhole is set to whether all of the menu was read, if not null; false when it has more
 *        than MostLevels or MostItems, and the rest is missing
 */
MenuItem read(const QString &path, bool *isWhole = nullptr);

} // namespace MenuTree
