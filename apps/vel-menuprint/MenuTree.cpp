// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTree.h"

#include <frame/DesktopEntryRecord.h>
#include <menuedit/EntryName.h>
#include <menuedit/SortOrder.h>

#include <QDateTime>
#include <QDir>
#include <QFileInfo>
#include <QSet>

#include <algorithm>
#include <optional>

namespace {

struct Child
{
    MenuItem item;
    QDateTime modified;
    SortOrder::Mention mention;
};

bool isHidden(const VelUIDesktopEntry &record)
{
    VelUIDesktopEntry::DisplayableError error = 0;
    return !record.isDisplayable(&error) && (error == 1 || error == 3);
}

// The order in which two children of one folder are shown.
bool isBefore(const Child &left, const Child &right)
{
    const SortOrder::Places places = SortOrder::places(left.mention, right.mention);
    if (places.left != places.right)
        return places.left < places.right;
    const bool leftIsFolder = left.item.kind == MenuItem::Folder;
    if (leftIsFolder != (right.item.kind == MenuItem::Folder))
        return leftIsFolder;
    return QString::localeAwareCompare(left.item.name, right.item.name) < 0;
}

bool isLater(const Child &left, const Child &right)
{
    return left.modified > right.modified;
}

MenuItem plainFile(const QFileInfo &info)
{
    MenuItem item;
    item.path = info.absoluteFilePath();
    item.name = info.fileName();
    return item;
}

MenuItem entry(const QFileInfo &info, const VelUIDesktopEntry &record)
{
    MenuItem item;
    item.path = info.absoluteFilePath();
    item.name = EntryName::of(record);
    item.icon = record.getIcon();
    item.exec = record.getExec();
    item.kind = item.exec == QLatin1String("VELWM_SEPARATOR") ? MenuItem::Separator : MenuItem::Entry;
    return item;
}

MenuItem readFolder(const QFileInfo &folder, QSet<QString> *above);

// Nothing for what the menu does not show, and for a folder that is being read already.
std::optional<MenuItem> itemOf(const QFileInfo &info, QSet<QString> *above)
{
    if (info.isDir()) {
        if (above->contains(info.canonicalFilePath()))
            return {};
        return readFolder(info, above);
    }
    if (!info.fileName().endsWith(QLatin1String(".desktop")))
        return plainFile(info);
    const VelUIDesktopEntry record(info.absoluteFilePath());
    if (isHidden(record))
        return {};
    return entry(info, record);
}

QVector<Child> childrenOf(const QString &path, const SortOrder::Index &order, QSet<QString> *above)
{
    QVector<Child> children;
    for (const QFileInfo &info : QDir(path).entryInfoList(QDir::AllEntries | QDir::NoDotAndDotDot)) {
        const std::optional<MenuItem> item = itemOf(info, above);
        if (item)
            children.append({*item, info.lastModified(), order.mention(info.fileName())});
    }
    return children;
}

MenuItem readFolder(const QFileInfo &folder, QSet<QString> *above)
{
    MenuItem item;
    item.kind = MenuItem::Folder;
    item.path = folder.absoluteFilePath();
    item.name = folder.fileName();
    QStringList sortOrder;
    const QString own = item.path + QStringLiteral("/.directory");
    if (QFileInfo::exists(own)) {
        const VelUIDesktopEntry record(own);
        item.name = EntryName::of(record);
        item.icon = record.getIcon();
        sortOrder = record.getSortOrder();
    }

    const QString canonical = folder.canonicalFilePath();
    above->insert(canonical);
    QVector<Child> children = childrenOf(item.path, SortOrder::Index(sortOrder), above);
    above->remove(canonical);

    const bool byTime = folder.fileName() == QLatin1String("recents");
    std::stable_sort(children.begin(), children.end(), byTime ? isLater : isBefore);
    for (const Child &child : qAsConst(children))
        item.children.append(child.item);
    return item;
}

} // namespace

MenuItem MenuTree::read(const QString &path)
{
    QSet<QString> above;
    return readFolder(QFileInfo(QDir::cleanPath(path)), &above);
}
