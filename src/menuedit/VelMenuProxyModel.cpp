// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuProxyModel.h"

#include "TreeOrder.h"
#include "VelMenuModel.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <QDateTime>
#include <QDir>
#include <QFileInfo>

#include <algorithm>

namespace {

constexpr int ManyRows = 200;

} // namespace

/// What is the same for all children of a folder.
struct VelMenuProxyModel::Folder
{
    QString path;
    bool isInMenu; ///< and so are all its children
    ItemOrder::Rule rule;
    std::optional<SortOrder::Index> order;
};

/// One row, by the internal id that the source model gives it for as long as it lives.
struct VelMenuProxyModel::Row
{
    Folder *folder;
    QString fileName;
    bool isInMenu;
    bool isFolder;
    std::optional<qint64> modified;
    std::optional<SortOrder::Mention> mention;
    std::optional<QString> displayName;
};

/// A row as the order of items asks about it.
class VelMenuProxyModel::Item
{
public:
    Item(const VelMenuProxyModel &proxy, Row &row, const QModelIndex &index)
        : m_proxy(proxy)
        , m_row(row)
        , m_index(index)
    {
    }

    qint64 modified() const { return m_proxy.modifiedOf(m_row, m_index); }
    bool isFolder() const { return m_row.isFolder; }
    const QString &name() const { return m_proxy.displayNameOf(m_row, m_index); }

    SortOrder::Places placesAgainst(const Item &other) const
    {
        Folder &folder = *m_row.folder;
        if (!folder.order)
            m_proxy.readOrder(folder);
        if (folder.order->isEmpty())
            return {};
        // A sort compares siblings only; for others the list of the left one's folder counts.
        return other.m_row.folder == &folder
            ? SortOrder::places(m_proxy.mentionOf(m_row), m_proxy.mentionOf(other.m_row))
            : SortOrder::places(m_proxy.mentionOf(m_row), folder.order->mention(other.m_row.fileName));
    }

private:
    const VelMenuProxyModel &m_proxy;
    Row &m_row;
    const QModelIndex &m_index;
};

VelMenuProxyModel::VelMenuProxyModel(QObject *parent)
    : QSortFilterProxyModel(parent)
{
    setDynamicSortFilter(true);
    connect(this, &QAbstractItemModel::layoutAboutToBeChanged, this, &VelMenuProxyModel::dropUnnamedRows);
}

VelMenuProxyModel::~VelMenuProxyModel() = default;

void VelMenuProxyModel::setSourceModel(QAbstractItemModel *model)
{
    if (sourceModel())
        sourceModel()->disconnect(this);
    dropAll();
    sortOrders.clear();
    m_isOrdering = false;
    m_needsFileOrder = false;
    m_files = qobject_cast<VelMenuModel *>(model);
    m_menuDirectory = m_files ? m_files->menuDirectory() : QString();
    m_root = QDir::cleanPath(m_menuDirectory);
    // Before the base class connects: its slots sort.
    if (m_files)
        watch(model);
    QSortFilterProxyModel::setSourceModel(model);
    // And behind it, to end what was begun before.
    if (m_files)
        connect(model, &QAbstractItemModel::rowsInserted, this, &VelMenuProxyModel::endManyRows);
}

void VelMenuProxyModel::watch(QAbstractItemModel *model)
{
    connect(model, &QAbstractItemModel::dataChanged, this, &VelMenuProxyModel::dropRows);
    connect(model, &QAbstractItemModel::rowsAboutToBeInserted, this, &VelMenuProxyModel::beginManyRows);
    connect(model, &QAbstractItemModel::rowsInserted, m_files, &VelMenuModel::holdRows);
    connect(model, &QAbstractItemModel::rowsAboutToBeRemoved, this, &VelMenuProxyModel::dropFolders);
    connect(model, &QAbstractItemModel::rowsRemoved, this, &VelMenuProxyModel::dropAll);
    connect(model, &QAbstractItemModel::modelAboutToBeReset, this, &VelMenuProxyModel::dropAll);
    connect(model, &QAbstractItemModel::modelReset, this, &VelMenuProxyModel::dropAll);
    connect(model, &QObject::destroyed, this, [this] {
        dropAll();
        m_files = nullptr;
    });
    connect(m_files, &QFileSystemModel::fileRenamed, this, &VelMenuProxyModel::dropAll);
}

void VelMenuProxyModel::invalidateSortOrder(const QString &folderPath)
{
    invalidateSortOrders({folderPath});
}

