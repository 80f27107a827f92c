// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OnDisk.h"

#include <QFile>
#include <QFileInfo>

#include <cerrno>
#include <memory>

#include <dirent.h>

bool OnDisk::exists(const QString &path)
{
    const QFileInfo info(path);
    return info.isSymLink() || info.exists();
}

// A QDir would ask for the status of every file.
std::optional<QSet<QString>> OnDisk::namesIn(const QString &folder)
{
    const std::unique_ptr<DIR, int (*)(DIR *)> directory(::opendir(QFile::encodeName(folder).constData()),
                                                         ::closedir);
    if (!directory)
        return std::nullopt;
    QSet<QString> names;
    errno = 0;
    while (const dirent *entry = ::readdir(directory.get()))
        names.insert(QFile::decodeName(entry->d_name));
    if (errno != 0)
        return std::nullopt;
    names.remove(QStringLiteral("."));
    names.remove(QStringLiteral(".."));
    return names;
}
