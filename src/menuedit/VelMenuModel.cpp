// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuModel.h"

#include "DimmedIcon.h"
#include "DropContents.h"
#include "EntryDisplay.h"
#include "FolderWatch.h"
#include "MenuDrop.h"
#include "MenuIconProvider.h"
#include "ReadingAhead.h"
#include "RowLook.h"
#include "UnlistedFiles.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>
#include <frame/QtMajor.h>

#include <QCoreApplication>
#include <QDir>
#include <QFileIconProvider>
#include <QFileInfo>
#include <QTimer>

namespace {

// The filter that the base class begins with.
const QDir::Filters DefaultFilter = QDir::AllEntries | QDir::NoDotAndDotDot | QDir::AllDirs;

// The files of a drop that get their rows at once.
constexpr int MostAtOnce = 20;

// The columns that the base class uses in signals of its own, whatever columnCount() says.
constexpr int BaseColumns = 4;

RowCache::Display readDisplay(const QString &file)
{
    const VelUIDesktopEntry entry(file);
    if (EntryPath::isEntry(file))
        return RowCache::Display::of(entry);
    return {EntryDisplay::shownName(entry)};
}

} // namespace

VelMenuModel::VelMenuModel(const QString &rootDirectory, VelMenuView *view, QObject *parent)
    : QFileSystemModel(parent)
    , m_dropHost(MenuDropHost::create(view, parent))
    , rootDir(rootDirectory)
    , m_watch(new FolderWatch(this))
    , m_cache(std::make_unique<RowCache>())
    , m_icons(new MenuIconProvider(m_cache.get(), QCoreApplication::instance()))
    , m_ahead(std::make_unique<ReadingAhead>())
{
    setIconProvider(m_icons->provider());
    connect(this, &QAbstractItemModel::dataChanged, this, &VelMenuModel::completeDataChanged);
    connect(this, &QAbstractItemModel::rowsAboutToBeRemoved, this, &VelMenuModel::beginRemoval);
    connect(this, &QAbstractItemModel::rowsRemoved, this, &VelMenuModel::endRemoval);
    for (const auto change :
         {&QAbstractItemModel::rowsAboutToBeInserted, &QAbstractItemModel::rowsAboutToBeRemoved})
        connect(this, change, this, &VelMenuModel::releaseRows);
    connect(this, &QAbstractItemModel::layoutAboutToBeChanged, this, &VelMenuModel::releaseRows);
    connect(this, &QAbstractItemModel::modelAboutToBeReset, this, &VelMenuModel::releaseRows);
    connect(this, &QFileSystemModel::fileRenamed, this, [this] { m_wasRenamed = true; });
    // It comes behind the last of the rows.
    connect(this, &QFileSystemModel::directoryLoaded, this,
            [this](const QString &path) { m_ahead->end(path); });
    if (QtMajor::listingStopsAtOddNames()) {
        m_unlisted = new UnlistedFiles(this);
        m_watch->leaveAlone([this](const QString &path) { return m_unlisted->mayGoAndCome(path); });
    }
    setRootPath(rootDir);
}

VelMenuModel::~VelMenuModel()
{
    if (m_icons)
        m_icons->deleteLater();
}

// The base class announces a change up to a column that this model does not have. Without
// an index for it, nobody would hear of changed rows.
QModelIndex VelMenuModel::index(int row, int column, const QModelIndex &parent) const
{
    const int ownColumn = column > 0 && column < BaseColumns ? 0 : column;
    const bool isHeld = row >= 0 && row < m_heldRows.size() && ownColumn == 0 && parent == m_heldFolder;
    if (!isHeld)
        return QFileSystemModel::index(row, ownColumn, parent);
    QModelIndex &known = m_heldRows[row];
    if (!known.isValid())
        known = QFileSystemModel::index(row, ownColumn, parent);
    return known;
}

// The base class looks for the row of the folder among all of its siblings, by its name.
QModelIndex VelMenuModel::parent(const QModelIndex &index) const
{
    const bool isHeld =
        index.isValid() && index.row() < m_heldRows.size() && m_heldRows[index.row()] == index;
    return isHeld ? m_heldFolder : QFileSystemModel::parent(index);
}

