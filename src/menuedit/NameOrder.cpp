// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "NameOrder.h"

#include "ItemOrder.h"

namespace {

/// A child as the order of items asks about it.
class Item
{
public:
    Item() = default;
    Item(const NameOrder::Child &child, const SortOrder::Mention &mention)
        : m_child(child)
        , m_mention(mention)
    {
    }

    const QString &fileName() const { return m_child.fileName; }
    const QString &name() const { return m_child.name; }
    bool isFolder() const { return m_child.isFolder; }
    qint64 modified() const { return 0; }
    SortOrder::Places placesAgainst(const Item &other) const
    {
        return SortOrder::places(m_mention, other.m_mention);
    }

private:
    NameOrder::Child m_child;
    SortOrder::Mention m_mention;
};

} // namespace

QStringList NameOrder::sorted(const QVector<Child> &children)
{
    return shown(children, SortOrder::Index());
}

QStringList NameOrder::shown(const QVector<Child> &children, const SortOrder::Index &order)
{
    QVector<Item> items;
    items.reserve(children.size());
    for (const Child &child : children)
        items.append({child, order.mention(child.fileName)});
    ItemOrder::sort(ItemOrder::Rule::ByList, items);
    QStringList names;
    names.reserve(items.size());
    for (const Item &item : qAsConst(items))
        names.append(item.fileName());
    return names;
}
