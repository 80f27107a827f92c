// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ThemeFiles.h"

#include "ThemeState.h"

#include <QFileInfo>
#include <QHash>
#include <QIcon>

#include <algorithm>
#include <climits>
#include <cstdlib>
#include <memory>

namespace {

using QtMajor::ThemeRules;
using ThemeFiles::File;

// The themes as they were when they were first asked for; Qt keeps them in the same way.
class Themes
{
public:
    const ThemeFolders &operator[](const QString &name)
    {
        if (m_generation != ThemeState::generation()) {
            m_themes.clear();
            m_generation = ThemeState::generation();
        }
        std::shared_ptr<const ThemeFolders> &theme = m_themes[name];
        if (!theme)
            theme = std::make_shared<const ThemeFolders>(name);
        return *theme;
    }

private:
    QHash<QString, std::shared_ptr<const ThemeFolders>> m_themes;
    quint64 m_generation = 0;
};

Themes &themes()
{
    static Themes themes;
    return themes;
}

QVector<File> filesIn(const ThemeFolders &theme, const QString &name, bool isWholeName)
{
    QVector<File> files;
    for (const ThemeFolders::Place &place : theme.placesOf(name)) {
        if (!isWholeName && place.folder->isForWholeNames)
            continue;
        const QString path = place.path + name;
        const QString picture = path + QLatin1String(".png");
        const QString drawing = path + QLatin1String(".svg");
        if (QFileInfo::exists(picture))
            files.prepend({picture, *place.folder});
        else if (QFileInfo::exists(drawing))
            files.append({drawing, *place.folder});
    }
    return files;
}

// Without what stands behind the last dash; null for one without a dash.
QString shortened(const QString &name)
{
    const int dash = name.lastIndexOf(QLatin1Char('-'));
    return dash < 0 ? QString() : name.left(dash);
}

// A shorter name in each theme before the next theme.
QVector<File> filesByNames(const QString &themeName, const QString &name, QStringList *visited)
{
    visited->append(themeName);
    const ThemeFolders &named = themes()[themeName];
    const ThemeFolders &theme = named.isValid() ? named : themes()[QIcon::fallbackThemeName()];
    for (QString shorter = name; !shorter.isNull(); shorter = shortened(shorter)) {
        const QVector<File> files = filesIn(theme, shorter, true);
        if (!files.isEmpty())
            return files;
    }
    const QStringList parents = theme.parents(ThemeRules::NamesFirst);
    for (const QString &parent : parents) {
        if (visited->contains(parent.trimmed()))
            continue;
        const QVector<File> files = filesByNames(parent.trimmed(), name, visited);
        if (!files.isEmpty())
            return files;
    }
    return {};
}

QVector<File> filesOfOneName(const QString &themeName, const QString &name, bool isWholeName,
                             QStringList *visited)
{
    visited->append(themeName);
    const ThemeFolders &theme = themes()[themeName];
    if (!theme.isValid())
        return {};
    QVector<File> files = filesIn(theme, name, isWholeName);
    const QStringList parents = theme.parents(ThemeRules::ParentsFirst);
    for (auto parent = parents.cbegin(); files.isEmpty() && parent != parents.cend(); ++parent) {
        if (!visited->contains(parent->trimmed()))
            files = filesOfOneName(parent->trimmed(), name, isWholeName, visited);
    }
    return files;
}

// Each name in all themes before the next name; of another theme when the theme has none of them.
QVector<File> filesByParents(const QString &themeName, const QString &name, QStringList *visited)
{
    QVector<File> files;
    for (QString shorter = name; files.isEmpty() && !shorter.isNull(); shorter = shortened(shorter)) {
        QStringList visitedForThis;
        QStringList *const list = shorter == name ? visited : &visitedForThis;
        files = filesOfOneName(themeName, shorter, shorter == name, list);
        if (!themes()[themeName].isValid())
            break;
    }
    return files;
}

QVector<File> filesOfThemes(const QString &name, ThemeRules rules)
{
    QVector<File> files;
    QStringList visited;
    const QString theme = QIcon::themeName();
    const QString last = QIcon::fallbackThemeName();
    if (rules == ThemeRules::NamesFirst)
        return theme.isEmpty() ? files : filesByNames(theme, name, &visited);
    if (!theme.isEmpty())
        files = filesByParents(theme, name, &visited);
    return files.isEmpty() && !last.isEmpty() ? filesByParents(last, name, &visited) : files;
}

QVector<File> unsortedFiles(const QString &name)
{
    ThemeFolder folder;
    folder.kind = ThemeFolder::Kind::Unsorted;
    const QStringList searchPaths = QIcon::fallbackSearchPaths();
    for (const QString &searchPath : searchPaths) {
        for (const char *suffix : {".png", ".xpm", ".svg"}) {
            const QString path = searchPath + QLatin1Char('/') + name + QLatin1String(suffix);
            if (QFileInfo::exists(path))
                return {{path, folder}};
        }
    }
    return {};
}

const File *nearest(const QVector<File> &files, int edge, int scale)
{
    const File *nearest = nullptr;
    int least = INT_MAX;
    for (const File &file : files) {
        const int distance = file.folder.distanceTo(edge, scale);
        if (distance < least) {
            least = distance;
            nearest = &file;
        }
    }
    return nearest;
}

// One that is made smaller looks better than one that is made larger.
const File *nearestOrLarger(const QVector<File> &files, int edge, int scale)
{
    const File *nearest = nullptr;
    int least = INT_MIN;
    for (const File &file : files) {
        const int difference = file.folder.differenceFrom(edge, scale);
        if ((least <= 0 && difference > least) || difference == 0
            || (difference > 0 && difference < std::abs(least))) {
            least = difference;
            nearest = &file;
        }
    }
    return nearest;
}

} // namespace

QVector<File> ThemeFiles::find(const QString &name, ThemeRules rules)
{
    const QVector<File> files = filesOfThemes(name, rules);
    return files.isEmpty() ? unsortedFiles(name) : files;
}

const File *ThemeFiles::forSize(const QVector<File> &files, const QSize &size, int scale, ThemeRules rules)
{
    if (files.isEmpty())
        return nullptr;
    const int edge = std::min(size.width(), size.height());
    for (const File &file : files) {
        if (file.folder.isFor(edge, scale))
            return &file;
    }
    const bool isLargerFirst = rules == ThemeRules::LargerFirst;
    const File *const file =
        isLargerFirst ? nearestOrLarger(files, edge, scale) : nearest(files, edge, scale);
    return file ? file : &files.constFirst();
}
