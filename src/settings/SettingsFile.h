// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSettings>

class QIODevice;

/**
 * What QSettings may do with a file of the format.
 *
 * QSettings opens whatever stands under the name, and goes on to write when reading has failed:
 * all that it has not read would be gone. These functions see to it that neither does harm.
 */
namespace SettingsFile {

/// A larger file is not read, and none is written, in bytes.
constexpr qint64 LargestSize = 16 * 1024 * 1024;

/// Whether \a device is small enough and, when it is a file, a regular one.
bool isReadable(const QIODevice &device);

/**
 * The format's read function as it is registered: ThemeRcFormat::read() of what isReadable().
 *
 * When that fails, the file counts as unread until it was read.
 */
bool read(QIODevice &device, QSettings::SettingsMap &map);

/// ThemeRcFormat::write(), but not over a file that is unread or no regular one, and no more than
/// could be read again.
bool write(QIODevice &device, const QSettings::SettingsMap &map);

/// Whether the last reading of the file \a path failed.
bool isUnread(const QString &path);

/**
 * Keeps a named pipe from making QSettings wait for ever while the object lives.
 *
 * A file can become a pipe at any time; with both its ends open, opening it returns at once.
 */
class PipeGuard
{
public:
    explicit PipeGuard(const QString &path);
    ~PipeGuard();
    Q_DISABLE_COPY(PipeGuard)

private:
    int m_descriptor = -1;
};

} // namespace SettingsFile
