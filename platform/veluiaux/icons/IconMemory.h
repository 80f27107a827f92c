// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCache>
#include <QPixmap>
#include <QSize>
#include <QString>

/**
 * What was found out about icons, shared by all that are made of the same parts.
 *
 * The keys are the callers'; they name all that the answer depends on, but not the theme:
 * everything is forgotten when that changes. Bounded; the pixmaps lie in QPixmapCache, which
 * lets go of those that nobody asks for.
 */
class IconMemory
{
public:
    /// The one memory of the process, without anything of an earlier theme.
    static IconMemory &instance();

    bool findPixmap(const QString &key, QPixmap *pixmap) const;
    void keepPixmap(const QString &key, const QPixmap &pixmap) const;

    /// Null when nothing is known; good until the next call.
    const QSize *findSize(const QString &key) const { return m_sizes.object(key); }
    void keepSize(const QString &key, const QSize &size) { m_sizes.insert(key, new QSize(size)); }

    /// Whether the icon of the parts \a key has no pixmap. Null when that is not known.
    const bool *findEmptiness(const QString &key) const { return m_emptiness.object(key); }
    void keepEmptiness(const QString &key, bool empty) { m_emptiness.insert(key, new bool(empty)); }

private:
    IconMemory() = default;
    QString pixmapKey(const QString &key) const;

    quint64 m_generation = 0;
    QCache<QString, QSize> m_sizes{4096}; // the caches own what is inserted
    QCache<QString, bool> m_emptiness{4096};
};
