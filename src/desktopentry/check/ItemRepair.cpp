// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ItemRepair.h"

QStringList ItemRepair::replaced(const CheckedValue &value, const QByteArray &item, const QStringList &items)
{
    QStringList result;
    if (value.isLong)
        return result;
    for (const QByteArray &old : EntryText::items(value.key.value)) {
        const QStringList now = old == item ? items : QStringList(EntryText::text(old));
        for (const QString &one : now) {
            if (!one.isEmpty() && (old != item || !result.contains(one)))
                result.append(one);
        }
    }
    return result;
}

QString ItemRepair::meant(const QByteArray &item, const QStringList &names)
{
    const QString text = EntryText::text(item).trimmed();
    for (const QString &name : names) {
        if (name.compare(text, Qt::CaseInsensitive) == 0)
            return name;
    }
    return {};
}
