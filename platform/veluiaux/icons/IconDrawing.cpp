// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconDrawing.h"

#include "EmblemLayout.h"
#include "QtMajor.h"

#include <QBuffer>
#include <QGuiApplication>
#include <QImageReader>
#include <QPainter>
#include <QtMath>

namespace {

/// The pixel ratio at which QIcon::pixmap() makes its pixmaps.
qreal ratioOfQt()
{
    return QtMajor::hasHighDpiPixmaps() ? qGuiApp->devicePixelRatio() : 1.0;
}

QPixmap fitted(const QPixmap &pixmap, const QSize &pixels, IconDrawing::Fit fit)
{
    if (fit == IconDrawing::Fit::AtMost || pixmap.isNull() || pixmap.size() == pixels)
        return pixmap;
    return pixmap.scaled(pixels, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
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
    return fitted(pixmap, pixels, fit);
}

// QIcon parses a drawing when it is made, and once more for each pixmap.
QPixmap IconDrawing::drawing(const QByteArray &bytes, const QSize &pixels, Fit fit)
{
    QBuffer buffer;
    buffer.setData(bytes);
    buffer.open(QIODevice::ReadOnly);
    QImageReader reader(&buffer, QByteArrayLiteral("svg"));
    QSize size = reader.size();
    if (size.isEmpty())
        return QPixmap();
    size.scale(pixels, Qt::KeepAspectRatio);
    if (size.isEmpty())
        return QPixmap();
    reader.setScaledSize(size);
    return fitted(QPixmap::fromImage(reader.read()), pixels, fit);
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
