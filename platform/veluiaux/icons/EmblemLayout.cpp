// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EmblemLayout.h"

#include <QtMath>

int EmblemLayout::extent(int extent)
{
    // The sizes in which themes draw emblems; others would be blurred.
    for (const int size : {128, 64, 48, 32, 22, 16, 8}) {
        if (size <= extent / 2)
            return size;
    }
    return extent / 2;
}

QRect EmblemLayout::square(const QSize &picture, qreal ratio, Qt::Corner corner)
{
    const int logical = qRound(qMin(picture.width(), picture.height()) / ratio);
    const int edge = qRound(extent(logical) * ratio);
    const bool right = corner == Qt::TopRightCorner || corner == Qt::BottomRightCorner;
    const bool bottom = corner == Qt::BottomLeftCorner || corner == Qt::BottomRightCorner;
    return QRect(right ? picture.width() - edge : 0, bottom ? picture.height() - edge : 0, edge, edge);
}
