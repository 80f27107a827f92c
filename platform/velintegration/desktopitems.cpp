// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/desktopitems.h>

bool SaveDesktopItemPosition(const char *, int, int)
{
    return false;
}

bool ReadDesktopItemPosition(const char *, int *, int *)
{
    return false;
}
