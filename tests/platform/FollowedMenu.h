// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QMap>
#include <QSet>
#include <QString>
#include <QStringList>

/**
 * A plain model of a start menu that follows the applications: what the rules say has to be in it.
 * All of it stands in maps; it knows no file.
 */
class FollowedMenu
{
public:
    using Files = QMap<QString, QByteArray>; ///< entries by their paths in the menu

    struct Application
    {
        QString category;
        QByteArray bytes;
    };

    /// What is installed, by the names of the files, which are the ids too.
    QMap<QString, Application> installed;
    /// What the user sees.
    Files files;
    /// The folders of categories.
    QSet<QString> folders;
    /// Those of them whose records the user edited.
    QSet<QString> editedFolders;

    /// What an update has to do.
    void update();
    /// The user deletes a folder with all in it.
    void removeFolder(const QString &folder);

    /// The names of the entries in a folder that an update made and nobody touched.
    QStringList untouchedIn(const QString &folder) const;

    static QString folderOf(const QString &path) { return path.section(QLatin1Char('/'), 0, 0); }

private:
    struct Made
    {
        QString path;
        QByteArray bytes;
    };

    bool isUntouched(const Made &made) const;
    QString freePath(const QString &name, const QString &category) const;
    void follow(const QString &name, QSet<QString> *emptied);
    void add(const QString &name);

    QMap<QString, Made> m_made;
};
