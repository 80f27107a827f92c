// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArrayList>

/**
 * What a program asks of the file system: the paths that are opened, and those whose status is asked for.
 *
 * The program's own open, openat, stat, lstat, fstatat and opendir stand in front of those of the C library,
 * for every library that the program loads.
 */
namespace CountedSystem {

/// From now on the calls are noted.
void begin();

/// The calls since then: "open PATH", "stat PATH".
QByteArrayList end();

} // namespace CountedSystem
