// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileIdentity.h"

#include <QMap>
#include <QObject>
#include <QString>
#include <QTimer>
#include <QVector>

class QIcon;
class RowCache;

/**
 * Finds out of which files the icons of rows were made, for a RowCache.
 *
 * That is needed when a folder is listed again and not before, so thousands of rows need not wait for
 * it: the files are asked when the rows stand, bit by bit. An icon is not kept when its file has changed
 * since it was made, or came to its path, or when its folder is another one.
 */
class NewIcons : public QObject
{
    Q_OBJECT

public:
    /// Belongs to \a cache.
    explicit NewIcons(RowCache *cache);
    ~NewIcons() override;

    /// The entry at \a path is about to be read for its icon.
    void begin(const QString &path);
    /// The \a icon was made of the entry that was begun with.
    void end(const QIcon &icon);
    /// Asks at once for what is still to be asked in the folder of \a path.
    void finish(const QString &path);

private:
    /// What is to be asked in a folder.
    struct Folder
    {
        FileIdentity identity; // when none of the entries was read
        qint64 time = 0; // before that
        QVector<QString> paths;
    };
    using Folders = QMap<QString, Folder>;

    void look(const QString &path);
    void askSome();
    void ask(Folders::iterator folder, int most);

    RowCache &m_cache;
    Folders m_folders; // by their paths with the "/"
    QString m_begun;
    Folder *m_folder = nullptr; // of what was begun
    bool m_isGrowing = false;
    QTimer m_turn;
};
