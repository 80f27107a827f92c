// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QIcon>
#include <QMap>
#include <QPixmap>
#include <QString>

/// Makes the pictures of icons; remembers nothing.
namespace IconDrawing {

/**
 * The picture of \a icon that fits into \a pixels, at most as large.
 *
 * @param pixels size in the pixels of the device
 * @param ratio pixels of the device for one logical pixel, which may be another one than the
 *              application's
 * @return a picture with a pixel ratio of 1; null when the icon has none
 */
QPixmap picture(const QIcon &icon, const QSize &pixels, qreal ratio, QIcon::Mode mode, QIcon::State state);

/// Lays \a emblems, names of theme icons, into the corners of \a picture.
void layEmblems(QPixmap &picture, const QMap<Qt::Corner, QString> &emblems, qreal ratio, QIcon::Mode mode);

} // namespace IconDrawing
