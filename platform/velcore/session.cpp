// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/session.h>

#include "environment.h"

std::string velSessionConfigSuffix(int sessionKind)
{
    const std::string session = sessionKind == 0 ? variable("VEL_SESSION") : std::string();
    return session.empty() ? std::string() : "." + session;
}
