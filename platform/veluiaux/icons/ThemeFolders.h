// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "QtMajor.h"
#include "ThemeCache.h"

#include <QSize>
#include <QString>
#include <QStringList>
#include <QVector>

#include <memory>
#include <vector>

/// A folder of a theme, and which sizes the icons in it are for.
struct ThemeFolder
{
    enum class Kind {
        Fixed,
        Scalable,
        Threshold,
        Unsorted ///< No theme's: a folder of pictures of any size.
    };

    QString path; ///< below the theme's own folder
    Kind kind = Kind::Threshold;
    int size = 0;
    int smallest = 0;
    int largest = 0;
    int threshold = 2;
    int scale = 1;
    bool isForWholeNames = false; ///< an icon of a shorter name than the wanted one would be a wrong one

    /// Whether its icons are meant for \a size, at the pixel ratio \a scale.
    bool isFor(int size, int scale) const;
    /// How far from it they are, and for what has but one size, above 0 when they are larger.
    int differenceFrom(int size, int scale) const;
    /// How far from it they are.
    int distanceTo(int size, int scale) const;
};

/**
 * What Qt knows of one icon theme: its folders in all search paths, and its parents.
 */
class ThemeFolders
{
public:
    /// Reads the description of the theme \a name.
    explicit ThemeFolders(const QString &name);

    /// Whether there is such a theme.
    bool isValid() const { return m_isValid; }
    /// The themes to look at when this one lacks an icon.
    QStringList parents(QtMajor::ThemeRules rules) const;

    /// A folder on disk with its place in the theme.
    struct Place
    {
        QString path; ///< with a trailing "/"
        const ThemeFolder *folder;
    };
    /// Where the icon \a name may have files, in the order in which Qt looks.
    QVector<Place> placesOf(const QString &name) const;

private:
    struct Root
    {
        QString path;
        std::unique_ptr<const ThemeCache> cache;
    };

    void readDescription(const QString &path);

    bool m_isValid = false;
    std::vector<Root> m_roots;
    QVector<ThemeFolder> m_folders;
    QStringList m_inherited;
};
