// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OwnIcon.h"

#include "LibraryPlace.h"

#include <QDir>
#include <QFile>
#include <QIcon>

namespace {

// Qt looks for themes where the desktop has them, which knows nothing of the library's prefix.
QIcon installed(const QString &name)
{
    QIcon icon;
    const QString folder = LibraryPlace::icons();
    if (folder.isEmpty())
        return icon;
    const QDir theme(folder + QLatin1String("/hicolor"));
    const QStringList sizes = theme.entryList({QStringLiteral("*x*")}, QDir::Dirs);
    for (const QString &size : sizes) {
        const QString file = theme.filePath(size + QLatin1String("/apps/") + name + QLatin1String(".png"));
        if (QFile::exists(file))
            icon.addFile(file);
    }
    return icon;
}

} // namespace

QIcon OwnIcon::named(const QString &name)
{
    const QIcon ofTheme = QIcon::fromTheme(name);
    return ofTheme.isNull() ? installed(name) : ofTheme;
}
