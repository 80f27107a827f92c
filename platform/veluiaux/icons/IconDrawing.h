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

/// What QIcon is asked for, and at which ratio it looks for a file.
struct Request
{
    QSize size;
    int scale;
};

/// What QIcon is asked for to have a pixmap for \a pixels of the device.
Request request(const QSize &pixels);

/**
 * The pixmap of \a icon for \a pixels of the device, with a pixel ratio of 1; null when the
 * icon has none.
 */
QPixmap pixmap(const QIcon &icon, const QSize &pixels, Fit fit, QIcon::Mode mode, QIcon::State state);

/**
 * The pixmap of the SVG drawing \a bytes for \a pixels, as that of an icon of its file; null when it
 * cannot be drawn.
 */
QPixmap drawing(const QByteArray &bytes, const QSize &pixels, Fit fit);

/// Draws \a emblems over the corners of \a pixmap, which has \a ratio pixels for one logical
/// pixel; EmblemLayout says how large they may be. A null emblem is left out.
void overlayEmblems(QPixmap &pixmap, const QMap<Qt::Corner, QPixmap> &emblems, qreal ratio);

} // namespace IconDrawing
