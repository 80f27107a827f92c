// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSettings>

class QIODevice;

/**
 * The desktop's settings format: key=value lines below one bracketed section header.
 *
 * Both functions fit QSettings::registerFormat(). Text is in the encoding of the locale.
 */
namespace ThemeRcFormat {

/**
 * Fills \a map with the bare keys of \a device and their values, each with its type, and with
 * the last section header under "SectionName".
 * @return false when the device is not open or gives an error before its end.
 */
bool read(QIODevice &device, QSettings::SettingsMap &map);

/**
 * Writes \a map to \a device: the section header, then the keys in the order of the map.
 *
 * Each line feed and carriage return in a key, a value or the section's name is written as a
 * blank, told in one line on standard error for each value that had any.
 * @return false, after a line on standard error, when the device is closed or read-only or when
 * the map is empty; false when the device does not take all of it.
 */
bool write(QIODevice &device, const QSettings::SettingsMap &map);

/**
 * Writes \a bytes to \a device, past its buffer too: QSaveFile puts half a file in the place of
 * the old one when the disk fills up only as the buffer is emptied.
 * @return whether all bytes were taken.
 */
bool writeThrough(QIODevice &device, const QByteArray &bytes);

} // namespace ThemeRcFormat
