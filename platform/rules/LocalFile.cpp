// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LocalFile.h"

#include <QUrl>

QString localFile(const QString &target)
{
    if (target.startsWith(QLatin1Char('/')))
        return target;
    const QUrl url(target);
    const bool isHere = url.host().isEmpty() || url.host() == QLatin1String("localhost");
    return url.scheme() == QLatin1String("file") && isHere ? url.path(QUrl::FullyDecoded) : QString();
}
