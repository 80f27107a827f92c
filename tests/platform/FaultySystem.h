// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QByteArrayList>

/**
 * System calls that fail when a test asks for it.
 *
 * The program's own open, openat, write, fsync, rename, renameat, fchmod and fsetxattr stand in front
 * of those of the C library, for every library that the program loads.
 */
namespace FaultySystem {

/// From now on the call of that name fails with that error.
void failAt(const QByteArray &call, int error);
/// From now on each write takes no more than one byte, and every second one is interrupted.
void writeInPieces();
/// Everything works again, and the log is empty.
void reset();

/// What was called since the last reset: "open PATH", "write", "fsync", "fchmod",
/// "fsetxattr", "rename PATH PATH".
QByteArrayList log();

} // namespace FaultySystem