// The base class finds the row of a number by its name; a sort asks for each row very often.
void VelMenuModel::holdRows(const QModelIndex &folder)
{
    m_heldFolder = folder;
    m_heldRows = QVector<QModelIndex>(rowCount(folder));
}

void VelMenuModel::releaseRows()
{
    m_heldFolder = QModelIndex();
    m_heldRows.clear();
}

int VelMenuModel::columnCount(const QModelIndex &parent) const
{
    Q_UNUSED(parent)
    return 1;
}

QVariant VelMenuModel::data(const QModelIndex &index, int role) const
{
    if (index.isValid() && index.model() == this) {
        if (role == Qt::DisplayRole)
            return displayName(index);
        if (role == HiddenRole)
            return isHidden(index);
        if (m_isAssisted && RowLook::isOf(role))
            return lookOf(index, role);
        if (role == Qt::DecorationRole)
            return iconOf(index);
    }
    return QFileSystemModel::data(index, role);
}

Qt::ItemFlags VelMenuModel::flags(const QModelIndex &index) const
{
    return QFileSystemModel::flags(index) & ~Qt::ItemIsEditable;
}

// A folder that has rows is only watched again.
void VelMenuModel::fetchMore(const QModelIndex &parent)
{
    if (canFetchMore(parent) && rowCount(parent) == 0)
        m_ahead->begin(filePath(parent));
    QFileSystemModel::fetchMore(parent);
}

// What the base class sorts with is also what takes rows away that no longer pass its filters.
void VelMenuModel::sort(int column, Qt::SortOrder order)
{
    const bool isOwnCall = column == 0 && order == Qt::AscendingOrder;
    m_isFiltered = m_isFiltered || filter() != DefaultFilter || !nameFilters().isEmpty();
    m_isOrderLost = isOwnCall && !m_keepsOrder && !m_isFiltered;
    if (!m_isOrderLost)
        QFileSystemModel::sort(column, order);
}

bool VelMenuModel::dropMimeData(const QMimeData *data, Qt::DropAction action, int row, int column,
                                const QModelIndex &parent)
{
    Q_UNUSED(column)
    if (parent.row() < 0 || parent.column() < 0 || !parent.model() || action == Qt::IgnoreAction)
        return false;
    const DropContents contents = DropContents::of(data, m_isAssisted);
    if (contents.sources.isEmpty())
        return false;
    if (!contents.refusal.isEmpty()) {
        DropResult refusal;
        refusal.complaint = contents.refusal;
        m_dropHost->finished(refusal);
        return false;
    }
    const QPointer<VelMenuModel> self(this);
    const DropResult result =
        MenuDrop(*this, *m_watch, *m_dropHost,
                 {contents.sources, action, row, parent, m_isAssisted, contents.addresses})
            .carryOut();
    if (!self)
        return false;
    if (result.isDone)
        takeIn(result);
    m_dropHost->finished(result);
    if (result.isDone)
        Q_EMIT changed();
    return result.isDone;
}

void VelMenuModel::takeIn(const DropResult &result)
{
    if (result.sortAnew)
        noteRecordFile(filePath(result.folder));
    for (const QString &source : result.moved)
        forgetItemInfo(source);
    // None shows what was there before, whether or not that was seen to go.
    for (const QString &target : result.targets)
        m_cache->forgetTree(target);
    // A few have their rows at once, whether or not their folder is being watched already. Thousands
    // would stop the window for as long as each row takes; they come with the folder.
    for (const QString &target : result.targets.mid(0, MostAtOnce)) {
        if (QFileInfo::exists(target)) {
            index(target);
            refreshRow(target);
        }
    }
}

void VelMenuModel::setKeepsOrder(bool keeps)
{
    m_keepsOrder = keeps;
    if (keeps && m_isOrderLost)
        QTimer::singleShot(0, this, [this] { sort(0, Qt::AscendingOrder); });
}

