// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTree.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>
#include <frame/FolderListing.h>
#include <menuedit/EntryDisplay.h>
#include <menuedit/EntryState.h>
#include <menuedit/ItemOrder.h>
#include <menuedit/SortOrder.h>

#include <QDateTime>
#include <QDir>
#include <QFileInfo>
#include <QSet>

#include <optional>

namespace {

/// A child of a folder with what decides its place.
class Child
{
public:
    Child() = default;
    Child(const MenuItem &item, const QFileInfo &info, const SortOrder::Mention &mention)
        : m_item(item)
        , m_fileName(info.fileName())
        , m_modified(info.lastModified().toMSecsSinceEpoch())
        , m_mention(mention)
    {
    }

    const MenuItem &item() const { return m_item; }

    const QString &fileName() const { return m_fileName; }
    const QString &name() const { return m_item.name; }
    bool isFolder() const { return m_item.kind == MenuItem::Folder; }
    qint64 modified() const { return m_modified; }
    SortOrder::Places placesAgainst(const Child &other) const
    {
        return SortOrder::places(m_mention, other.m_mention);
    }

private:
    MenuItem m_item;
    QString m_fileName;
    qint64 m_modified = 0;
    SortOrder::Mention m_mention;
};

MenuItem plainFile(const QFileInfo &info)
{
    MenuItem item;
    item.path = info.absoluteFilePath();
    item.name = info.fileName();
    return item;
}

QString firstOf(const QString &local, const QString &plain)
{
    return local.isEmpty() ? plain : local;
}

MenuItemDetails detailsOf(const VelUIDesktopEntry &record)
{
    MenuItemDetails details;
    details.genericName = firstOf(record.getLocalGenericName(), record.getGenericName());
    details.comment = firstOf(record.getLocalComment(), record.getComment());
    details.keywords = record.getLocalKeywords().isEmpty() ? record.getKeywords() : record.getLocalKeywords();
    details.categories = record.getCategories();
    details.mimeTypes = record.getMimeType();
    details.tryExec = record.getTryExec();
    details.workingDirectory = record.getPath();
    details.startupWMClass = record.getStartupWMClass();
    details.url = record.getURL();
    details.terminal = record.getTerminal();
    details.startupNotify = record.getStartupNotify();
    const QList<VelUIDesktopAction> actions = record.getActions();
    for (const VelUIDesktopAction &action : actions)
        details.actions.append({action.getId(), firstOf(action.getLocalName(), action.getName()),
                                action.getIcon(), action.getExec(), QString()});
    return details;
}

QString wordFor(EntryState::Kind state)
{
    switch (state) {
    case EntryState::Kind::NotDisplayed:
        return QStringLiteral("notDisplayed");
    case EntryState::Kind::NotInstalled:
        return QStringLiteral("notInstalled");
    case EntryState::Kind::Malformed:
        return QStringLiteral("malformed");
    case EntryState::Kind::Nameless:
        return QStringLiteral("nameless");
    case EntryState::Kind::Shown:
    case EntryState::Kind::Deleted: // these two are not in the menu at all
    case EntryState::Kind::ForOtherDesktops:
        break;
    }
    return {};
}

MenuItem entry(const QFileInfo &info, const VelUIDesktopEntry &record)
{
    MenuItem item;
    item.path = info.absoluteFilePath();
    item.name = EntryDisplay::shownName(record);
    item.icon = record.getIcon();
    item.exec = record.getExec();
    item.kind = item.exec == QLatin1String("VELWM_SEPARATOR") ? MenuItem::Separator : MenuItem::Entry;
    item.details = detailsOf(record);
    const EntryState::Kind state = EntryState::of(record);
    item.isListed = state == EntryState::Kind::Shown;
    item.whyUnlisted = wordFor(state);
    return item;
}

/// The way to what is being read, and how much was.
struct Walk
{
    QSet<QString> above; ///< the canonical paths of the folders on the way
    int items = 0;
    bool isWhole = true;
};

MenuItem readFolder(const QFileInfo &folder, Walk *walk);

// Nothing for what the menu does not show, and for a folder that is being read already.
std::optional<MenuItem> itemOf(const QFileInfo &info, Walk *walk)
{
    if (info.isDir()) {
        if (walk->above.contains(info.canonicalFilePath()))
            return {};
        return readFolder(info, walk);
    }
    if (!EntryPath::isEntry(info.fileName()))
        return plainFile(info);
    const VelUIDesktopEntry record(info.absoluteFilePath());
    if (EntryDisplay::isHidden(record))
        return {};
    return entry(info, record);
}

QVector<Child> childrenOf(const QString &path, const SortOrder::Index &order, Walk *walk)
{
    QVector<Child> children;
    FolderListing files(path);
    while (const std::optional<FolderListing::Item> file = files.next()) {
        if (walk->items >= MenuTree::MostItems || walk->above.size() >= MenuTree::MostLevels) {
            walk->isWhole = false;
            break;
        }
        ++walk->items;
        const QFileInfo info(file->path);
        const std::optional<MenuItem> item = itemOf(info, walk);
        if (item)
            children.append({*item, info, order.mention(info.fileName())});
    }
    return children;
}

MenuItem readFolder(const QFileInfo &folder, Walk *walk)
{
    MenuItem item;
    item.kind = MenuItem::Folder;
    item.path = folder.absoluteFilePath();
    item.name = folder.fileName();
    QStringList sortOrder;
    const QString own = EntryPath::recordFileOf(item.path);
    if (QFileInfo::exists(own)) {
        const VelUIDesktopEntry record(own);
        item.name = EntryDisplay::shownName(record);
        item.icon = record.getIcon();
        item.isListed = !record.getNoDisplay() && !record.getHidden();
        sortOrder = record.getSortOrder();
    }

    const QString canonical = folder.canonicalFilePath();
    walk->above.insert(canonical);
    QVector<Child> children = childrenOf(item.path, SortOrder::Index(sortOrder), walk);
    walk->above.remove(canonical);

    ItemOrder::sort(ItemOrder::ruleOf(folder.fileName()), children);
    for (const Child &child : qAsConst(children))
        item.children.append(child.item());
    return item;
}

} // namespace

MenuItem MenuTree::read(const QString &path, bool *isWhole)
{
    Walk walk;
    MenuItem menu = readFolder(QFileInfo(QDir::cleanPath(path)), &walk);
    if (isWhole)
        *isWhole = walk.isWhole;
    return menu;
}
