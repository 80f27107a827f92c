// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryState.h"
#include "FileIdentity.h"

#include <QHash>
#include <QIcon>
#include <QMap>
#include <QObject>
#include <QSet>
#include <QString>
#include <QTimer>

#include <optional>

class VelUIDesktopEntry;

/**
 * What a menu model remembers of its rows, by their paths; looks at no file.
 *
 * It is there so that a row that was read once is shown without a look at the disk, and it holds
 * nothing of a row that went: that is forgotten with forgetTree(). An object, so that the icon
 * provider notices when it is gone.
 */
class RowCache : public QObject
{
    Q_OBJECT

public:
    /// How a row is shown.
    struct Display
    {
        QString name;
        bool isHidden = false;
        EntryState::Kind state = EntryState::Kind::Shown;

        /// How \a entry is shown.
        static Display of(const VelUIDesktopEntry &entry);
    };

    RowCache();
    ~RowCache() override;

    /// How \a path is shown, if that is known; the name may be empty.
    std::optional<Display> display(const QString &path) const;
    /// Remembers how \a path is shown. What is hidden stays so until it is forgotten.
    void setDisplay(const QString &path, const Display &display);

    /// Keeps what was read of the entry at \a path beside its icon, for the one who asks for the
    /// name at once; no longer than until the event loop turns.
    void prefetch(const QString &path, const Display &display);
    std::optional<Display> takePrefetched(const QString &path);

    /// The icon that was made of the entry at \a path when it had that \a identity.
    std::optional<QIcon> icon(const QString &path, const FileIdentity &identity) const;
    void setIcon(const QString &path, const FileIdentity &identity, const QIcon &icon);
    /// Remembers the \a icon of a row that is new: of which file it was made is still to be asked. Until
    /// then icon() does not give it.
    void setNewIcon(const QString &path, const QIcon &icon);
    bool hasNewIcon(const QString &path) const;
    /// The new icon of \a path was made of the file with that \a identity.
    void keepNewIcon(const QString &path, const FileIdentity &identity);
    /// Or nobody knows of which.
    void dropNewIcon(const QString &path);
    /// Whether an icon of \a path is remembered, be it new or not.
    bool hasIcon(const QString &path) const;

    /// The icon that a row just got for the icon name \a name; rows that come together share it.
    std::optional<QIcon> sharedIcon(const QString &name) const;
    /// Keeps it no longer than until the event loop turns: it is as new as the rows are.
    void shareIcon(const QString &name, const QIcon &icon);

    /// Remembers the \a icon of a row that was edited here: the file model keeps the one it has.
    void setEditedIcon(const QString &path, const QIcon &icon);
    void forgetEditedIcon(const QString &path) { m_editedIcons.remove(path); }
    bool hasEditedIcons() const { return !m_editedIcons.isEmpty(); }
    /// The icon of the row at \a path, if it was edited.
    std::optional<QIcon> editedIcon(const QString &path) const;

    /// Remembers that the folder at \a path has no record file.
    void setPlain(const QString &path) { m_plainFolders.insert(path); }
    void forgetPlain(const QString &path) { m_plainFolders.remove(path); }
    bool isPlain(const QString &path) const { return m_plainFolders.contains(path); }

    /// To be told that the file model has just looked at \a path, whose icon is \a icon.
    void noteListed(const QString &path, const QIcon &icon);

    /// Forgets what is known of \a path; of the record file of a folder also that there was none.
    void forget(const QString &path);
    /// The same for \a path and everything below it.
    void forgetTree(const QString &path);

private:
    void forgetAtTheNextTurn();

    enum class IconOrigin : quint8 { None, New, Known };

    struct Row
    {
        QString name;
        QIcon icon;
        quint64 mark = 0; // of the entry that the icon was made of
        EntryState::Kind state = EntryState::Kind::Shown;
        bool isNamed = false;
        bool isHidden = false;
        IconOrigin origin = IconOrigin::None;
    };

    using Folder = QHash<QString, Row>; // by the paths of the rows

    Folder *folderOf(const QString &path) const;
    const Row *find(const QString &path) const;
    Row &make(const QString &path);

    // By the paths of the folders: a folder that goes takes with it what stands below.
    QMap<QString, Folder> m_folders;
    mutable QString m_lastFolder; // of the path that was asked for last, with its "/"
    mutable Folder *m_last = nullptr;
    QHash<QString, Display> m_prefetched;
    QHash<QString, QIcon> m_sharedIcons; // by the names of the icons
    QHash<QString, QIcon> m_editedIcons;
    QSet<QString> m_plainFolders;
    QTimer m_turn;
};
