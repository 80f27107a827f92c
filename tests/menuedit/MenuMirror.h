// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QMap>
#include <QString>
#include <QStringList>

/**
 * What a menu directory has to hold and to show, kept without any model of Qt's.
 *
 * Paths are relative to the menu directory, which itself is the empty path. The operations
 * only change what is kept here; nothing is written.
 */
class MenuMirror
{
public:
    enum class Kind { File, Folder, Link };

    /// One file, folder or link.
    struct Item
    {
        Kind kind = Kind::File;
        /// The bytes of the file, of the folder's ".directory" (null without one), or the link's text.
        QByteArray bytes;
        /// The name under which a folder was first shown, which stays; null when not shown yet.
        QString shownFirst;

        bool operator==(const Item &other) const { return kind == other.kind && bytes == other.bytes; }
    };

    /// What a directory holds now.
    static MenuMirror ofDisk(const QString &directory);
    /// The differences between two directories, for a person; empty when there are none.
    static QString difference(const MenuMirror &expected, const MenuMirror &found);

    static QString join(const QString &folder, const QString &name);
    static QString folderOf(const QString &path);
    static QString nameOf(const QString &path);
    static bool isBelow(const QString &path, const QString &folder);

    bool contains(const QString &path) const { return m_items.contains(path); }
    Item &item(const QString &path) { return m_items[path]; }
    Kind kindOf(const QString &path) const { return m_items.value(path).kind; }
    QStringList paths() const { return m_items.keys(); }
    QStringList childrenOf(const QString &folder) const;

    void copy(const QString &source, const QString &target);
    void move(const QString &source, const QString &target);
    void remove(const QString &path);

    /// The `SortOrder` of a folder.
    QStringList sortOrderOf(const QString &folder) const;
    /// Lists \a shown, with \a name before \a following (at the end for an empty one; nowhere
    /// when that is null).
    void list(const QString &folder, const QStringList &shown, const QString &name, const QString &following)
    {
        list(folder, shown, QStringList{name}, following);
    }
    /// The same with several names.
    void list(const QString &folder, const QStringList &shown, const QStringList &names,
              const QString &following);

    bool isHidden(const QString &path) const;
    QString shownName(const QString &path) const;
    /// Folders keep the names under which they are shown now.
    void keepFolderNames();
    /// What is wrong with \a names as the rows of a folder; empty when nothing is.
    QString faultOf(const QString &folder, const QStringList &names) const;

private:
    static QByteArray valueOf(const QByteArray &record, const QByteArray &key);
    void add(const QString &directory, const QString &path);
    QByteArray recordOf(const QString &path) const;
    bool isShownAsFolder(const QString &path) const;
    bool standsBefore(const QString &folder, const QString &left, const QString &right) const;

    QMap<QString, Item> m_items;
};
