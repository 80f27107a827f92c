// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QRect>
#include <QSize>
#include <Qt>

/// Where emblems stand on an icon.
namespace EmblemLayout {

/// The edge of an emblem on an icon whose shorter edge is \a extent, both in logical pixels.
int extent(int extent);

/**
 * The square of an emblem, in the pixels of the picture it is drawn on.
 *
 * @param picture size of the picture
 * @param ratio pixels of the picture for one logical pixel
 * @param corner the corner of the picture, whatever the direction of the layout
 */
QRect square(const QSize &picture, qreal ratio, Qt::Corner corner);

} // namespace EmblemLayout
