// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "IconDrawing.h"
#include "IconLookup.h"
#include "QtMajor.h"

#include <QIcon>
#include <QIconEngine>
#include <QMap>
#include <QString>

/**
 * The engine of an icon that is looked up when it is needed.
 *
 * Holds only the parts of the icon. What they come to is kept in IconMemory for all engines
 * made of the same parts, so that a pixmap that is known already is found without a look at
 * the theme.
 */
class LazyIconEngine : public QIconEngine
{
public:
    /// The icon \a name with \a emblems; \a plain where there is no such icon or no name.
    LazyIconEngine(const QString &name, const QMap<Qt::Corner, QString> &emblems, const QIcon &plain);
    ~LazyIconEngine() override;

    void paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State state) override;
    QSize actualSize(const QSize &size, QIcon::Mode mode, QIcon::State state) override;
    QPixmap pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state) override;
    QString key() const override;
    QIconEngine *clone() const override;
    QList<QSize> availableSizes(QIcon::Mode mode, QIcon::State state) VEL_ICON_ENGINE_CONST override;
    QString iconName() VEL_ICON_ENGINE_CONST override;
    void virtual_hook(int id, void *data) override;

protected:
    LazyIconEngine(const LazyIconEngine &other) = default;

private:
    /// A pixmap for \a pixels, drawn for the pixel ratio \a ratio.
    QPixmap scaledPixmap(const QSize &pixels, qreal ratio, IconDrawing::Fit fit, QIcon::Mode mode,
                         QIcon::State state) const;
    /// The pixmaps of the emblems for a pixmap of \a size; null ones where the theme lacks them.
    QMap<Qt::Corner, QPixmap> emblemPixmaps(const QSize &size, qreal ratio, QIcon::Mode mode) const;
    /// The icon without emblems, as the theme now has it.
    const QIcon &base() const;
    /// Looks up what it is made of, unless that is known for the theme as it is now.
    void lookUp() const;
    /// A pixmap of it; null where the file for it is damaged or too large to be read.
    QPixmap basePixmap(const QSize &pixels, qreal ratio, IconDrawing::Fit fit, QIcon::Mode mode,
                       QIcon::State state) const;
    bool isEmpty() const;
    /// Names the parts, without the emblems, for what is remembered.
    const QString &baseKey() const;
    /// Names the parts with all that a pixmap or a size of them depends on but the emblems.
    QString sizedKey(const QSize &size, QIcon::Mode mode, QIcon::State state) const;

    const QString m_name;
    const QMap<Qt::Corner, QString> m_emblems;
    const QIcon m_plain;

    mutable IconLookup::Found m_base;
    mutable quint64 m_baseGeneration = 0;
    mutable QString m_baseKey;
};
