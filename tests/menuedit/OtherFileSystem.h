// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QFile>
#include <QString>

#include <sys/stat.h>
#include <unistd.h>

/// A folder on another file system than the temporary one, or an empty text.
inline QString otherFileSystem(const QString &folder)
{
    struct stat ours = {};
    struct stat other = {};
    if (stat(QFile::encodeName(folder).constData(), &ours) != 0 || stat("/dev/shm", &other) != 0
        || ours.st_dev == other.st_dev || access("/dev/shm", W_OK) != 0)
        return QString();
    return QStringLiteral("/dev/shm");
}
