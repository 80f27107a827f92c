// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopNames.h"

QStringList DesktopNames::registered()
{
    static const QStringList names =
        QStringLiteral(
            "Budgie Cinnamon Deepin EDE Enlightenment GNOME GNOME-Classic GNOME-Flashback KDE LXDE "
            "LXQt MATE Old Pantheon Razor ROX TDE Unity XFCE")
            .split(QLatin1Char(' '));
    return names;
}

QStringList DesktopNames::ofSession()
{
    const QString desktops = QString::fromLocal8Bit(qgetenv("XDG_CURRENT_DESKTOP"));
    const QStringList names = desktops.split(QLatin1Char(':'), Qt::SkipEmptyParts);
    return names.isEmpty() ? QStringList(QStringLiteral("VEL")) : names;
}
