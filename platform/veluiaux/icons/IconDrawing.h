// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QIcon>
#include <QMap>
#include <QPixmap>
#include <QString>

/// Makes the pictures of icons; remembers nothing.
namespace IconDrawing {

/// How a picture fills the pixels that it is made for.
enum class Fit {
    AtMost, ///< smaller where the icon has no picture as large
    Exactly ///< scaled where the icon has no picture of that size
};

/**
 * The picture of \a icon for \a pixels of the device, with a pixel ratio of 1; null when the
 * icon has none.
 */
QPixmap picture(const QIcon &icon, const QSize &pixels, Fit fit, QIcon::Mode mode, QIcon::State state);

/// Lays \a emblems, names of theme icons, into the corners of \a picture, which has \a ratio
/// pixels for one logical pixel.
void layEmblems(QPixmap &picture, const QMap<Qt::Corner, QString> &emblems, qreal ratio, QIcon::Mode mode);

} // namespace IconDrawing
