// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FilteredRows.h"
#include "ItemOrder.h"
#include "SortOrder.h"

#include <QHash>
#include <QMap>
#include <QSet>
#include <QSortFilterProxyModel>
#include <QString>
#include <QStringList>
#include <QVector>

#include <memory>
#include <optional>
#include <unordered_map>
#include <utility>
#include <vector>

class VelMenuModel;

/**
 * Leaves out the entries that a VelMenuModel marks as hidden and puts the children of each
 * folder into the order of the menu: by the folder's `SortOrder`, folders before files, by
 * name; the folder "recents" by time. Made for a descending sort of column 0.
 *
 * Comparing is the work of a sort, so everything it asks for is kept by folder and by row and
 * dropped when the source model tells that it changed.
 */
class VelMenuProxyModel : public QSortFilterProxyModel
{
    Q_OBJECT

public:
    explicit VelMenuProxyModel(QObject *parent);
    ~VelMenuProxyModel() override;

    void setSourceModel(QAbstractItemModel *model) override;

    /// Forgets the list that was read for the folder of that path, as VelMenuModel::filePath()
    /// gives it, and filters and sorts anew.
    void invalidateSortOrder(const QString &folderPath);
    /// The same for the folders of all those paths at once.
    void invalidateSortOrders(const QSet<QString> &folderPaths);

    /// Shows only what the \a rows let through; everything for none.
    void setFilter(const std::optional<FilteredRows> &rows);
    /// To be told that rows may have other names now; sorts anew.
    void forgetNames();

    /// Whether entries are shown that the source model marks as hidden.
    void setHiddenShown(bool isShown);
    bool isHiddenShown() const { return m_isHiddenShown; }

    bool isFiltered() const { return m_filter.has_value(); }
    /// What a filter lets through; to be asked while there is one.
    const FilteredRows &filteredRows() const { return *m_filter; }
    /// Shows the files at the \a paths, too, where a filter leaves them out.
    void letThrough(const QStringList &paths);
    /// All children of a \a folder of the source model in the order of the menu, as they were shown
    /// if there were no filter.
    QVector<QModelIndex> allInOrder(const QModelIndex &folder) const;

    /// The files of \a indexes from the top to the bottom; what lies in a folder among them goes along with
    /// it.
    QMimeData *mimeData(const QModelIndexList &indexes) const override;

    bool filterAcceptsRow(int sourceRow, const QModelIndex &sourceParent) const override;
    /// Whether \a left is shown below \a right.
    bool lessThan(const QModelIndex &left, const QModelIndex &right) const override;

private:
    struct Folder;
    struct Row;
    class Item;

    bool isLeftOut(const QModelIndex &index) const;
    bool isLetThrough(const QModelIndex &index) const;
    void watch(QAbstractItemModel *model);
    void dropRows(const QModelIndex &topLeft, const QModelIndex &bottomRight);
    void dropUnnamedRows();
    void dropFolders(const QModelIndex &parent, int first, int last);
    void dropAll();
    void beginManyRows(const QModelIndex &parent, int first, int last);
    void endManyRows();

    void beginOrdering() const;
    void needFileOrder() const;
    void readOrder(Folder &folder) const;
    bool isInMenu(const QString &path) const;
    Row &rowOf(const QModelIndex &index) const;
    Row &findRow(const QModelIndex &index) const;
    Folder &folderOf(const QModelIndex &index) const;
    QStringList sortOrderOf(const QString &folderPath) const;
    qint64 modifiedOf(Row &row, const QModelIndex &index) const;
    const SortOrder::Mention &mentionOf(Row &row) const;
    const QString &displayNameOf(Row &row, const QModelIndex &index) const;

    mutable QMap<QString, QStringList> sortOrders;

    VelMenuModel *m_files = nullptr;
    QString m_menuDirectory;
    QString m_root; // the same, without a "/" at the end
    std::optional<FilteredRows> m_filter;
    bool m_isHiddenShown = false;
    bool m_isTakingMany = false;
    mutable bool m_isOrdering = false;
    mutable bool m_needsFileOrder = false;
    mutable std::unordered_map<quintptr, Folder> m_folders;
    mutable std::unordered_map<quintptr, Row> m_rows;
    mutable std::vector<std::pair<quintptr, Row *>> m_rowsByNumber; // some of them, with their ids
};
