// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DialogSize.h"

#include <QSettings>
#include <QWidget>

namespace {

QString widthKey(const QString &group)
{
    return group + QLatin1String("/Width");
}

QString heightKey(const QString &group)
{
    return group + QLatin1String("/Height");
}

void keep(QSettings &settings, const QString &key, int number)
{
    if (settings.value(key).toString() != QString::number(number))
        settings.setValue(key, number);
}

} // namespace

void DialogSize::restore(QWidget &dialog, const QString &group, QSize fallback)
{
    const QSettings settings;
    dialog.resize(settings.value(widthKey(group), fallback.width()).toInt(),
                  settings.value(heightKey(group), fallback.height()).toInt());
}

void DialogSize::remember(const QWidget &dialog, const QString &group)
{
    QSettings settings;
    keep(settings, widthKey(group), dialog.width());
    keep(settings, heightKey(group), dialog.height());
}
