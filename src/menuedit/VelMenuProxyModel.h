// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ItemOrder.h"
#include "SortOrder.h"

#include <QHash>
#include <QMap>
#include <QSortFilterProxyModel>
#include <QString>
#include <QStringList>

#include <memory>
#include <unordered_map>

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

    bool filterAcceptsRow(int sourceRow, const QModelIndex &sourceParent) const override;
    /// Whether \a left is shown below \a right.
    bool lessThan(const QModelIndex &left, const QModelIndex &right) const override;

private:
    struct Folder;
    struct Row;
    class Item;

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
    Folder &folderOf(const QModelIndex &index) const;
    QStringList sortOrderOf(const QString &folderPath) const;
    qint64 modifiedOf(Row &row, const QModelIndex &index) const;
    const SortOrder::Mention &mentionOf(Row &row) const;
    const QString &displayNameOf(Row &row, const QModelIndex &index) const;

    mutable QMap<QString, QStringList> sortOrders;

    VelMenuModel *m_files = nullptr;
    QString m_menuDirectory;
    bool m_isTakingMany = false;
    mutable bool m_isOrdering = false;
    mutable bool m_needsFileOrder = false;
    mutable std::unordered_map<quintptr, Folder> m_folders;
    mutable std::unordered_map<quintptr, Row> m_rows;
};
