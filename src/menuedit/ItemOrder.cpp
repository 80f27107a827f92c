// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ItemOrder.h"

ItemOrder::Rule ItemOrder::ruleOf(const QString &folderName)
{
    return folderName == QLatin1String("recents") ? Rule::ByTime : Rule::ByList;
}
