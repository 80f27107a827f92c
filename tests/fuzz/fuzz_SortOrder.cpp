// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The order in a ".directory" file. The first line of an input is the name of a new child, the rest
// is the file.

#include "FuzzTarget.h"

#include <menuedit/SortOrder.h>

#include <veluiaux/VelUIDesktopEntry.h>

namespace {

bool equal(SortOrder::Places one, SortOrder::Places other)
{
    return one.left == other.left && one.right == other.right;
}

void tryPlaces(const QStringList &order, const QStringList &names)
{
    const SortOrder::Index index(order);
    for (const QString &left : names) {
        const SortOrder::Mention mention = index.mention(left);
        for (const QString &right : names) {
            const SortOrder::Places places = SortOrder::places(order, left, right);
            Fuzz::require(equal(places, SortOrder::places(mention, index.mention(right))),
                          "an index gives the places that the list gives");
            const SortOrder::Places back = SortOrder::places(order, right, left);
            Fuzz::require(equal(places, {back.right, back.left}), "places do not depend on the side");
        }
    }
}

} // namespace

void Fuzz::test(const QByteArray &input)
{
    const Parts parts = cut(input);
    const QString name = QString::fromUtf8(parts.head);
    const QString path = write(".directory", parts.rest);
    VelUIDesktopEntry record(path);
    const QStringList order = record.getSortOrder();
    tryPlaces(order, QStringList{name, QStringLiteral("a.desktop")} + order.mid(0, 6));

    QStringList children = order.mid(0, 20);
    children.removeDuplicates();
    if (name.isEmpty())
        return;
    const QStringList fresh = SortOrder::rewritten(children, name, children.size());
    record.setSortOrder(fresh);
    require(record.save(), "a new order can be saved");
    require(VelUIDesktopEntry(path).getSortOrder() == fresh, "a new order reads back");
}
