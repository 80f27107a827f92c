// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSettings>

class QIODevice;

/**
 * Removing the last key, which the format refuses to write.
 *
 * QSettings keeps an edit that was not written in its process-wide cache of files. There it
 * would fail every later object on that file, hide the file's keys from it, and drop them for
 * good with its first write. These functions take such an edit out of the cache.
 */
namespace EmptiedSettings {

/// The format's write function as it is registered; while drop() runs it writes the file as it is.
bool write(QIODevice &device, const QSettings::SettingsMap &map);

/// Whether a refused removal of all keys is left in the file that \a settings shares.
bool isLeft(const QSettings &settings);

/**
 * Takes the refused removal out of the cache: objects made later read the file anew.
 *
 * The cache gives up its edits for a successful write alone, so the file is replaced by a copy
 * of itself.
 * @return false when that cannot be written; the edit then stays in the cache.
 */
bool drop(QSettings &settings);

} // namespace EmptiedSettings
