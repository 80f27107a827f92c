// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FreeName.h"

#include "OnDisk.h"

#include <frame/EntryPath.h>

#include <QFile>

namespace FreeName {

namespace {

constexpr int LongestName = 255; // bytes

// As much of the \a stem as there is room for, and the \a end.
QString shortened(QString stem, const QString &end)
{
    while (stem.size() > 1 && QFile::encodeName(stem + end).size() > LongestName)
        stem.chop(stem.at(stem.size() - 1).isLowSurrogate() ? 2 : 1);
    return stem + end;
}

} // namespace

Name first(Kind kind, const std::function<bool(const QString &)> &taken)
{
    for (quint64 n = 0;; ++n) {
        const QString number = n == 0 ? QString() : QString::number(n);
        const QString fileName = kind == Kind::Folder
            ? QLatin1String("group") + number
            : EntryPath::entryNamed(QLatin1String("shortcut") + number);
        if (!taken(fileName))
            return {fileName, number};
    }
}

QString like(const QString &fileName, Kind kind, const std::function<bool(const QString &)> &taken)
{
    const int dot = kind == Kind::Folder ? -1 : fileName.lastIndexOf(QLatin1Char('.'));
    const QString stem = dot > 0 ? fileName.left(dot) : fileName;
    const QString suffix = fileName.mid(stem.size());
    for (quint64 n = 2;; ++n) {
        const QString name = shortened(stem, QLatin1Char('-') + QString::number(n) + suffix);
        if (!taken(name))
            return name;
    }
}

Name firstIn(const QString &folder, Kind kind)
{
    return first(kind, [&folder](const QString &fileName) {
        return OnDisk::exists(folder + QLatin1Char('/') + fileName);
    });
}

} // namespace FreeName
