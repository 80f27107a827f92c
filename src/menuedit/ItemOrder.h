// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "SortOrder.h"

#include <QCollator>
#include <QString>
#include <QVector>

#include <algorithm>

/**
 * The order in which the menu shows the children of a folder.
 *
 * An item is any class with the constant functions `modified()` (milliseconds), `isFolder()`,
 * `name()` as shown, and `placesAgainst(other)` (the places that the folder's list gives to the
 * item and to \a other); sort() asks for `fileName()`, too.
 *
 * Items that compare equal keep an order only in a stable sort that begins with the order of the
 * files: by time they stay in it, by name they stand in its reverse. Whoever sorts otherwise than
 * with sort() has to sort in this way.
 */
namespace ItemOrder {

/// What decides in a folder.
enum class Rule {
    ByTime, ///< The newest comes first.
    ByList ///< The list of the folder, then folders before files, then the name.
};

/// The rule for the children of a folder with that file name.
Rule ruleOf(const QString &folderName);

/// Compares two names as the language does, beyond the longest that a file may have by the characters:
/// marks in an odd order would make the language's way take longer than anybody waits.
int compareNames(const QString &left, const QString &right);

/// Negative where \a left is shown above \a right, positive where it is shown below, 0 where they
/// are equal.
template <typename Item>
int compare(Rule rule, const Item &left, const Item &right)
{
    if (rule == Rule::ByTime) {
        const qint64 leftTime = left.modified();
        const qint64 rightTime = right.modified();
        return leftTime == rightTime ? 0 : leftTime > rightTime ? -1 : 1;
    }
    const SortOrder::Places places = left.placesAgainst(right);
    if (places.left != places.right)
        return places.left < places.right ? -1 : 1;
    if (left.isFolder() != right.isFolder())
        return left.isFolder() ? -1 : 1;
    return compareNames(left.name(), right.name());
}

/// Whether an item with that \a comparison to another is shown below it; of two with the same
/// name each is, which is what reverses them in a stable sort.
constexpr bool isBelow(Rule rule, int comparison)
{
    return rule == Rule::ByTime ? comparison > 0 : comparison >= 0;
}

/// Puts the \a items of a folder into the order of the menu, the first at the top.
template <typename Item>
void sort(Rule rule, QVector<Item> &items)
{
    // The order of the files is that of a QFileSystemModel.
    QCollator collator;
    collator.setNumericMode(true);
    collator.setCaseSensitivity(Qt::CaseInsensitive);
    std::sort(items.begin(), items.end(), [&collator](const Item &left, const Item &right) {
        if (left.isFolder() != right.isFolder())
            return left.isFolder();
        const int order = collator.compare(left.fileName(), right.fileName());
        return order != 0 ? order < 0 : left.fileName() < right.fileName();
    });
    std::stable_sort(items.begin(), items.end(), [rule](const Item &left, const Item &right) {
        return isBelow(rule, compare(rule, right, left));
    });
}

} // namespace ItemOrder
