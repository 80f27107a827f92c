// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SettingsFile.h"

#include "ThemeRcFormat.h"

#include <QFileInfo>
#include <QSet>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

// The files whose last reading failed.
QSet<QString> &unreadFiles()
{
    static QSet<QString> files;
    return files;
}

QString nameOf(const QIODevice &device)
{
    const auto *const file = qobject_cast<const QFileDevice *>(&device);
    return file ? file->fileName() : QString();
}

} // namespace

namespace SettingsFile {

bool isReadable(const QIODevice &device)
{
    if (device.size() > LargestSize)
        return false;
    const auto *const file = qobject_cast<const QFileDevice *>(&device);
    if (!file || file->handle() < 0)
        return true;
    struct stat status = {};
    return fstat(file->handle(), &status) == 0 && S_ISREG(status.st_mode);
}

bool read(QIODevice &device, QSettings::SettingsMap &map)
{
    const bool isRead = isReadable(device) && ThemeRcFormat::read(device, map);
    if (isRead)
        unreadFiles().remove(nameOf(device));
    else
        unreadFiles().insert(nameOf(device));
    return isRead;
}

bool write(QIODevice &device, const QSettings::SettingsMap &map)
{
    const QFileInfo target(nameOf(device));
    if (target.exists() && (!target.isFile() || isUnread(target.filePath())))
        return false;
    return ThemeRcFormat::write(device, map) && device.pos() <= LargestSize;
}

bool isUnread(const QString &path)
{
    // QSettings has nothing read of a file that is empty.
    return unreadFiles().contains(path) && QFileInfo(path).size() > 0;
}

PipeGuard::PipeGuard(const QString &path)
{
    const QByteArray name = QFile::encodeName(path);
    struct stat status = {};
    if (stat(name.constData(), &status) == 0 && S_ISFIFO(status.st_mode))
        m_descriptor = open(name.constData(), O_RDWR | O_NONBLOCK | O_CLOEXEC);
}

PipeGuard::~PipeGuard()
{
    if (m_descriptor >= 0)
        close(m_descriptor);
}

} // namespace SettingsFile
