// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

/**
 * Remembers where an item stands on the desktop.
 *
 * The positions are kept in the file "desktopitems" of the configuration root (GetVelDir of
 * VelDir::WindowManagerConfig), one line "x y name" an item, the name percent-escaped. The
 * file is replaced as a whole: when anything fails, the old one stays as it was. Lines of
 * other items are kept, whatever stands in them, also where several programs save at a time.
 * The configuration root is made when needed.
 *
 * @param fileName the bare name of the item's file in the desktop folder, in any bytes
 * @param x, y the position in pixels
 * @return false when \a fileName is null or empty, or when the file cannot be read or written:
 *         when it is larger than 1 MiB, no regular file, or a link that another user planted
 */
VELINTEGRATION_EXPORT bool SaveDesktopItemPosition(const char *fileName, int x, int y);

/**
 * Reads where an item stands on the desktop.
 *
 * @param fileName the bare name of the item's file, as it was saved
 * @param x, y receive the position; either may be null, and both stay as they are when the
 *             result is false
 * @return whether a position is known
 */
VELINTEGRATION_EXPORT bool ReadDesktopItemPosition(const char *fileName, int *x, int *y);
