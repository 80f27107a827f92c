// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EmblemLayout.h"

#include <QtGlobal>

int EmblemLayout::extent(int extent)
{
    // The sizes in which themes draw emblems; others would be blurred.
    for (const int size : {128, 64, 48, 32, 22, 16, 8}) {
        if (size <= extent / 2)
            return size;
    }
    return extent / 2;
}

QRect EmblemLayout::square(const QSize &pixmap, qreal ratio, Qt::Corner corner)
{
    const int logical = qRound(qMin(pixmap.width(), pixmap.height()) / ratio);
    const int edge = qRound(extent(logical) * ratio);
    const QSize size(edge, edge);
    return QRect(place(size, QRect(QPoint(), pixmap), corner), size);
}

QPoint EmblemLayout::place(const QSize &size, const QRect &rect, Qt::Corner corner)
{
    const bool right = corner == Qt::TopRightCorner || corner == Qt::BottomRightCorner;
    const bool bottom = corner == Qt::BottomLeftCorner || corner == Qt::BottomRightCorner;
    return QPoint(rect.x() + (right ? rect.width() - size.width() : 0),
                  rect.y() + (bottom ? rect.height() - size.height() : 0));
}
