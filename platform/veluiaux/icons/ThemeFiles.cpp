// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ThemeFiles.h"

#include "ThemeState.h"

#include <QFileInfo>
#include <QHash>
#include <QIcon>

#include <algorithm>
#include <climits>
#include <memory>

namespace {

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
        if (!theme) {
            theme = std::make_shared<const ThemeFolders>(name);
            if (!theme->isValid())
                theme = std::make_shared<const ThemeFolders>(QIcon::fallbackThemeName());
        }
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

QVector<File> filesIn(const ThemeFolders &theme, const QString &name)
{
    QVector<File> files;
    for (const ThemeFolders::Place &place : theme.placesOf(name)) {
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

QVector<File> filesOf(const QString &themeName, const QString &name, QStringList *visited)
{
    visited->append(themeName);
    const ThemeFolders &theme = themes()[themeName];
    for (QString shorter = name;;) {
        const QVector<File> files = filesIn(theme, shorter);
        const int dash = shorter.lastIndexOf(QLatin1Char('-'));
        if (!files.isEmpty())
            return files;
        if (dash < 0)
            break;
        shorter.truncate(dash);
    }
    const QStringList parents = theme.parents();
    for (const QString &parent : parents) {
        if (visited->contains(parent.trimmed()))
            continue;
        const QVector<File> files = filesOf(parent.trimmed(), name, visited);
        if (!files.isEmpty())
            return files;
    }
    return {};
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

} // namespace

QVector<File> ThemeFiles::find(const QString &name)
{
    QVector<File> files;
    QStringList visited;
    if (!QIcon::themeName().isEmpty())
        files = filesOf(QIcon::themeName(), name, &visited);
    return files.isEmpty() ? unsortedFiles(name) : files;
}

const File *ThemeFiles::forSize(const QVector<File> &files, const QSize &size, int scale)
{
    const int edge = std::min(size.width(), size.height());
    const File *nearest = nullptr;
    int least = INT_MAX;
    for (const File &file : files) {
        if (file.folder.isFor(edge, scale))
            return &file;
        const int distance = file.folder.distanceTo(edge, scale);
        if (distance < least) {
            least = distance;
            nearest = &file;
        }
    }
    return nearest ? nearest : files.isEmpty() ? nullptr : &files.constFirst();
}
