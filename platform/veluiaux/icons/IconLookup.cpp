// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconLookup.h"

#include "PictureFile.h"
#include "QtMajor.h"
#include "ThemeState.h"

#include <QDataStream>
#include <QDateTime>
#include <QDir>
#include <QFileInfo>

#include <algorithm>
#include <cstring>

#include <link.h>

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

int addPlatformTheme(dl_phdr_info *library, size_t, void *)
{
    return std::strstr(library->dlpi_name, "/platformthemes/") ? 1 : 0; // other than 0 ends the search
}

bool isPlatformThemeOfAPlugin()
{
    static const bool isLoaded = dl_iterate_phdr(&addPlatformTheme, nullptr) != 0;
    return isLoaded;
}

bool isUnsorted(const ThemeFiles::File &file)
{
    return file.folder.kind == ThemeFolder::Kind::Unsorted;
}

// Since Qt 6 does not say who finds the files, it is another one unless all of it shows that it is not.
bool isAsFoundByQt(const QIcon &icon, const QVector<ThemeFiles::File> &files)
{
    if (isPlatformThemeOfAPlugin() || std::any_of(files.cbegin(), files.cend(), isUnsorted))
        return false;
    const QList<QSize> sizes = icon.availableSizes();
    const auto isSame = [](const ThemeFiles::File &file, const QSize &size) {
        return QSize(file.folder.size, file.folder.size) == size;
    };
    return std::equal(files.cbegin(), files.cend(), sizes.cbegin(), sizes.cend(), isSame);
}

// The platform's own theme may have its own way to find files.
bool isFoundByQt(const QIcon &icon, const QVector<ThemeFiles::File> &files)
{
    if (!QtMajor::areThemeRulesKnown())
        return false;
    QByteArray bytes;
    QDataStream out(&bytes, QIODevice::WriteOnly);
    out << icon;
    QDataStream in(bytes);
    QString engine;
    in >> engine;
    return engine == QLatin1String("QIconLoaderEngine")
        || (engine == QLatin1String("QThemeIconEngine") && isAsFoundByQt(icon, files));
}

bool isSafe(const ThemeFiles::File &file)
{
    return PictureFile::isSafeOfTheme(file.path);
}

// The same for all icons, so that one has to be made to tell.
bool isQtTheFinder(const QString &nameOfOne, const QVector<ThemeFiles::File> &files)
{
    static quint64 generation = 0;
    if (generation == ThemeState::generation())
        return true;
    const QIcon icon = QIcon::fromTheme(nameOfOne);
    if (icon.isNull() || !isFoundByQt(icon, files))
        return false;
    generation = ThemeState::generation();
    return true;
}

// Where it is not sure how Qt looks for files, those of any way are what it may take.
QVector<ThemeFiles::File> filesThatQtMayTake(const QString &name)
{
    QVector<ThemeFiles::File> files = ThemeFiles::find(name);
    if (!QtMajor::areThemeRulesKnown()) {
        files += ThemeFiles::find(name, QtMajor::ThemeRules::NamesFirst);
        files += ThemeFiles::find(name, QtMajor::ThemeRules::ParentsFirst);
    }
    return files;
}

IconLookup::Found iconOfTheme(const QString &name)
{
    IconLookup::Found found;
    found.files = filesThatQtMayTake(name);
    found.themeName = name;
    found.isChosenByQt = !found.files.isEmpty() && isQtTheFinder(name, found.files);
    if (found.isOfFiles())
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

bool IconLookup::Found::isOfFiles() const
{
    return isChosenByQt && !files.isEmpty() && !isUnsorted(files.constFirst());
}

std::optional<QSize> IconLookup::Found::actualSize(const QSize &size) const
{
    const ThemeFiles::File *const file = isOfFiles() ? ThemeFiles::forSize(files, size) : nullptr;
    if (!file)
        return std::nullopt;
    if (file->folder.kind == ThemeFolder::Kind::Scalable)
        return size;
    const int edge = QtMajor::edgeOfFile(file->folder.size, file->folder.scale);
    const int least = std::min({edge, size.width(), size.height()});
    return QSize(least, least);
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
