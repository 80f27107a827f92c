// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DropTargets.h"

#include "FileTransfer.h"
#include "FreeName.h"
#include "OnDisk.h"

#include <frame/EntryPath.h>

#include <QDir>
#include <QFileInfo>

#include <algorithm>

using Choice = NameClash::Choice;

namespace {

// Where it lies, and where it leads.
QStringList placesOf(const QString &path)
{
    const QFileInfo info(path);
    const QString folder = QFileInfo(info.path()).canonicalFilePath();
    return {folder + QLatin1Char('/') + info.fileName(), info.canonicalFilePath()};
}

bool isAtOrBelow(const QString &path, const QString &folder)
{
    return path == folder || path.startsWith(folder + QLatin1Char('/'));
}

/// What the user decides, asked again only where that is not said for all.
class Decision
{
public:
    explicit Decision(const DropTargets::Ask &ask)
        : m_ask(ask)
    {
    }

    Choice about(const NameClash &clash)
    {
        if (m_forAll && (*m_forAll != Choice::Replace || clash.isReplaceable()))
            return *m_forAll;
        const NameClash::Answer answer = m_ask(clash);
        if (answer.isForAll)
            m_forAll = answer.choice;
        return answer.choice == Choice::Replace && !clash.isReplaceable() ? Choice::Cancel : answer.choice;
    }

private:
    const DropTargets::Ask &m_ask;
    std::optional<Choice> m_forAll;
};

} // namespace

DropTargets::DropTargets(const QString &folder, const QStringList &sources,
                         const QVector<WebAddress> &addresses)
    : m_folder(folder)
    , m_sources(sources)
{
    int next = 0;
    for (const QString &source : sources) {
        const bool isAddress = source.isEmpty() && next < addresses.size();
        m_items.append(isAddress ? addressItem(addresses.at(next++)) : fileItem(source));
    }
}

DropItem DropTargets::fileItem(const QString &source) const
{
    DropItem item;
    item.source = source;
    item.target = QDir(m_folder).filePath(QFileInfo(source).fileName());
    item.isHere = !source.isEmpty() && FileTransfer::liesIn(source, m_folder);
    return item;
}

DropItem DropTargets::addressItem(const WebAddress &address) const
{
    DropItem item;
    item.address = address;
    item.target = QDir(m_folder).filePath(EntryPath::entryNamed(address.fileStem()));
    return item;
}

QVector<DropItem> DropTargets::besides() const
{
    const auto keepBoth = [](const NameClash &) { return NameClash::Answer{Choice::KeepBoth, true}; };
    return *settled(keepBoth);
}

std::optional<QVector<DropItem>> DropTargets::settled(const Ask &ask) const
{
    Decision decision(ask);
    QVector<DropItem> items;
    QSet<QString> promised;
    QSet<QString> seen;
    for (DropItem item : m_items) {
        if (item.isFile() && seen.contains(item.source))
            continue;
        seen.insert(item.source);
        if (!item.isHere && isTaken(item.target, promised)) {
            // Nobody knows an address by the name of its file.
            const Choice choice = item.isFile()
                ? decision.about({item.source, item.target, kindOf(item, promised), m_items.size() > 1})
                : Choice::KeepBoth;
            if (choice == Choice::Cancel)
                return std::nullopt;
            if (choice == Choice::Skip)
                continue;
            // It may have gone while the user was asked.
            item.isReplacing = choice == Choice::Replace && OnDisk::exists(item.target);
            if (choice == Choice::KeepBoth)
                item.target = freeTarget(item, promised);
        }
        promised.insert(item.target);
        items.append(item);
    }
    return items;
}

bool DropTargets::isTaken(const QString &target, const QSet<QString> &promised) const
{
    return promised.contains(target) || OnDisk::exists(target);
}

// The own names of the others are left to them.
QString DropTargets::freeTarget(const DropItem &item, const QSet<QString> &promised) const
{
    const auto kind =
        item.isFile() && QFileInfo(item.source).isDir() ? FreeName::Kind::Folder : FreeName::Kind::Entry;
    const QString own = QFileInfo(item.target).fileName();
    const QDir folder(m_folder);
    return folder.filePath(FreeName::like(own, kind, [&](const QString &name) {
        const auto hasName = [&name](const QString &source) { return QFileInfo(source).fileName() == name; };
        return isTaken(folder.filePath(name), promised)
            || std::any_of(m_sources.begin(), m_sources.end(), hasName);
    }));
}

// What lies in the thing that makes room would go with it.
NameClash::Kind DropTargets::kindOf(const DropItem &item, const QSet<QString> &promised) const
{
    if (promised.contains(item.target))
        return NameClash::Kind::IsPromised;
    const QString target = placesOf(item.target).constFirst();
    const auto liesThere = [&target](const QString &source) {
        const QStringList places = placesOf(source);
        return isAtOrBelow(places.constFirst(), target) || isAtOrBelow(places.constLast(), target);
    };
    return std::any_of(m_sources.begin(), m_sources.end(), liesThere) ? NameClash::Kind::HoldsThem
                                                                      : NameClash::Kind::IsThere;
}