QString VelMenuModel::menuDirectory() const
{
    if (rootDir.isEmpty())
        return QString();
    const QString path = QDir::cleanPath(QFileInfo(rootDir).absoluteFilePath());
    return rootDir.endsWith(QLatin1Char('/')) && path != QLatin1String("/") ? path + QLatin1Char('/') : path;
}

void VelMenuModel::forgetItemInfo(const QString &path)
{
    m_cache->forget(path);
    // Of a folder that went, nothing may be remembered when others come to stand in its place.
    if (!QFileInfo::exists(path))
        m_cache->forgetTree(path);
    refreshRow(path);
}

// Of many, those rows are shown anew that there are: each that is made by its path takes its time.
void VelMenuModel::forgetItems(const QStringList &paths)
{
    if (paths.size() <= MostAtOnce) {
        for (const QString &path : paths) {
            forgetItemInfo(path);
            const QString item = EntryPath::describedBy(path);
            if (QFileInfo::exists(item))
                index(item);
        }
        return;
    }
    QSet<QString> items;
    QSet<QString> folders;
    for (const QString &path : paths) {
        const QString item = EntryPath::describedBy(path);
        m_cache->forgetTree(path);
        items.insert(item);
        folders.insert(item.left(item.lastIndexOf(QLatin1Char('/'))));
    }
    for (const QString &folder : qAsConst(folders))
        refreshRows(index(folder), items);
}

void VelMenuModel::refreshRows(const QModelIndex &folder, const QSet<QString> &paths)
{
    int first = -1;
    int last = -1;
    const int count = folder.isValid() ? rowCount(folder) : 0;
    for (int row = 0; row < count; ++row) {
        const QString path = pathOf(index(row, 0, folder));
        const QFileInfo info(path);
        if (!paths.contains(path) || !info.exists())
            continue;
        m_cache->setEditedIcon(path, iconProvider()->icon(info));
        first = first < 0 ? row : first;
        last = row;
    }
    if (first >= 0)
        Q_EMIT dataChanged(index(first, 0, folder), index(last, 0, folder));
}

void VelMenuModel::noteRecordFile(const QString &path)
{
    m_cache->forgetPlain(path);
}

QStringList VelMenuModel::release(const QStringList &paths)
{
    return m_watch->release(paths);
}

void VelMenuModel::watchAgain(const QStringList &folders)
{
    m_watch->watchAgain(folders);
}

void VelMenuModel::setWatching(bool on)
{
    m_watch->setOn(on);
}

void VelMenuModel::setItemName(const QString &path, const QString &name)
{
    m_cache->setDisplay(path, {name, false});
    refreshRow(path);
}

// Whether the row has a record to be shown by.
bool VelMenuModel::loadItemInfo(const QString &path, bool isFolder) const
{
    if (isFolder && m_cache->isPlain(path))
        return false;
    // Where the record file of a folder gives a name, nobody need ask whether there is one.
    const QString recordFile = isFolder ? EntryPath::recordFileOf(path) : QString();
    RowCache::Display display = isFolder ? readDisplay(recordFile) : RowCache::Display();
    const QString file = display.name.isEmpty() ? EntryDisplay::describingFile(path, isFolder) : recordFile;
    if (file.isEmpty()) {
        if (isFolder)
            m_cache->setPlain(path);
        return false;
    }

    if (file != recordFile) {
        const std::optional<RowCache::Display> prefetched = m_cache->takePrefetched(file);
        display = prefetched ? *prefetched : readDisplay(file);
    }
    // The row of a file that is gone stands until the base class sees it. What is asked for then
    // must not be remembered of the next file that comes to this path.
    if (!display.name.isEmpty() || QFileInfo::exists(file))
        m_cache->setDisplay(path, display);
    return true;
}

RowCache::Display VelMenuModel::displayOf(const QString &path, bool isFolder) const
{
    const std::optional<RowCache::Display> known = m_cache->display(path);
    if (known && !known->name.isEmpty())
        return *known;
    const QString file = EntryDisplay::describingFile(path, isFolder);
    return file.isEmpty() ? RowCache::Display{QFileInfo(path).fileName(), false} : readDisplay(file);
}

