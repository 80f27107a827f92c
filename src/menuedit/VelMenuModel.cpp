// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuModel.h"

#include "EntryDisplay.h"
#include "FolderWatch.h"
#include "VelMimeTypeIconProvider.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTimer>

#include <ctime>
#include <utility>

#include <sys/stat.h>

namespace {

// The filter that the base class begins with.
const QDir::Filters DefaultFilter = QDir::AllEntries | QDir::NoDotAndDotDot | QDir::AllDirs;

// The columns that the base class uses in signals of its own, whatever columnCount() says.
constexpr int BaseColumns = 4;

// What tells that a file is still the same.
class FileStamp
{
public:
    explicit FileStamp(const QString &path)
    {
        if (::stat(QFile::encodeName(path).constData(), &m_status) != 0)
            m_status = {};
    }

    bool operator==(const FileStamp &other) const
    {
        return m_status.st_dev == other.m_status.st_dev && m_status.st_ino == other.m_status.st_ino
            && m_status.st_size == other.m_status.st_size && isEqual(m_status.st_mtim, other.m_status.st_mtim)
            && isEqual(m_status.st_ctim, other.m_status.st_ctim);
    }

    bool isRegular() const { return S_ISREG(m_status.st_mode); }

    // Whether the last change is long enough ago that another would have another time.
    bool isSettled() const
    {
        timespec now = {};
        clock_gettime(CLOCK_REALTIME, &now);
        constexpr qint64 Enough = 50000000;
        return nanoseconds(m_status.st_mtim) + Enough < nanoseconds(now)
            && nanoseconds(m_status.st_ctim) + Enough < nanoseconds(now);
    }

private:
    static qint64 nanoseconds(const timespec &time)
    {
        return qint64(time.tv_sec) * 1000000000 + qint64(time.tv_nsec);
    }
    static bool isEqual(const timespec &a, const timespec &b) { return nanoseconds(a) == nanoseconds(b); }

    struct stat m_status = {};
};

template <typename Value>
void forgetBelow(QMap<QString, Value> &known, const QString &folder)
{
    const QString first = folder + QLatin1Char('/');
    for (auto it = known.lowerBound(first); it != known.end() && it.key().startsWith(first);)
        it = known.erase(it);
}

} // namespace

/// Gives the icons of the menu, and lets the model read the rest of an entry with it: the base
/// class asks for the icons of a whole folder before anyone asks for the first name.
class VelMenuModel::IconProvider : public VelMimeTypeIconProvider
{
public:
    explicit IconProvider(VelMenuModel *model)
        : m_model(model)
    {
    }

    using VelMimeTypeIconProvider::icon;
    QIcon icon(const QFileInfo &info) const override
    {
        if (!m_model || !EntryPath::isEntry(info.fileName()) || info.isSymLink() || !info.isFile())
            return VelMimeTypeIconProvider::icon(info);
        const QString path = info.filePath();
        const FileStamp stamp(path);
        m_regularFile = stamp.isRegular() ? path : QString();
        const auto known = m_icons.constFind(path);
        if (known != m_icons.constEnd() && known->stamp == stamp)
            return known->icon;
        const VelUIDesktopEntry entry(path);
        m_model->readAlong(path, entry);
        QIcon icon = desktopEntryIcon(entry, {});
        if (stamp.isSettled())
            m_icons.insert(path, {stamp, icon});
        else
            m_icons.remove(path);
        return icon;
    }

    // The base class asks for the icon and at once for the type.
    QString type(const QFileInfo &info) const override
    {
        const QString regularFile = std::exchange(m_regularFile, QString());
        return !regularFile.isEmpty() && regularFile == info.filePath() ? regularFileType(info)
                                                                        : VelMimeTypeIconProvider::type(info);
    }

private:
    struct Known
    {
        FileStamp stamp;
        QIcon icon;
    };

    QPointer<VelMenuModel> m_model;
    // After any change in a folder the base class asks for all its icons again.
    mutable QHash<QString, Known> m_icons;
    mutable QString m_regularFile;
};

/// Keeps the icon provider, which the model uses but never deletes.
class VelMenuModel::IconProviderKeeper : public QObject
{
public:
    IconProviderKeeper(VelMenuModel *model, QObject *parent)
        : QObject(parent)
        , m_provider(model)
    {
    }

    IconProvider *provider() { return &m_provider; }

private:
    IconProvider m_provider;
};

