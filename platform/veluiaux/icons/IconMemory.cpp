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

bool IconMemory::findPicture(const QString &key, QPixmap *picture) const
{
    return QPixmapCache::find(pictureKey(key), picture);
}

void IconMemory::keepPicture(const QString &key, const QPixmap &picture) const
{
    QPixmapCache::insert(pictureKey(key), picture);
}

QString IconMemory::pictureKey(const QString &key) const
{
    // Others use the cache of pixmaps too, and its pictures outlive a change of the theme.
    return QStringLiteral("velicon/") + QString::number(m_generation) + QLatin1Char('/') + key;
}
