// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "BlockMove.h"

#include <QHash>

namespace {

// What stands beside each block, with those that are to pass it.
QHash<QString, QStringList> blocksByNeighbor(const QStringList &shown, const QSet<QString> &moved, bool up)
{
    QHash<QString, QStringList> blocks;
    QStringList block;
    QString above;
    for (const QString &name : shown) {
        if (moved.contains(name)) {
            block.append(name);
            continue;
        }
        if (!block.isEmpty() && (!up || !above.isNull()))
            blocks.insert(up ? above : name, block);
        block.clear();
        above = name;
    }
    if (!block.isEmpty() && up && !above.isNull())
        blocks.insert(above, block);
    return blocks;
}

} // namespace

QStringList BlockMove::byOne(const QStringList &all, const QStringList &shown, const QSet<QString> &moved,
                             bool up)
{
    const QHash<QString, QStringList> blocks = blocksByNeighbor(shown, moved, up);
    QSet<QString> moving;
    for (const QStringList &block : blocks)
        moving.unite(QSet<QString>(block.begin(), block.end()));
    QStringList order;
    for (const QString &name : all) {
        if (moving.contains(name))
            continue;
        if (up)
            order += blocks.value(name);
        order.append(name);
        if (!up)
            order += blocks.value(name);
    }
    return order;
}
