// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SortOrder.h"

#include <QSet>

#include <algorithm>

#include <fnmatch.h>

namespace SortOrder {

namespace {

int firstOf(const Mention &mention)
{
    return mention.exact.isEmpty() ? AtEnd : mention.exact.constFirst();
}

// The last of the ascending \a indices below \a limit; the first one is known to be.
int lastBelow(const QVector<int> &indices, int limit)
{
    return *(std::lower_bound(indices.cbegin(), indices.cend(), limit) - 1);
}

} // namespace

Index::Index(const QStringList &list)
    : m_isEmpty(list.isEmpty())
{
    m_exact.reserve(list.size());
    QSet<QByteArray> seen;
    for (int i = 0; i < list.size(); ++i) {
        const QString &element = list.at(i);
        m_exact[element].append(i);
        if (!element.contains(QLatin1Char('*')))
            continue;
        // Only the first of equal patterns can ever be the first that matches.
        const QByteArray text = element.toLocal8Bit();
        if (!seen.contains(text)) {
            seen.insert(text);
            m_patterns.append({text, i});
        }
    }
    m_isPlain = m_exact.size() == list.size() && m_patterns.size() <= 1;
}

Mention Index::mention(const QString &name) const
{
    Mention mention;
    mention.exact = m_exact.value(name);
    if (m_patterns.isEmpty())
        return mention;
    const QByteArray text = name.toLocal8Bit();
    const auto matches = [&text](const Pattern &p) {
        return fnmatch(p.text.constData(), text.constData(), 0) == 0;
    };
    const auto first = std::find_if(m_patterns.cbegin(), m_patterns.cend(), matches);
    if (first != m_patterns.cend())
        mention.pattern = first->index;
    return mention;
}

Places places(const Mention &left, const Mention &right)
{
    const int firstLeft = firstOf(left);
    const int firstRight = firstOf(right);
    Places result;
    const int pattern = std::min(left.pattern, right.pattern);
    if (pattern < std::min(firstLeft, firstRight)) {
        if (left.pattern == pattern)
            result.left = pattern;
        if (right.pattern == pattern)
            result.right = pattern;
    }
    if (firstLeft != AtEnd && firstRight != AtEnd) {
        result.left = firstLeft < firstRight ? lastBelow(left.exact, firstRight) : firstLeft;
        result.right = firstRight < firstLeft ? lastBelow(right.exact, firstLeft) : firstRight;
    } else if (firstLeft != AtEnd) {
        result.left = left.exact.constLast();
    } else if (firstRight != AtEnd) {
        result.right = right.exact.constLast();
    }
    return result;
}

Places places(const QStringList &list, const QString &left, const QString &right)
{
    const Index index(list);
    return places(index.mention(left), index.mention(right));
}

QStringList rewritten(const QStringList &children, const QString &name, int place)
{
    return rewritten(children, QStringList(name), place);
}

QStringList rewritten(const QStringList &children, const QStringList &names, int place)
{
    const QSet<QString> moved(names.begin(), names.end());
    QStringList list{QStringLiteral("*")};
    list.reserve(children.size() + names.size() + 1);
    for (int i = 0; i < children.size(); ++i) {
        if (i == place)
            list.append(names);
        if (!moved.contains(children.at(i)))
            list.append(children.at(i));
    }
    if (place == children.size())
        list.append(names);
    return list;
}

QStringList withCopies(const QStringList &children, const QHash<QString, QString> &copies)
{
    QStringList list{QStringLiteral("*")};
    for (const QString &child : children) {
        list.append(child);
        const QString copy = copies.value(child);
        if (!copy.isEmpty())
            list.append(copy);
    }
    return list;
}

} // namespace SortOrder
