// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TreeCopy.h"

#include <QByteArray>
#include <QFile>
#include <QString>
#include <QVector>

#include <sys/types.h>

#include <ctime>

/**
 * How a file, link or folder with everything in it stands on disk: names, kinds, permissions, sizes,
 * times and link texts. The bytes of files are not read: who changes them changes their time. Links
 * are not followed; what a StagingFolder holds there is left out.
 *
 * Of what holds more than TreeLimits::MostItems only the rest of it can be told from another thing.
 */
class TreeState
{
public:
    /// Nothing.
    TreeState() = default;
    /// What is at \a path now.
    explicit TreeState(const TreeCopy::Path &path);
    explicit TreeState(const QString &path);

    /// The text of the link at \a path; empty where there is none.
    static QByteArray linkTextAt(const QString &path);

    /// Whether everything is the same, wherever it lies; folders may have other times.
    bool operator==(const TreeState &other) const;
    bool operator!=(const TreeState &other) const { return !(*this == other); }

    bool exists() const { return !m_items.isEmpty(); }
    bool isFolder() const;
    bool isLink() const;
    /// The text of what is a link.
    QByteArray linkText() const;
    /// How many files, links and folders lie in the folder and below it, dot files left out.
    int shownItems() const;
    /// Whether the very thing is at \a path, which may have another content by now; or one that is
    /// the same throughout.
    bool isAt(const TreeCopy::Path &path) const;
    bool isAt(const QString &path) const
    {
        return isAt(TreeCopy::Path(QFile::encodeName(path).toStdString()));
    }

private:
    struct Item
    {
        QByteArray name; // relative, empty for the thing itself
        mode_t mode = 0;
        off_t size = 0;
        timespec modified = {};
        QByteArray linkText;

        bool operator==(const Item &other) const;
    };

    bool add(const QByteArray &path, const QByteArray &name, int level);
    void addChildren(const QByteArray &path, const QByteArray &name, int level);

    QVector<Item> m_items; // in the order of their names
    dev_t m_device = 0;
    ino_t m_inode = 0;
    bool m_isWhole = true;
};
