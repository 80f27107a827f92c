// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/wmcommand.h>

bool SendCommandToWM(Display *, const char *)
{
    return false;
}
