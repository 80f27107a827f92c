// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ThemeFiles.h"

#include <QIcon>
#include <QString>
#include <QVector>

#include <optional>

/// Finds icons by the names that desktop entries use.
namespace IconLookup {

/// An icon, and where the theme has it, its files.
struct Found
{
    QIcon icon; ///< null when there is none, and as long as its files are enough
    QVector<ThemeFiles::File> files;
    QString themeName; ///< the name by which Qt makes an icon of the files
    /// Whether Qt chooses among the files; or else something else does, in its own way.
    bool isChosenByQt = true;

    /// Whether the file that is drawn in \a size, in pixels of the ratio \a scale, may be read. Until
    /// then none of the theme's files was looked at.
    bool mayBeDrawn(const QSize &size, int scale) const;

    /// Whether Qt chooses one of its files, each of which a folder of a theme says the size of.
    bool isOfFiles() const;

    /// The size that Qt says that the icon has where \a size is asked for; none where only the file tells.
    std::optional<QSize> actualSize(const QSize &size) const;

    /// The drawing that Qt takes for \a size at the ratio 1; null where it takes something else.
    const ThemeFiles::File *drawing(const QSize &size) const;

    /// Has Qt make the icon where that was not done yet.
    void makeIcon();
};

/// The icon \a name: a theme name, one with the suffix of an image file, or an absolute path.
Found find(const QString &name);

/// The files that there are for the icon \a name, as above, to choose one from.
QVector<ThemeFiles::File> filesOf(const QString &name);

/// A text that is another one when \a name means another icon, as long as the theme stays.
QString identity(const QString &name);

} // namespace IconLookup
