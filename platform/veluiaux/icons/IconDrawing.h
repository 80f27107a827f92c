// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QIcon>
#include <QMap>
#include <QPixmap>
#include <QSize>

/// Makes the pixmaps of icons; remembers nothing and looks nothing up.
namespace IconDrawing {

/// How a pixmap fills the pixels that it is made for.
enum class Fit {
    AtMost, ///< smaller where the icon has no pixmap as large
    Exactly ///< scaled where the icon has no pixmap of that size
};

/// What QIcon is asked for, and for which size and ratio it looks for a file.
struct Request
{
    QSize size;
    qreal ratio;
    QSize sizeOfFile;
    int scale;
};

/// What QIcon is asked for to have a pixmap for \a pixels of the device, at the ratio \a ratio.
Request request(const QSize &pixels, qreal ratio);

/**
 * The pixmap of \a icon for \a pixels of the device, asked for at the ratio \a ratio and with the ratio
 * that QIcon gives it; null when the icon has none.
 */
QPixmap pixmap(const QIcon &icon, const QSize &pixels, qreal ratio, Fit fit, QIcon::Mode mode,
               QIcon::State state);

/**
 * The pixmap of the SVG drawing \a bytes for \a pixels, as that of an icon of its file; null when it
 * cannot be drawn.
 */
QPixmap drawing(const QByteArray &bytes, const QSize &pixels, Fit fit);

/// Draws \a emblems over the corners of \a pixmap, which has \a ratio pixels for one logical
/// pixel, and says so of it; EmblemLayout says how large they may be. A null emblem is left out.
void overlayEmblems(QPixmap &pixmap, const QMap<Qt::Corner, QPixmap> &emblems, qreal ratio);

} // namespace IconDrawing
