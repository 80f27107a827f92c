// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconPixels.h"

#include <veluiaux/VelIcon.h>

#include <QDirIterator>
#include <QIcon>
#include <QPixmapCache>
#include <QSet>

namespace {

constexpr int Sample = 150;

QImage pixels(const QIcon &icon, const QSize &size, QIcon::Mode mode)
{
    // What Qt keeps there, ours would find.
    QPixmapCache::clear();
    return icon.pixmap(size, mode).toImage();
}

} // namespace

QStringList IconPixels::namesIn(const QString &folder)
{
    QSet<QString> names;
    QDirIterator files(folder, {QStringLiteral("*.png"), QStringLiteral("*.svg")}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (files.hasNext()) {
        files.next();
        names.insert(files.fileInfo().completeBaseName());
    }
    QStringList sorted = names.values();
    sorted.sort();
    if (qEnvironmentVariableIsSet("VEL_TEST_FULL"))
        return sorted;
    QStringList sample;
    for (int i = 0; i < Sample && !sorted.isEmpty(); ++i)
        sample.append(sorted.at(int(qint64(i) * sorted.size() / Sample)));
    return sample;
}

QString IconPixels::firstDifference(const QStringList &names)
{
    for (const QString &name : names) {
        const QIcon qt = QIcon::fromTheme(name);
        const QIcon ours = VelIcon::fromTheme(name, QMap<Qt::Corner, QString>(), QIcon());
        for (const QSize size : {QSize(16, 16), QSize(22, 22), QSize(32, 32), QSize(48, 48), QSize(30, 20)}) {
            for (const QIcon::Mode mode : {QIcon::Normal, QIcon::Disabled}) {
                if (pixels(ours, size, mode) != pixels(qt, size, mode))
                    return QStringLiteral("%1 %2").arg(name).arg(size.width());
            }
        }
    }
    return QString();
}
