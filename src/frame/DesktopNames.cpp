// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopNames.h"

QStringList DesktopNames::registered()
{
    return {
        QStringLiteral("Budgie"),        QStringLiteral("Cinnamon"),
        QStringLiteral("COSMIC"),        QStringLiteral("DDE"),
        QStringLiteral("EDE"),           QStringLiteral("Endless"),
        QStringLiteral("Enlightenment"), QStringLiteral("GNOME"),
        QStringLiteral("GNOME-Classic"), QStringLiteral("GNOME-Flashback"),
        QStringLiteral("KDE"),           QStringLiteral("LXDE"),
        QStringLiteral("LXQt"),          QStringLiteral("MATE"),
        QStringLiteral("Old"),           QStringLiteral("Pantheon"),
        QStringLiteral("Razor"),         QStringLiteral("ROX"),
        QStringLiteral("TDE"),           QStringLiteral("Unity"),
        QStringLiteral("XFCE"),
    };
}

QStringList DesktopNames::ofSession()
{
    const QString desktops = QString::fromLocal8Bit(qgetenv("XDG_CURRENT_DESKTOP"));
    const QStringList names = desktops.split(QLatin1Char(':'), Qt::SkipEmptyParts);
    return names.isEmpty() ? QStringList(QStringLiteral("VEL")) : names;
}
