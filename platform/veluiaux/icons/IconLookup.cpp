// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconLookup.h"

#include "PictureFile.h"

#include <QDateTime>
#include <QDir>
#include <QFileInfo>

namespace {

QString withoutImageSuffix(const QString &name)
{
    for (const QLatin1String suffix :
         {QLatin1String(".png"), QLatin1String(".svg"), QLatin1String(".svgz"), QLatin1String(".xpm")}) {
        if (name.size() > suffix.size() && name.endsWith(suffix, Qt::CaseInsensitive))
            return name.chopped(suffix.size());
    }
    return name;
}

QIcon iconOfFile(const QString &path)
{
    // Opening a pipe would wait for whoever writes into it.
    if (!QFileInfo(path).isFile() || !PictureFile::isSafe(path))
        return QIcon();
    QIcon icon(path);
    // What only has the suffix of an image gives an icon that is not null; a drawing has no sizes
    // of its own, but can be made in any.
    if (icon.availableSizes().isEmpty() && icon.actualSize(QSize(16, 16)).isEmpty())
        return QIcon();
    return icon;
}

} // namespace

QIcon IconLookup::find(const QString &name)
{
    if (QDir::isAbsolutePath(name))
        return iconOfFile(name);
    // From the folders of a theme such a name would lead to any other.
    if (name.contains(QLatin1Char('/')))
        return QIcon();
    const QIcon icon = QIcon::fromTheme(withoutImageSuffix(name));
    return icon.isNull() || icon.availableSizes().isEmpty() ? QIcon() : icon;
}

QString IconLookup::identity(const QString &name)
{
    if (!QDir::isAbsolutePath(name))
        return name;
    const QFileInfo file(name);
    return name + QLatin1Char('|') + QString::number(file.lastModified().toMSecsSinceEpoch())
        + QLatin1Char('|') + QString::number(file.size());
}
