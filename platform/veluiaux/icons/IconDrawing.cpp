// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconDrawing.h"

#include "EmblemLayout.h"
#include "LazyIconEngine.h"

#include <QGuiApplication>
#include <QPainter>
#include <QtMath>

namespace {

/// The pixel ratio at which QIcon::pixmap() makes its pictures.
qreal ratioOfQt()
{
    return QCoreApplication::testAttribute(Qt::AA_UseHighDpiPixmaps) ? qGuiApp->devicePixelRatio() : 1.0;
}

/// Where a picture of \a size stands in \a square, which lies in \a corner.
QPoint placeInCorner(const QSize &size, const QRect &square, Qt::Corner corner)
{
    const bool right = corner == Qt::TopRightCorner || corner == Qt::BottomRightCorner;
    const bool bottom = corner == Qt::BottomLeftCorner || corner == Qt::BottomRightCorner;
    return QPoint(square.x() + (right ? square.width() - size.width() : 0),
                  square.y() + (bottom ? square.height() - size.height() : 0));
}

} // namespace

QPixmap IconDrawing::picture(const QIcon &icon, const QSize &pixels, Fit fit, QIcon::Mode mode,
                             QIcon::State state)
{
    // Asked for a logical size, QIcon multiplies it by its own ratio.
    const qreal ratio = ratioOfQt();
    const QSize size(qFloor(pixels.width() / ratio), qFloor(pixels.height() / ratio));
    QPixmap picture = icon.pixmap(size, mode, state);
    picture.setDevicePixelRatio(1);
    if (fit == Fit::Exactly && !picture.isNull() && picture.size() != pixels)
        picture = picture.scaled(pixels, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    return picture;
}

void IconDrawing::layEmblems(QPixmap &picture, const QMap<Qt::Corner, QString> &emblems, qreal ratio,
                             QIcon::Mode mode)
{
    QPainter painter(&picture);
    for (auto it = emblems.cbegin(); it != emblems.cend(); ++it) {
        const QRect square = EmblemLayout::square(picture.size(), ratio, it.key());
        const LazyIconEngine engine(it.value(), {}, QIcon());
        QPixmap emblem = engine.picture(square.size(), ratio, Fit::AtMost, mode, QIcon::Off);
        emblem.setDevicePixelRatio(1);
        painter.drawPixmap(placeInCorner(emblem.size(), square, it.key()), emblem);
    }
}
