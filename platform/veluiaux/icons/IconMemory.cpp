// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconMemory.h"

#include "ThemeState.h"

#include <QPixmapCache>

IconMemory &IconMemory::instance()
{
    static IconMemory memory;
    const quint64 generation = ThemeState::generation();
    if (memory.m_generation != generation) {
        memory.m_sizes.clear();
        memory.m_emptiness.clear();
        memory.m_generation = generation;
    }
    return memory;
}

bool IconMemory::findPixmap(const QString &key, QPixmap *pixmap) const
{
    return QPixmapCache::find(pixmapKey(key), pixmap);
}

void IconMemory::keepPixmap(const QString &key, const QPixmap &pixmap) const
{
    QPixmapCache::insert(pixmapKey(key), pixmap);
}

QString IconMemory::pixmapKey(const QString &key) const
{
    // Others use the cache of pixmaps too, and its contents outlive a change of the theme.
    return QStringLiteral("velicon/") + QString::number(m_generation) + QLatin1Char('/') + key;
}
