// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconTestCase.h"

#include <QPainter>

void IconTestCase::init()
{
    TestCase::init();
    m_theme = std::make_unique<IconThemeFolder>(folder() + QStringLiteral("/icons"), QStringLiteral("first"));
    m_theme->write();
    m_theme->add(QStringLiteral("red"), Qt::red);
    m_theme->add(QStringLiteral("emblem-blue"), Qt::blue);
    m_theme->add(QStringLiteral("emblem-green"), Qt::green);
    m_theme->use();
}

QImage IconTestCase::painted(const QIcon &icon, int size, qreal ratio, Qt::LayoutDirection direction)
{
    QImage image(qRound(size * ratio), qRound(size * ratio), QImage::Format_ARGB32_Premultiplied);
    image.setDevicePixelRatio(ratio);
    image.fill(Qt::white);
    QPainter painter(&image);
    painter.setLayoutDirection(direction);
    icon.paint(&painter, QRect(0, 0, size, size));
    return image;
}

QIcon IconTestCase::plainIcon(const QColor &color)
{
    QPixmap pixmap(32, 32);
    pixmap.fill(color);
    return QIcon(pixmap);
}
