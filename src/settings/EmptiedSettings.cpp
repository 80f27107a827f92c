// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EmptiedSettings.h"

#include "SettingsFile.h"
#include "ThemeRcFormat.h"

#include <QFile>
#include <QScopedValueRollback>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

// The file that drop() keeps as it is; empty while it does not run.
QString &keptFile()
{
    static QString path;
    return path;
}

bool copyFile(const QString &path, QIODevice &device)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly) || !SettingsFile::isReadable(file))
        return false;
    const QByteArray bytes = file.readAll();
    return file.atEnd() && ThemeRcFormat::writeThrough(device, bytes);
}

// The cache compares times to tell whether its copy of a file is still good.
void changeTime(const QString &path)
{
    constexpr long Millisecond = 1000000;
    constexpr long Second = 1000 * Millisecond;
    const QByteArray name = QFile::encodeName(path);
    struct stat status = {};
    if (stat(name.constData(), &status) != 0)
        return;
    timespec times[2] = {{0, UTIME_OMIT}, status.st_mtim};
    times[1].tv_nsec += Millisecond;
    if (times[1].tv_nsec >= Second) {
        times[1].tv_nsec -= Second;
        ++times[1].tv_sec;
    }
    utimensat(AT_FDCWD, name.constData(), times, 0);
}

} // namespace

namespace EmptiedSettings {

bool write(QIODevice &device, const QSettings::SettingsMap &map)
{
    return keptFile().isEmpty() ? SettingsFile::write(device, map) : copyFile(keptFile(), device);
}

bool isLeft(const QSettings &settings)
{
    return settings.status() == QSettings::AccessError && settings.allKeys().isEmpty();
}

bool drop(QSettings &settings)
{
    const QString path = settings.fileName();
    const QString key = QStringLiteral("SectionName");
    const QScopedValueRollback<QString> kept(keptFile(), path);
    settings.setValue(key, QString());
    // An object of its own, since the status of the other one never becomes good again.
    QSettings writer(path, settings.format());
    if (writer.status() != QSettings::NoError) {
        writer.remove(key);
        return false;
    }
    changeTime(path);
    return true;
}

} // namespace EmptiedSettings