// The same as filePath(), which puts the path together anew from its elements. The node of
// a link, and one that was made from a path, may remember another spelling.
QString VelMenuModel::pathOf(const QModelIndex &index) const
{
    if (m_wasRenamed)
        return filePath(index);
    const QFileInfo info = fileInfo(index);
    QString path = info.filePath();
    if (path.isEmpty() || path.startsWith(QLatin1String("//")) || info.isSymLink())
        return filePath(index);
    Q_ASSERT(path == filePath(index));
    return path;
}

QVariant VelMenuModel::displayName(const QModelIndex &index) const
{
    const QString path = pathOf(index);
    const std::optional<RowCache::Display> known = m_cache->display(path);
    if (known && !known->name.isEmpty())
        return known->name;
    if (!loadItemInfo(path, isDir(index)))
        return QFileSystemModel::data(index, Qt::DisplayRole);
    const QString name = m_cache->display(path).value_or(RowCache::Display()).name;
    return name.isEmpty() && m_isAssisted ? QFileSystemModel::data(index, Qt::DisplayRole) : name;
}

QVariant VelMenuModel::iconOf(const QModelIndex &index) const
{
    QVariant icon;
    if (m_cache->hasEditedIcons()) {
        if (const std::optional<QIcon> edited = m_cache->editedIcon(pathOf(index)))
            icon = *edited;
    }
    if (icon.isNull())
        icon = QFileSystemModel::data(index, Qt::DecorationRole);
    return m_cut.isEmpty() || !m_cut.contains(pathOf(index)) ? icon : DimmedIcon::of(icon.value<QIcon>());
}

QVariant VelMenuModel::lookOf(const QModelIndex &index, int role) const
{
    const QString path = pathOf(index);
    const EntryState::Kind state = m_cache->display(path).value_or(RowCache::Display()).state;
    return RowLook::data({path, state, m_cut.contains(path)}, role);
}

bool VelMenuModel::isGone(const QModelIndex &index) const
{
    return m_unlisted && m_unlisted->keepsGone() && m_unlisted->isGone(pathOf(index));
}

bool VelMenuModel::isHidden(const QModelIndex &index) const
{
    const QString path = pathOf(index);
    if (const std::optional<RowCache::Display> known = m_cache->display(path))
        return known->isHidden;
    loadItemInfo(path, isDir(index));
    return m_cache->display(path).value_or(RowCache::Display()).isHidden;
}

// Announces that the row of \a path may show something else now. What belongs to the
// ".directory" file is shown in the folder's row; a dot file has no row, and asking for its
// index would make one.
void VelMenuModel::refreshRow(const QString &path)
{
    const QString rowPath = EntryPath::describedBy(path);
    const QFileInfo info(rowPath);
    if (info.fileName().startsWith(QLatin1Char('.')) || !info.exists()) {
        m_cache->forgetEditedIcon(rowPath);
        return;
    }
    m_cache->setEditedIcon(rowPath, iconProvider()->icon(info));
    const QModelIndex row = index(rowPath);
    if (row.isValid())
        Q_EMIT dataChanged(row, row);
}

// For several rows the base class announces from the first to the last name by code points,
// which are not the first and the last row of its own order.
void VelMenuModel::completeDataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight,
                                       const QVector<int> &roles)
{
    if (m_isCompleting || topLeft == bottomRight || !topLeft.isValid())
        return;
    const QModelIndex parent = topLeft.parent();
    const int last = rowCount(parent) - 1;
    if (topLeft.row() == 0 && bottomRight.row() == last)
        return;
    m_isCompleting = true;
    Q_EMIT dataChanged(index(0, 0, parent), index(last, 0, parent), roles);
    m_isCompleting = false;
}

// Until its row has gone, what is forgotten of it might be asked for once more.
void VelMenuModel::beginRemoval(const QModelIndex &parent, int first, int last)
{
    for (int row = first; row <= last; ++row)
        m_going.append(pathOf(index(row, 0, parent)));
}

void VelMenuModel::endRemoval()
{
    for (const QString &path : qAsConst(m_going))
        m_cache->forgetTree(path);
    m_going.clear();
}
