// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QFileSystemModel>
#include <QHash>
#include <QMap>
#include <QPointer>
#include <QSet>
#include <QString>
#include <QStringList>

class FolderWatch;
class VelMenuView;
class VelUIDesktopEntry;

/**
 * The files and folders of a menu directory, under the names that the menu shows.
 *
 * Tells which entries are to be hidden (role Qt::UserRole) and carries out drops. A name is
 * read from disk once and kept until forgetItemInfo() is called for it.
 */
class VelMenuModel : public QFileSystemModel
{
    Q_OBJECT

public:
    /// \a view is called back after drops; null is allowed. It is not owned.
    VelMenuModel(const QString &rootDir, VelMenuView *view, QObject *parent);
    ~VelMenuModel() override;

    using QFileSystemModel::index;
    QModelIndex index(int row, int column, const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;
    bool dropMimeData(const QMimeData *data, Qt::DropAction action, int row, int column,
                      const QModelIndex &parent) override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    void sort(int column, Qt::SortOrder order = Qt::AscendingOrder) override;

    /// The menu directory, clean and absolute, with a "/" at the end if it was given with one;
    /// empty if none was given.
    QString menuDirectory() const;

    /// Forgets the name of \a path and whether it is hidden: both are read again when asked for.
    void forgetItemInfo(const QString &path);
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
    class IconProvider;
    class IconProviderKeeper;
    struct Drop;
    /// What is read of an entry.
    struct ItemInfo
    {
        QString name;
        bool isHidden;
    };

    static ItemInfo itemInfo(const VelUIDesktopEntry &entry, const QString &file);
    bool loadItemInfo(const QString &path, bool isFolder) const;
    void readAlong(const QString &path, const VelUIDesktopEntry &entry);
    QString pathOf(const QModelIndex &index) const;
    QVariant displayName(const QModelIndex &index) const;
    bool isHidden(const QModelIndex &index) const;

    void refreshRow(const QString &path);
    void completeDataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight,
                             const QVector<int> &roles);

    bool dropIntoOwnFolder(const Drop &drop);
    bool dropIntoOtherFolder(const Drop &drop);
    bool mayOverwrite(const QString &target);
    bool fixSortOrder(const Drop &drop);
    bool carryOut(const Drop &drop);
    bool transfer(const Drop &drop);
    bool link(const Drop &drop);
    void finish(const Drop &drop, bool sortAnew);
    void tellAtItem(const QString &path, const QString &text);

    VelMenuView *view;
    QString rootDir;
    FolderWatch *m_watch;
    mutable QMap<QString, QString> itemNames;
    mutable QMap<QString, bool> hiddenItems;
    // Rows that were edited here: the base class keeps the icon it has, this model asks anew.
    QSet<QString> m_editedRows;
    // What was read while the base class asked for icons, until it has told of the rows.
    mutable QHash<QString, ItemInfo> m_readAlong;
    bool m_isCompleting = false;
    bool m_keepsOrder = true;
    bool m_isFiltered = false;
    bool m_isOrderLost = false;
    // The base class forgets to tell the files in a renamed folder where they are now.
    bool m_wasRenamed = false;
    QPointer<IconProviderKeeper> m_keeper;
};
