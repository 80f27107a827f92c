// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ThemeFolders.h"

#include <QDir>
#include <QFileInfo>
#include <QIcon>
#include <QSettings>

#include <algorithm>
#include <cstdlib>

namespace {

const QLatin1String LastParent("hicolor");

ThemeFolder::Kind kindOf(const QString &text)
{
    if (text == QLatin1String("Fixed"))
        return ThemeFolder::Kind::Fixed;
    return text == QLatin1String("Scalable") ? ThemeFolder::Kind::Scalable : ThemeFolder::Kind::Threshold;
}

ThemeFolder folderOf(const QSettings &description, const QString &path, int size)
{
    const auto number = [&](const char *key, int otherwise) {
        return description.value(path + QLatin1Char('/') + QLatin1String(key), otherwise).toInt();
    };
    ThemeFolder folder;
    folder.path = path;
    folder.kind = kindOf(description.value(path + QLatin1String("/Type")).toString());
    folder.size = size;
    folder.smallest = number("MinSize", size);
    folder.largest = number("MaxSize", size);
    folder.threshold = number("Threshold", 2);
    folder.scale = number("Scale", 1);
    const QString context = description.value(path + QLatin1String("/Context")).toString();
    folder.isForWholeNames =
        context == QLatin1String("Applications") || context == QLatin1String("MimeTypes");
    return folder;
}

} // namespace

bool ThemeFolder::isFor(int wanted, int wantedScale) const
{
    if (scale != wantedScale)
        return false;
    switch (kind) {
    case Kind::Fixed:
        return size == wanted;
    case Kind::Scalable:
        return wanted <= largest && wanted >= smallest;
    case Kind::Threshold:
        return wanted >= size - threshold && wanted <= size + threshold;
    case Kind::Unsorted:
        return true;
    }
    return false;
}

int ThemeFolder::distanceTo(int wanted, int wantedScale) const
{
    const int difference = differenceFrom(wanted, wantedScale);
    return kind == Kind::Fixed ? std::abs(difference) : difference;
}

int ThemeFolder::differenceFrom(int wanted, int wantedScale) const
{
    const int pixels = wanted * wantedScale;
    switch (kind) {
    case Kind::Fixed:
        return size * scale - pixels;
    case Kind::Scalable:
        if (pixels < smallest * scale)
            return smallest * scale - pixels;
        return pixels > largest * scale ? pixels - largest * scale : 0;
    case Kind::Threshold:
        if (pixels < (size - threshold) * scale)
            return smallest * scale - pixels;
        return pixels > (size + threshold) * scale ? pixels - largest * scale : 0;
    case Kind::Unsorted:
        return 0;
    }
    return 0;
}

ThemeFolders::ThemeFolders(const QString &name)
{
    QString description;
    const QStringList searchPaths = QIcon::themeSearchPaths();
    for (const QString &searchPath : searchPaths) {
        const QString root = QDir(searchPath).path() + QLatin1Char('/') + name;
        if (QFileInfo(root).isDir())
            m_roots.push_back({root, std::make_unique<const ThemeCache>(root)});
        if (!m_isValid) {
            description = root + QLatin1String("/index.theme");
            m_isValid = QFileInfo::exists(description);
        }
    }
    if (m_isValid)
        readDescription(description);
}

// With the same reader as Qt, so that the folders come in the same order.
void ThemeFolders::readDescription(const QString &path)
{
    const QSettings description(path, QSettings::IniFormat);
    const QLatin1String sizeKey("/Size");
    const QStringList keys = description.allKeys();
    for (const QString &key : keys) {
        const int size = key.endsWith(sizeKey) ? description.value(key).toInt() : 0;
        if (size != 0)
            m_folders.append(folderOf(description, key.chopped(sizeKey.size()), size));
    }
    m_inherited = description.value(QStringLiteral("Icon Theme/Inherits")).toStringList();
    m_inherited.removeAll(QString());
}

QStringList ThemeFolders::parents(QtMajor::ThemeRules rules) const
{
    if (!m_isValid)
        return {};
    const bool isOld = rules == QtMajor::ThemeRules::NamesFirst;
    QStringList parents = m_inherited;
    if (!QIcon::fallbackThemeName().isEmpty() && (parents.isEmpty() || !isOld))
        parents.append(QIcon::fallbackThemeName());
    if (!isOld)
        parents.removeAll(LastParent);
    if (!parents.contains(LastParent))
        parents.append(LastParent);
    return parents;
}

QVector<ThemeFolders::Place> ThemeFolders::placesOf(const QString &name) const
{
    QVector<Place> places;
    for (const Root &root : m_roots) {
        const auto add = [&](const ThemeFolder &folder) {
            places.append({root.path + QLatin1Char('/') + folder.path + QLatin1Char('/'), &folder});
        };
        if (const auto known = root.cache->foldersOf(name)) {
            for (const QString &path : *known) {
                const auto folder =
                    std::find_if(m_folders.cbegin(), m_folders.cend(),
                                 [&path](const ThemeFolder &each) { return each.path == path; });
                if (folder != m_folders.cend())
                    add(*folder);
            }
        } else {
            std::for_each(m_folders.cbegin(), m_folders.cend(), add);
        }
    }
    return places;
}
