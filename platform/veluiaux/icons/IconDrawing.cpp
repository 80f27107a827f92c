// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconDrawing.h"

#include "EmblemLayout.h"
#include "QtMajor.h"

#include <QBuffer>
#include <QImageReader>
#include <QPainter>
#include <QtMath>

namespace {

// The logical edge that comes to that many pixels, or else to as many as are left of them.
int logicalEdge(int pixels, qreal ratio)
{
    const int edge = qRound(pixels / ratio);
    return qRound(edge * ratio) > pixels ? qFloor(pixels / ratio) : edge;
}

QPixmap fitted(const QPixmap &pixmap, const QSize &pixels, IconDrawing::Fit fit)
{
    if (fit == IconDrawing::Fit::AtMost || pixmap.isNull() || pixmap.size() == pixels)
        return pixmap;
    return pixmap.scaled(pixels, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
}

} // namespace

IconDrawing::Request IconDrawing::request(const QSize &pixels, qreal ratio)
{
    const QSize size(logicalEdge(pixels.width(), ratio), logicalEdge(pixels.height(), ratio));
    return {size, ratio, QtMajor::sizeOfFile(size, ratio), qCeil(ratio)};
}

QPixmap IconDrawing::pixmap(const QIcon &icon, const QSize &pixels, qreal ratio, Fit fit, QIcon::Mode mode,
                            QIcon::State state)
{
    // Another ratio would have it copied, in vain where QIcon sets the same one again.
    return fitted(QtMajor::pixmap(icon, request(pixels, ratio).size, ratio, mode, state), pixels, fit);
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
    return fitted(QPixmap::fromImage(reader.read(), QtMajor::flagsOfDrawings()), pixels, fit);
}

void IconDrawing::overlayEmblems(QPixmap &pixmap, const QMap<Qt::Corner, QPixmap> &emblems, qreal ratio)
{
    pixmap.setDevicePixelRatio(1);
    QPainter painter(&pixmap);
    for (auto it = emblems.cbegin(); it != emblems.cend(); ++it) {
        const QRect square = EmblemLayout::square(pixmap.size(), ratio, it.key());
        QPixmap emblem = it.value();
        emblem.setDevicePixelRatio(1);
        painter.drawPixmap(EmblemLayout::place(emblem.size(), square, it.key()), emblem);
    }
    painter.end();
    pixmap.setDevicePixelRatio(ratio);
}