void VelMenuProxyModel::invalidateSortOrders(const QSet<QString> &folderPaths)
{
    for (const QString &path : folderPaths)
        sortOrders.remove(path);
    dropAll();
    invalidate();
}

void VelMenuProxyModel::setFilter(const std::optional<FilteredRows> &rows)
{
    if (m_filter == rows)
        return;
    m_filter = rows;
    invalidate();
}

void VelMenuProxyModel::setHiddenShown(bool isShown)
{
    if (m_isHiddenShown == isShown)
        return;
    m_isHiddenShown = isShown;
    invalidate();
}

void VelMenuProxyModel::forgetNames()
{
    dropAll();
    invalidate();
}

bool VelMenuProxyModel::isLeftOut(const QModelIndex &index) const
{
    if (m_files && m_files->isGone(index))
        return true;
    return !m_isHiddenShown && index.data(VelMenuModel::HiddenRole).toBool();
}

void VelMenuProxyModel::letThrough(const QStringList &paths)
{
    bool isMore = false;
    for (const QString &path : paths) {
        if (!m_filter || !m_files || m_filter->contains(path))
            continue;
        m_filter->add(m_root, path, QFileInfo(path).isDir());
        isMore = true;
    }
    if (isMore)
        invalidate();
}

// In the way in which the base class sorts.
QVector<QModelIndex> VelMenuProxyModel::allInOrder(const QModelIndex &folder) const
{
    QVector<QModelIndex> children;
    const int count = sourceModel()->rowCount(folder);
    for (int row = 0; row < count; ++row) {
        const QModelIndex child = sourceModel()->index(row, 0, folder);
        if (!isLeftOut(child))
            children.append(child);
    }
    std::stable_sort(
        children.begin(), children.end(),
        [this](const QModelIndex &left, const QModelIndex &right) { return lessThan(right, left); });
    return children;
}

QMimeData *VelMenuProxyModel::mimeData(const QModelIndexList &indexes) const
{
    return QSortFilterProxyModel::mimeData(TreeOrder::outermost(indexes));
}

// The menu directory itself and what lies around it always are.
bool VelMenuProxyModel::isLetThrough(const QModelIndex &index) const
{
    if (!m_filter || !m_files)
        return true;
    const QString path = m_files->filePath(index);
    const bool isBelowRoot =
        path.size() > m_root.size() && path.startsWith(m_root) && path.at(m_root.size()) == QLatin1Char('/');
    return !isBelowRoot || m_filter->contains(path);
}

bool VelMenuProxyModel::filterAcceptsRow(int sourceRow, const QModelIndex &sourceParent) const
{
    const QModelIndex index = sourceModel()->index(sourceRow, 0, sourceParent);
    if (isLeftOut(index) || !isLetThrough(index))
        return false;
    return QSortFilterProxyModel::filterAcceptsRow(sourceRow, sourceParent);
}

bool VelMenuProxyModel::lessThan(const QModelIndex &left, const QModelIndex &right) const
{
    if (!m_files)
        return QSortFilterProxyModel::lessThan(left, right);
    if (!m_isOrdering)
        beginOrdering();
    Row &leftRow = rowOf(left);
    Row &rightRow = rowOf(right);
    if (!leftRow.isInMenu)
        return false;
    const ItemOrder::Rule rule = leftRow.folder->rule;
    const int comparison = ItemOrder::compare(rule, Item(*this, leftRow, left), Item(*this, rightRow, right));
    if (comparison == 0)
        needFileOrder();
    return ItemOrder::isBelow(rule, comparison);
}

// As long as no two rows of a folder are equal, it does not matter in which order they come.
void VelMenuProxyModel::beginOrdering() const
{
    m_isOrdering = true;
    m_files->setKeepsOrder(m_needsFileOrder);
}

// The order of equal rows begins with that of the files.
void VelMenuProxyModel::needFileOrder() const
{
    if (m_needsFileOrder)
        return;
    m_needsFileOrder = true;
    m_files->setKeepsOrder(true);
}

void VelMenuProxyModel::readOrder(Folder &folder) const
{
    folder.order.emplace(sortOrderOf(folder.path));
    if (!folder.order->isPlain())
        needFileOrder();
}

bool VelMenuProxyModel::isInMenu(const QString &path) const
{
    return path.startsWith(m_menuDirectory) || path.endsWith(QLatin1String("/autostart"));
}

