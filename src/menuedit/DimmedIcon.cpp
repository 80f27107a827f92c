// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DimmedIcon.h"

#include <QIcon>
#include <QIconEngine>
#include <QPainter>
#include <QPixmap>

namespace {

class DimmedIconEngine : public QIconEngine
{
public:
    explicit DimmedIconEngine(const QIcon &icon)
        : m_icon(icon)
    {
    }

    void paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State state) override
    {
        constexpr double Strength = 0.45;
        painter->save();
        painter->setOpacity(painter->opacity() * Strength);
        m_icon.paint(painter, rect, Qt::AlignCenter, mode, state);
        painter->restore();
    }

    QPixmap pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state) override
    {
        QPixmap pixmap(size);
        pixmap.fill(Qt::transparent);
        QPainter painter(&pixmap);
        paint(&painter, QRect(QPoint(), size), mode, state);
        return pixmap;
    }

    QIconEngine *clone() const override { return new DimmedIconEngine(*this); }

private:
    QIcon m_icon;
};

} // namespace

QIcon DimmedIcon::of(const QIcon &icon)
{
    return QIcon(new DimmedIconEngine(icon));
}
