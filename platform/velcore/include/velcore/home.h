// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velcore/velcore_export.h>

#include <string>

namespace Vel {

/**
 * Returns the absolute path of the user's home, without a trailing "/".
 *
 * That is HOME, else the home that the user data base has, else "/". The environment is read at
 * every call.
 */
VELCORE_EXPORT std::string homeDirectory();

/// Returns the folder of the user's data: XDG_DATA_HOME, else ".local/share" in homeDirectory().
/// A variable that holds no absolute path counts as not set.
VELCORE_EXPORT std::string dataHome();

} // namespace Vel
