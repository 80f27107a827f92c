// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelIcon.h>

#include "LazyIconEngine.h"

QIcon VelIcon::fromTheme(const QString &name, const QMap<Qt::Corner, QString> &emblems, const QIcon &fallback)
{
    if (name.isEmpty())
        return withEmblems(fallback, emblems);
    return QIcon(new LazyIconEngine(name, emblems, fallback)); // the icon owns its engine
}

QIcon VelIcon::fromTheme(const QString &name, const QPair<Qt::Corner, QString> &emblem, const QIcon &fallback)
{
    return fromTheme(name, QMap<Qt::Corner, QString>{{emblem.first, emblem.second}}, fallback);
}

QIcon VelIcon::withEmblems(const QIcon &icon, const QMap<Qt::Corner, QString> &emblems)
{
    // Whether the icon is null is not asked here: that may be expensive to find out.
    if (emblems.isEmpty())
        return icon;
    return QIcon(new LazyIconEngine(QString(), emblems, icon));
}