VelMenuModel::VelMenuModel(const QString &rootDirectory, VelMenuView *menuView, QObject *parent)
    : QFileSystemModel(parent)
    , view(menuView)
    , rootDir(rootDirectory)
    , m_watch(new FolderWatch(this))
    , m_keeper(new IconProviderKeeper(this, QCoreApplication::instance()))
{
    setIconProvider(m_keeper->provider());
    connect(this, &QAbstractItemModel::dataChanged, this, &VelMenuModel::completeDataChanged);
    connect(this, &QFileSystemModel::fileRenamed, this, [this] { m_wasRenamed = true; });
    setRootPath(rootDir);
}

// The base class uses the provider to its own end.
VelMenuModel::~VelMenuModel()
{
    if (m_keeper)
        m_keeper->deleteLater();
}

// The base class announces a change up to a column that this model does not have. Without
// an index for it, nobody would hear of changed rows.
QModelIndex VelMenuModel::index(int row, int column, const QModelIndex &parent) const
{
    return QFileSystemModel::index(row, column > 0 && column < BaseColumns ? 0 : column, parent);
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
        if (role == Qt::UserRole)
            return isHidden(index);
        if (role == Qt::DecorationRole && !m_editedRows.isEmpty() && m_editedRows.contains(pathOf(index)))
            return iconProvider()->icon(QFileInfo(filePath(index)));
    }
    return QFileSystemModel::data(index, role);
}

bool VelMenuModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    return QFileSystemModel::setData(index, value, role);
}

Qt::ItemFlags VelMenuModel::flags(const QModelIndex &index) const
{
    return QFileSystemModel::flags(index) & ~Qt::ItemIsEditable;
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
    m_readAlong.remove(path);
    hiddenItems.remove(path);
    itemNames.remove(path);
    // Of a folder that went, nothing may be remembered when others come to stand in its place.
    if (!QFileInfo::exists(path)) {
        forgetBelow(hiddenItems, path);
        forgetBelow(itemNames, path);
    }
    refreshRow(path);
}

void VelMenuModel::setItemName(const QString &path, const QString &name)
{
    itemNames.insert(path, name);
    refreshRow(path);
}

bool VelMenuModel::loadItemInfo(const QString &path, bool isFolder) const
{
    const QString recordFile = EntryPath::recordFileOf(path);
    const QString file = isFolder && QFileInfo::exists(recordFile) ? recordFile : path;
    if (!EntryPath::isEntry(file) && !EntryPath::isRecordFile(file))
        return false;

    const auto known = m_readAlong.find(file);
    const bool wasRead = known != m_readAlong.end();
    const ItemInfo info = wasRead ? *known : itemInfo(VelUIDesktopEntry(file), file);
    if (wasRead)
        m_readAlong.erase(known);
    // The row of a file that is gone stands until the base class sees it. What is asked for then
    // must not be remembered of the next file that comes to this path.
    if (info.name.isEmpty() && !QFileInfo::exists(file))
        return true;
    itemNames.insert(path, info.name);
    if (info.isHidden)
        hiddenItems.insert(path, true);
    return true;
}

VelMenuModel::ItemInfo VelMenuModel::itemInfo(const VelUIDesktopEntry &entry, const QString &file)
{
    return {EntryDisplay::shownName(entry), EntryPath::isEntry(file) && EntryDisplay::isHidden(entry)};
}

// Keeps what an entry says beside its icon, no longer than until the event loop turns.
void VelMenuModel::readAlong(const QString &path, const VelUIDesktopEntry &entry)
{
    if (itemNames.contains(path))
        return;
    if (m_readAlong.isEmpty())
        QTimer::singleShot(0, this, [this] { m_readAlong.clear(); });
    m_readAlong.insert(path, itemInfo(entry, path));
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
    const QString known = itemNames.value(path);
    if (!known.isEmpty())
        return known;
    if (!loadItemInfo(path, isDir(index)))
        return QFileSystemModel::data(index, Qt::DisplayRole);
    return itemNames.value(path);
}

bool VelMenuModel::isHidden(const QModelIndex &index) const
{
    const QString path = pathOf(index);
    if (!itemNames.contains(path) && !loadItemInfo(path, isDir(index)))
        return false;
    return hiddenItems.value(path, false);
}

// Announces that the row of \a path may show something else now. What belongs to the
// ".directory" file is shown in the folder's row; a dot file has no row, and asking for its
// index would make one.
void VelMenuModel::refreshRow(const QString &path)
{
    const QString rowPath = EntryPath::describedBy(path);
    const QFileInfo info(rowPath);
    if (info.fileName().startsWith(QLatin1Char('.')) || !info.exists()) {
        m_editedRows.remove(rowPath);
        return;
    }
    m_editedRows.insert(rowPath);
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
