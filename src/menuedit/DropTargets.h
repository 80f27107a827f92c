// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "NameClash.h"
#include "WebAddress.h"

#include <QSet>
#include <QString>
#include <QStringList>
#include <QVector>

#include <functional>
#include <optional>

/**
 * One file or web address that was dropped.
 */
struct DropItem
{
    QString source; ///< the path of the file; empty for an address
    WebAddress address; ///< which is to become an entry; empty for a file
    QString target; ///< the path that it is to have
    bool isHere = false; ///< whether it lies in the folder already; then it stays as it is
    bool isReplacing = false; ///< whether something at the target is to make room for it

    bool isFile() const { return address.url.isEmpty(); }
};

/**
 * Finds the paths that dropped files are to have in a folder. Looks at the disk, and changes nothing.
 */
class DropTargets
{
public:
    /// Decides about a name that is taken. An event loop may run in it.
    using Ask = std::function<NameClash::Answer(const NameClash &clash)>;

    /// The \a sources are paths; empty ones stand for the \a addresses in turn, and for no file where
    /// there are none left.
    DropTargets(const QString &folder, const QStringList &sources, const QVector<WebAddress> &addresses = {});

    /// All of them under their own names, whether or not these are taken.
    const QVector<DropItem> &plain() const { return m_items; }
    /// All of them, those whose names are taken under others, which nothing and none of them has.
    QVector<DropItem> besides() const;
    /// As is decided for each whose name is taken, without those to be skipped; nullopt when all is to
    /// stay as it is.
    std::optional<QVector<DropItem>> settled(const Ask &ask) const;

private:
    DropItem fileItem(const QString &source) const;
    DropItem addressItem(const WebAddress &address) const;
    bool isTaken(const QString &target, const QSet<QString> &promised) const;
    QString freeTarget(const DropItem &item, const QSet<QString> &promised) const;
    NameClash::Kind kindOf(const DropItem &item, const QSet<QString> &promised) const;

    const QString m_folder;
    const QStringList m_sources;
    QVector<DropItem> m_items;
};
