// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FoundOrder.h"

#include "ItemOrder.h"
#include "SortOrder.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <QDateTime>
#include <QFileInfo>
#include <QHash>
#include <QSet>

#include <algorithm>

namespace {

QString folderOf(const QString &path)
{
    return path.left(std::max(int(path.lastIndexOf(QLatin1Char('/'))), 1));
}

QString fileNameOf(const QString &path)
{
    return path.mid(path.lastIndexOf(QLatin1Char('/')) + 1);
}

/// A child of a folder, with what decides its place.
class Child
{
public:
    Child() = default;
    Child(const MenuWalk::Item &item, const QString &name, const SortOrder::Mention &mention)
        : m_path(item.path)
        , m_name(name)
        , m_isFolder(item.isFolder)
        , m_mention(mention)
    {
    }

    const QString &path() const { return m_path; }

    QString fileName() const { return fileNameOf(m_path); }
    const QString &name() const { return m_name; }
    bool isFolder() const { return m_isFolder; }
    qint64 modified() const { return QFileInfo(m_path).lastModified().toMSecsSinceEpoch(); }
    SortOrder::Places placesAgainst(const Child &other) const
    {
        return SortOrder::places(m_mention, other.m_mention);
    }

private:
    QString m_path;
    QString m_name;
    bool m_isFolder = false;
    SortOrder::Mention m_mention;
};

/// The items and the folders on the way to them.
class Tree
{
public:
    Tree(const QString &root, const QVector<MenuWalk::Item> &items, const FoundOrder::NameOf &nameOf)
        : m_nameOf(nameOf)
    {
        for (const MenuWalk::Item &item : items)
            add(root, item);
        for (const MenuWalk::Item &item : items)
            m_asked.insert(item.path);
    }

    void list(const QString &folder, QStringList *paths) const
    {
        QVector<Child> children = childrenOf(folder);
        ItemOrder::sort(ItemOrder::ruleOf(fileNameOf(folder)), children);
        for (const Child &child : qAsConst(children)) {
            if (m_asked.contains(child.path()))
                paths->append(child.path());
            if (m_children.contains(child.path()))
                list(child.path(), paths);
        }
    }

private:
    void add(const QString &root, const MenuWalk::Item &item)
    {
        const QString folder = folderOf(item.path);
        if (m_known.contains(item.path))
            return;
        m_known.insert(item.path);
        m_children[folder].append(item);
        if (folder.size() > root.size())
            add(root, {folder, true});
    }

    QVector<Child> childrenOf(const QString &folder) const
    {
        const QString record = EntryPath::recordFileOf(folder);
        const SortOrder::Index order(QFileInfo::exists(record) ? VelUIDesktopEntry(record).getSortOrder()
                                                               : QStringList());
        QVector<Child> children;
        for (const MenuWalk::Item &item : m_children.value(folder)) {
            children.append(Child(item, m_nameOf(item), order.mention(fileNameOf(item.path))));
        }
        return children;
    }

    const FoundOrder::NameOf &m_nameOf;
    QHash<QString, QVector<MenuWalk::Item>> m_children;
    QSet<QString> m_known;
    QSet<QString> m_asked;
};

} // namespace

QStringList FoundOrder::sorted(const QString &menuDirectory, const QVector<MenuWalk::Item> &items,
                               const NameOf &nameOf)
{
    QStringList paths;
    Tree(menuDirectory, items, nameOf).list(menuDirectory, &paths);
    return paths;
}
