// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OwnIcon.h"

#include "LibraryPlace.h"

#include <QDir>
#include <QFile>
#include <QIcon>

// Qt looks for themes where the desktop has them, which knows nothing of the library's prefix.
QIcon OwnIcon::named(const QString &name)
{
    const QIcon ofTheme = QIcon::fromTheme(name);
    const QString icons = LibraryPlace::icons();
    if (!ofTheme.isNull() || icons.isEmpty())
        return ofTheme;
    QIcon installed;
    const QDir theme(icons + QLatin1String("/hicolor"));
    const QStringList sizes = theme.entryList({QStringLiteral("*x*")}, QDir::Dirs);
    for (const QString &size : sizes) {
        const QString file = theme.filePath(size + QLatin1String("/apps/") + name + QLatin1String(".png"));
        if (QFile::exists(file))
            installed.addFile(file);
    }
    return installed;
}
