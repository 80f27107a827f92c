// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "RowCache.h"

#include <QFileSystemModel>
#include <QPointer>
#include <QSet>
#include <QString>
#include <QStringList>
#include <QVector>

#include <memory>

class FolderWatch;
class MenuDropHost;
class MenuIconProvider;
class ReadingAhead;
class UnlistedFiles;
class VelMenuView;
struct DropResult;

/**
 * The files and folders of a menu directory, under the names that the menu shows.
 *
 * Tells which entries are to be hidden and carries out drops. A name is read from disk once and
 * kept until forgetItemInfo() is called for it, or its row goes. A row that was shown once is
 * shown again without a look at the disk.
 */
class VelMenuModel : public QFileSystemModel
{
    Q_OBJECT

public:
    /// Whether an entry is to be hidden.
    static constexpr int HiddenRole = Qt::UserRole;

    /// \a view answers for drops, see MenuDropHost; null is allowed. It is not owned.
    VelMenuModel(const QString &rootDir, VelMenuView *view, QObject *parent);
    ~VelMenuModel() override;

    using QFileSystemModel::index;
    QModelIndex index(int row, int column, const QModelIndex &parent = QModelIndex()) const override;
    using QFileSystemModel::parent;
    QModelIndex parent(const QModelIndex &index) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    bool dropMimeData(const QMimeData *data, Qt::DropAction action, int row, int column,
                      const QModelIndex &parent) override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    void fetchMore(const QModelIndex &parent) override;
    void sort(int column, Qt::SortOrder order = Qt::AscendingOrder) override;

    /// No row of \a folder comes, goes or moves until releaseRows(): each is looked up once then, and
    /// the folder not at all.
    void holdRows(const QModelIndex &folder);
    void releaseRows();

    /// The menu directory, clean and absolute, with a "/" at the end if it was given with one;
    /// empty if none was given.
    QString menuDirectory() const;

    /// How the row of \a path is shown, or would be; looks at the file if that was never asked for.
    /// Makes no row, and remembers nothing.
    RowCache::Display displayOf(const QString &path, bool isFolder) const;

    /// Whether rows tell more than their names: what the menu does not show is gray and says why,
    /// and what has no name shows that of its file. Who switches it has the rows painted anew.
    void setAssisted(bool isAssisted) { m_isAssisted = isAssisted; }

    /// The items at \a paths are to be dimmed, and no others. Who says so has the rows painted anew.
    void setCut(const QStringList &paths) { m_cut = QSet<QString>(paths.begin(), paths.end()); }

    /// Whether the row stands for a file that is gone, which no menu may show.
    bool isGone(const QModelIndex &index) const;

    /// Forgets the name of \a path and whether it is hidden: both are read again when asked for.
    void forgetItemInfo(const QString &path);
    /// The same for the \a paths. A few that have come to be have their rows at once.
    void forgetItems(const QStringList &paths);
    /// To be told that the folder at \a path has a record file now, if it had none.
    void noteRecordFile(const QString &path);
    /// Stops watching the folders among the \a paths, which are about to move, and those below
    /// them; returns what is to be watched again where it is still there.
    QStringList release(const QStringList &paths);
    void watchAgain(const QStringList &folders);
    /// Off, nothing is noticed of what comes and goes, until all that was read is read anew.
    void setWatching(bool on);
    /// Shows \a path as \a name, without reading the file.
    void setItemName(const QString &path, const QString &name);

    /**
     * Whether the rows have to be in the order of their file names. They are from the outset;
     * who puts all of them into an order of their own can do without: whenever files come, the
     * base class sorts the whole tree anew.
     */
    void setKeepsOrder(bool keeps);

Q_SIGNALS:
    /// Files were dropped and are there.
    void changed();

private:
    QVariant iconOf(const QModelIndex &index) const;
    QVariant lookOf(const QModelIndex &index, int role) const;
    bool loadItemInfo(const QString &path, bool isFolder) const;
    QString pathOf(const QModelIndex &index) const;
    QVariant displayName(const QModelIndex &index) const;
    bool isHidden(const QModelIndex &index) const;

    void refreshRow(const QString &path);
    void refreshRows(const QModelIndex &folder, const QSet<QString> &paths);
    void beginRemoval(const QModelIndex &parent, int first, int last);
    void endRemoval();
    void completeDataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight,
                             const QVector<int> &roles);
    void takeIn(const DropResult &result);

    std::unique_ptr<MenuDropHost> m_dropHost;
    QString rootDir;
    FolderWatch *m_watch;
    UnlistedFiles *m_unlisted = nullptr; // there where a listing may end too early
    std::unique_ptr<RowCache> m_cache;
    // The base class uses the provider to its own end, which is behind that of this class.
    QPointer<MenuIconProvider> m_icons;
    // The paths of the rows that are about to go.
    QStringList m_going;
    QSet<QString> m_cut;
    bool m_isAssisted = false;
    bool m_isCompleting = false;
    bool m_keepsOrder = true;
    bool m_isFiltered = false;
    bool m_isOrderLost = false;
    // The base class forgets to tell the files in a renamed folder where they are now.
    bool m_wasRenamed = false;
    std::unique_ptr<ReadingAhead> m_ahead;
    QModelIndex m_heldFolder;
    mutable QVector<QModelIndex> m_heldRows; // those that were looked up
};
