// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/startmenu.h>

bool CreateStartMenu(const char *, const char *)
{
    return false;
}
