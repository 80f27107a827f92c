// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/help.h>

bool velHelpShow(const std::string &)
{
    return false;
}
