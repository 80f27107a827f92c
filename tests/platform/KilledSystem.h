// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

/**
 * Kills the program at one of the system calls by which files change, at a chosen one: before it is done.
 *
 * The program's own open (of a new file), write, fsync, rename, renameat2, unlink, mkdir and rmdir stand in
 * front of those of the C library, for every library that the program loads.
 */
namespace KilledSystem {

/// The program is killed at the call of that number from now on; 0 is the next one.
void killAt(int call);

/// How many such calls were made since the program began.
int calls();

} // namespace KilledSystem
