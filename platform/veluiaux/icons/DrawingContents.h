// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

/// Judges the contents of an SVG file. Whoever reads a drawing reads every picture and file that it
/// names at once, whatever is to be drawn.
namespace DrawingContents {

/**
 * Whether the drawing in \a bytes, not compressed, names no other file, and all pictures in it are as
 * small as PictureLimits asks for. What is no drawing is safe.
 */
bool isSafe(const QByteArray &bytes);

} // namespace DrawingContents
