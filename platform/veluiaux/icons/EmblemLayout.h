// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QPoint>
#include <QRect>
#include <QSize>
#include <Qt>

/// Where emblems stand on an icon.
namespace EmblemLayout {

/// The edge of an emblem on an icon whose shorter edge is \a extent, both in logical pixels.
int extent(int extent);

/**
 * The square of an emblem, in the pixels of the pixmap it is drawn on.
 *
 * @param pixmap size of the pixmap
 * @param ratio pixels of the pixmap for one logical pixel
 * @param corner the corner of the pixmap, whatever the direction of the layout
 */
QRect square(const QSize &pixmap, qreal ratio, Qt::Corner corner);

/// Where what is of \a size stands in the corner \a corner of \a rect.
QPoint place(const QSize &size, const QRect &rect, Qt::Corner corner);

} // namespace EmblemLayout
