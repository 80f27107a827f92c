// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ItemOrder.h"

namespace {

constexpr int LongestName = 255;

} // namespace

ItemOrder::Rule ItemOrder::ruleOf(const QString &folderName)
{
    return folderName == QLatin1String("recents") ? Rule::ByTime : Rule::ByList;
}

int ItemOrder::compareNames(const QString &left, const QString &right)
{
    if (left.size() <= LongestName && right.size() <= LongestName)
        return QString::localeAwareCompare(left, right);
    const int order = QString::localeAwareCompare(left.left(LongestName), right.left(LongestName));
    return order != 0 ? order : left.mid(LongestName).compare(right.mid(LongestName));
}
