// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <VelSettings.h>

#include "EmptiedSettings.h"
#include "SettingsFile.h"

#include <frame/QtMajor.h>

#include <QFileInfo>
#include <QSettings>

#include <cstdio>

#include <utime.h>

static_assert(VelSettings::LargestFile == SettingsFile::LargestSize);

namespace {

// The number under which Qt knows the format, the same for the whole process.
QSettings::Format themeRcFormat = QSettings::InvalidFormat;

void registerFormat()
{
    if (themeRcFormat != QSettings::InvalidFormat)
        return;
    themeRcFormat = QSettings::registerFormat(QStringLiteral("themerc"), SettingsFile::read,
                                              EmptiedSettings::write, Qt::CaseSensitive);
    if (themeRcFormat == QSettings::InvalidFormat)
        std::fprintf(stderr, "VelSettings: custom format %d NOT registered\n", int(themeRcFormat));
}

std::unique_ptr<QSettings> openSettings(const QString &path)
{
    auto settings = std::make_unique<QSettings>(path, themeRcFormat);
    QtMajor::setLocaleEncoding(*settings);
    return settings;
}

// Why the file cannot be opened, with "%s" for its path; null when nothing is in the way. A folder
// is left to QSettings, which refuses it as well.
const char *obstacle(const QFileInfo &info)
{
    if (!info.isReadable())
        return "Permission Denied for '%s'!";
    if (!info.isFile() && !info.isDir())
        return "No regular file: '%s'!";
    if (info.isFile() && info.size() > VelSettings::LargestFile)
        return "Too large: '%s'!";
    return nullptr;
}

} // namespace

VelSettings::VelSettings(const QString &path)
{
    parsed = ParseConfigFile(path);
}

VelSettings::~VelSettings()
{
    close();
}

bool VelSettings::ParseConfigFile(const QString &path)
{
    const QFileInfo info(path);
    if (!info.exists())
        return false;
    if (const char *const message = obstacle(info)) {
        qCritical(message, path.toLocal8Bit().constData());
        return false;
    }
    registerFormat();

    close();
    settings = openSettings(info.absoluteFilePath());
    if (EmptiedSettings::isLeft(*settings) && EmptiedSettings::drop(*settings))
        settings = openSettings(info.absoluteFilePath());
    if (settings->status() != QSettings::NoError || SettingsFile::isUnread(settings->fileName())) {
        qCritical("Cant register format!");
        return false;
    }
    fileName = info.absoluteFilePath();
    return true;
}

bool VelSettings::isParsed() const
{
    return parsed;
}

QVariant VelSettings::value(const QString &key, const QVariant &defaultValue) const
{
    return parsed && settings ? settings->value(key, defaultValue) : defaultValue;
}

void VelSettings::setValue(const QString &key, const QVariant &value)
{
    if (settings)
        settings->setValue(key, value);
}

void VelSettings::remove(const QString &key)
{
    if (!settings)
        return;
    settings->remove(key);
    mayBeEmptied = true;
}

void VelSettings::sync(bool touch)
{
    if (!settings || fileName.isEmpty())
        return;
    if (touch)
        utime(fileName.toLocal8Bit().constData(), nullptr);
    const SettingsFile::PipeGuard guard(settings->fileName());
    settings->sync();
}

// Lets go of the file. QSettings writes what this object left pending; a sync here would write
// the edits of other objects on the file as well.
void VelSettings::close()
{
    if (!settings)
        return;
    const SettingsFile::PipeGuard guard(settings->fileName());
    if (mayBeEmptied && settings->allKeys().isEmpty()) {
        if (settings->status() == QSettings::NoError)
            settings->sync();
        if (EmptiedSettings::isLeft(*settings))
            EmptiedSettings::drop(*settings);
    }
    mayBeEmptied = false;
    settings.reset();
}
