// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class QKeySequence;

namespace GlobalShortcuts {

/// The most bytes that a shortcut file may have; a larger one is not read.
inline constexpr qint64 LargestFile = 16 * 1024 * 1024;

/// The path of the window manager's shortcut file for this session; empty when there is none.
QString filePath();

/**
 * Looks a key sequence up in a shortcut file.
 *
 * @param path the file
 * @param sequence the sequence, compared as a whole
 * @return the name of the action bound to it; null when there is none or nothing can be read
 */
QString find(const QString &path, const QKeySequence &sequence);

} // namespace GlobalShortcuts
