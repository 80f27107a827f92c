// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconDrawing.h"

#include "EmblemLayout.h"

#include <QGuiApplication>
#include <QPainter>
#include <QtMath>

namespace {

/// The pixel ratio at which QIcon::pixmap() makes its pixmaps.
qreal ratioOfQt()
{
    return QCoreApplication::testAttribute(Qt::AA_UseHighDpiPixmaps) ? qGuiApp->devicePixelRatio() : 1.0;
}

} // namespace

IconDrawing::Request IconDrawing::request(const QSize &pixels)
{
    // Asked for a logical size, QIcon multiplies it by its own ratio.
    const qreal ratio = ratioOfQt();
    return {QSize(qFloor(pixels.width() / ratio), qFloor(pixels.height() / ratio)), qCeil(ratio)};
}

QPixmap IconDrawing::pixmap(const QIcon &icon, const QSize &pixels, Fit fit, QIcon::Mode mode,
                            QIcon::State state)
{
    QPixmap pixmap = icon.pixmap(request(pixels).size, mode, state);
    pixmap.setDevicePixelRatio(1);
    if (fit == Fit::Exactly && !pixmap.isNull() && pixmap.size() != pixels)
        pixmap = pixmap.scaled(pixels, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    return pixmap;
}

void IconDrawing::overlayEmblems(QPixmap &pixmap, const QMap<Qt::Corner, QPixmap> &emblems, qreal ratio)
{
    QPainter painter(&pixmap);
    for (auto it = emblems.cbegin(); it != emblems.cend(); ++it) {
        const QRect square = EmblemLayout::square(pixmap.size(), ratio, it.key());
        QPixmap emblem = it.value();
        emblem.setDevicePixelRatio(1);
        painter.drawPixmap(EmblemLayout::place(emblem.size(), square, it.key()), emblem);
    }
}
