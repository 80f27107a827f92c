// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconLookup.h"

#include "PictureFile.h"
#include "ThemeState.h"

#include <QDataStream>
#include <QDateTime>
#include <QDir>
#include <QFileInfo>

#include <algorithm>

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

// The platform's own theme may have its own way to find files.
bool isFoundByQt(const QIcon &icon)
{
    QByteArray bytes;
    QDataStream out(&bytes, QIODevice::WriteOnly);
    out << icon;
    QDataStream in(bytes);
    QString engine;
    in >> engine;
    return engine == QLatin1String("QIconLoaderEngine");
}

bool isSafe(const ThemeFiles::File &file)
{
    return PictureFile::isSafeOfTheme(file.path);
}

// The same for all icons, so that one has to be made to tell.
bool isQtTheFinder(const QString &nameOfOne)
{
    static quint64 generation = 0;
    static bool isQt = false;
    if (generation == ThemeState::generation())
        return isQt;
    const QIcon icon = QIcon::fromTheme(nameOfOne);
    if (icon.isNull())
        return false;
    isQt = isFoundByQt(icon);
    generation = ThemeState::generation();
    return isQt;
}

IconLookup::Found iconOfTheme(const QString &name)
{
    IconLookup::Found found;
    found.files = ThemeFiles::find(name);
    found.themeName = name;
    found.isChosenByQt = !found.files.isEmpty() && isQtTheFinder(name);
    if (found.isChosenByQt && found.files.constFirst().folder.kind != ThemeFolder::Kind::Unsorted)
        return found;
    // To tell the sizes of such a one, the file itself is read.
    if (!std::all_of(found.files.cbegin(), found.files.cend(), isSafe))
        return {};
    found.makeIcon();
    return found.icon.availableSizes().isEmpty() ? IconLookup::Found() : found;
}

} // namespace

bool IconLookup::Found::mayBeDrawn(const QSize &size, int scale) const
{
    if (!isChosenByQt)
        return std::all_of(files.cbegin(), files.cend(), isSafe);
    const ThemeFiles::File *const file = ThemeFiles::forSize(files, size, scale);
    return !file || isSafe(*file);
}

const ThemeFiles::File *IconLookup::Found::drawing(const QSize &size) const
{
    const ThemeFiles::File *const file = isChosenByQt ? ThemeFiles::forSize(files, size) : nullptr;
    return file && file->isDrawing() ? file : nullptr;
}

void IconLookup::Found::makeIcon()
{
    if (icon.isNull() && !themeName.isEmpty())
        icon = QIcon::fromTheme(themeName);
}

IconLookup::Found IconLookup::find(const QString &name)
{
    if (QDir::isAbsolutePath(name))
        return {iconOfFile(name), {}, {}};
    // From the folders of a theme such a name would lead to any other.
    if (name.contains(QLatin1Char('/')))
        return {};
    return iconOfTheme(withoutImageSuffix(name));
}

QVector<ThemeFiles::File> IconLookup::filesOf(const QString &name)
{
    if (!QDir::isAbsolutePath(name))
        return name.contains(QLatin1Char('/')) ? QVector<ThemeFiles::File>()
                                               : ThemeFiles::find(withoutImageSuffix(name));
    ThemeFolder folder;
    folder.kind = ThemeFolder::Kind::Unsorted;
    return QFileInfo(name).isFile() ? QVector<ThemeFiles::File>{{name, folder}} : QVector<ThemeFiles::File>();
}

QString IconLookup::identity(const QString &name)
{
    if (!QDir::isAbsolutePath(name))
        return name;
    const QFileInfo file(name);
    return name + QLatin1Char('|') + QString::number(file.lastModified().toMSecsSinceEpoch())
        + QLatin1Char('|') + QString::number(file.size());
}
