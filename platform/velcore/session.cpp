// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/session.h>

std::string velSessionConfigSuffix(int)
{
    return {};
}