// A sort asks for each row very often. That of another folder may have the place of its number.
VelMenuProxyModel::Row &VelMenuProxyModel::rowOf(const QModelIndex &index) const
{
    if (!index.isValid())
        return findRow(index);
    const auto place = std::size_t(index.row());
    if (place < m_rowsByNumber.size() && m_rowsByNumber[place].first == index.internalId())
        return *m_rowsByNumber[place].second;
    Row &row = findRow(index);
    if (place >= m_rowsByNumber.size())
        m_rowsByNumber.resize(place + place / 2 + 1);
    m_rowsByNumber[place] = {index.internalId(), &row};
    return row;
}

VelMenuProxyModel::Row &VelMenuProxyModel::findRow(const QModelIndex &index) const
{
    const auto known = m_rows.find(index.internalId());
    if (known != m_rows.end())
        return known->second;

    Row row{};
    row.folder = &folderOf(index);
    row.fileName = index.data(QFileSystemModel::FileNameRole).toString();
    row.isInMenu = row.folder->isInMenu || isInMenu(m_files->filePath(index));
    row.isFolder = m_files->isDir(index);
    return m_rows.emplace(index.internalId(), std::move(row)).first->second;
}

VelMenuProxyModel::Folder &VelMenuProxyModel::folderOf(const QModelIndex &index) const
{
    const QModelIndex parent = index.parent();
    const auto known = m_folders.find(parent.internalId());
    if (known != m_folders.end())
        return known->second;
    const QString path = m_files->filePath(parent);
    Folder folder{path, path.startsWith(m_menuDirectory),
                  ItemOrder::ruleOf(parent.data(QFileSystemModel::FileNameRole).toString()), std::nullopt};
    return m_folders.emplace(parent.internalId(), std::move(folder)).first->second;
}

QStringList VelMenuProxyModel::sortOrderOf(const QString &folderPath) const
{
    const auto known = sortOrders.constFind(folderPath);
    if (known != sortOrders.constEnd())
        return *known;
    // Without a record file it is empty.
    const QStringList list = VelUIDesktopEntry(EntryPath::recordFileOf(folderPath)).getSortOrder();
    sortOrders.insert(folderPath, list);
    return list;
}

qint64 VelMenuProxyModel::modifiedOf(Row &row, const QModelIndex &index) const
{
    if (!row.modified)
        row.modified = m_files->lastModified(index).toMSecsSinceEpoch();
    return *row.modified;
}

const SortOrder::Mention &VelMenuProxyModel::mentionOf(Row &row) const
{
    if (!row.mention)
        row.mention = row.folder->order->mention(row.fileName);
    return *row.mention;
}

const QString &VelMenuProxyModel::displayNameOf(Row &row, const QModelIndex &index) const
{
    if (!row.displayName)
        row.displayName = index.data(Qt::DisplayRole).toString();
    return *row.displayName;
}

void VelMenuProxyModel::dropRows(const QModelIndex &topLeft, const QModelIndex &bottomRight)
{
    m_rowsByNumber.clear();
    for (int row = topLeft.row(); row <= bottomRight.row(); ++row)
        m_rows.erase(topLeft.sibling(row, 0).internalId());
}

// An empty name is read from disk whenever it is asked for; within one sort it must not change.
void VelMenuProxyModel::dropUnnamedRows()
{
    m_rowsByNumber.clear();
    for (auto it = m_rows.begin(); it != m_rows.end();)
        it = it->second.displayName && it->second.displayName->isEmpty() ? m_rows.erase(it) : std::next(it);
}

// Another folder may come to the path of one that goes, with a list of its own.
void VelMenuProxyModel::dropFolders(const QModelIndex &parent, int first, int last)
{
    for (int row = first; row <= last && !sortOrders.isEmpty(); ++row) {
        const QString path = m_files->filePath(m_files->index(row, 0, parent));
        sortOrders.remove(path);
        const QString below = path + QLatin1Char('/');
        for (auto it = sortOrders.lowerBound(below); it != sortOrders.end() && it.key().startsWith(below);)
            it = sortOrders.erase(it);
    }
    dropAll();
}

void VelMenuProxyModel::dropAll()
{
    m_rowsByNumber.clear();
    m_rows.clear();
    m_folders.clear();
}

// Sorted in one by one, many new rows among many make the base class renumber all of its
// rows again and again. They are put at the end instead and sorted at once.
void VelMenuProxyModel::beginManyRows(const QModelIndex &parent, int first, int last)
{
    if (!dynamicSortFilter() || last - first < ManyRows || sourceModel()->rowCount(parent) < ManyRows)
        return;
    m_isTakingMany = true;
    setDynamicSortFilter(false);
}

void VelMenuProxyModel::endManyRows()
{
    if (m_isTakingMany) {
        m_isTakingMany = false;
        setDynamicSortFilter(true);
    }
    m_files->releaseRows();
}
