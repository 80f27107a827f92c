// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <string>

/// The user's desktop folder: what user-dirs.dirs says, else "Desktop" in the home.
std::string userDesktopDirectory();
