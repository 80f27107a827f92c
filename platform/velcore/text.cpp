// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/text.h>

bool Vel::isEscapedUtf8(const unsigned char *, unsigned char *)
{
    return false;
}
