// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/dirs.h>

#include <cstdlib>

std::string GetVelDir(VelDir kind)
{
    const char *home = std::getenv("HOME");
    return kind == VelDir::StartMenu ? std::string(home ? home : "") + "/.config/vel/startmenu" : std::string();
}
