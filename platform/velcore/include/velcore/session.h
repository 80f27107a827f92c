// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velcore/velcore_export.h>

#include <string>

/**
 * Returns what a session appends to the names of its configuration files.
 *
 * @param sessionKind 0 for the session that the user is in
 * @return "." and the value of VEL_SESSION when that is set and not empty; else nothing
 */
VELCORE_EXPORT std::string velSessionConfigSuffix(int sessionKind);
