// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QHash>
#include <QString>
#include <QStringList>
#include <QVector>

#include <limits>

/**
 * The rules of a folder's `SortOrder` list.
 *
 * An element is the file name of a child, or a shell wildcard pattern with a "*" that stands
 * for every child it matches and that is not named elsewhere.
 */
namespace SortOrder {

/// The place of a name that the list does not hold.
constexpr int AtEnd = std::numeric_limits<int>::max();

/// The places of two names that are compared; equal ones leave the decision to other rules.
struct Places
{
    int left = AtEnd;
    int right = AtEnd;
};

/// What a list says about one name.
struct Mention
{
    /// The indices of the elements equal to the name, ascending.
    QVector<int> exact;
    /// The index of the first pattern that matches the name, or AtEnd.
    int pattern = AtEnd;
};

/**
 * A list prepared for many questions: looking a name up does not walk the names in it.
 */
class Index
{
public:
    explicit Index(const QStringList &list = QStringList());

    /// Whether the list has no elements at all.
    bool isEmpty() const { return m_isEmpty; }
    /// Whether no element stands twice and at most one is a pattern. What the list says about
    /// two names then never contradicts what it says about either of them and a third one.
    bool isPlain() const { return m_isPlain; }
    /// What the list says about \a name. Tries the patterns in turn: keep the answer.
    Mention mention(const QString &name) const;

private:
    struct Pattern
    {
        QByteArray text;
        int index;
    };

    QHash<QString, QVector<int>> m_exact;
    QVector<Pattern> m_patterns;
    bool m_isEmpty;
    bool m_isPlain;
};

/**
 * The places that two names of one folder take against each other.
 *
 * They depend on both: of a name that stands in the list twice the later place counts,
 * unless the other name stands between the two; and once either side was found by any
 * element, no later pattern is tried for the other.
 */
Places places(const Mention &left, const Mention &right);

/// The same, straight from a \a list.
Places places(const QStringList &list, const QString &left, const QString &right);

/**
 * The list for a folder that shows \a children in this order, with \a name standing before
 * the child at \a place: at the end when \a place is their number, nowhere for any other
 * place. Where \a name stood before does not matter.
 *
 * The list begins with "*", so that children that come later are shown above all others.
 */
QStringList rewritten(const QStringList &children, const QString &name, int place);
/// The same with several \a names, each once, which stand there in their order.
QStringList rewritten(const QStringList &children, const QStringList &names, int place);

/// The list for the same folder with \a copies of some of its children, each right after the one that is
/// its key.
QStringList withCopies(const QStringList &children, const QHash<QString, QString> &copies);

} // namespace SortOrder
