// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ThemeFolders.h"

#include <QSize>
#include <QString>
#include <QVector>

/**
 * The files that Qt takes for an icon of the theme.
 *
 * Qt looks for them by itself and does not tell which they are. This finds them by the same way:
 * the theme, its name without what stands behind the last dash and so on, and the theme's parents,
 * in the order that the rules say, and at last the folders of pictures that belong to no theme.
 */
namespace ThemeFiles {

/// A picture or drawing, and what it is for.
struct File
{
    QString path;
    ThemeFolder folder;

    bool isDrawing() const { return path.endsWith(QLatin1String(".svg")); }
};

/// All files of the icon \a name, the pictures before the drawings; empty when there is no such icon.
QVector<File> find(const QString &name, QtMajor::ThemeRules rules = QtMajor::themeRules());

/// The one of them that Qt takes for \a size, in pixels of the ratio \a scale; null for none.
const File *forSize(const QVector<File> &files, const QSize &size, int scale = 1,
                    QtMajor::ThemeRules rules = QtMajor::themeRules());

} // namespace ThemeFiles
