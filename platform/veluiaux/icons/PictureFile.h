// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

/// Judges picture files without decoding them.
namespace PictureFile {

/**
 * Whether an icon may be made of the file \a path and of its variants for other pixel ratios.
 *
 * No picture in it may be larger than PictureLimits says, and a drawing may read no other file. What
 * is no picture at all is left to whoever reads it.
 */
bool isSafe(const QString &path);

/// The same for a file of an icon theme, which mostly is a small one of the usual kinds: cheap for those.
bool isSafeOfTheme(const QString &path);

/// The contents of a drawing, not compressed; none where no icon may be made of it.
std::optional<QByteArray> readSafeDrawing(const QString &path);

} // namespace PictureFile
