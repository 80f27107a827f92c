// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <string>

/// The value of an environment variable; empty when it is not set.
std::string variable(const char *name);

/// The path in an environment variable without trailing "/"; empty when it is not absolute.
std::string absoluteVariable(const char *name);

/// The user's home: HOME, else that of the user data base. Without trailing "/".
std::string homeDirectory();

/// XDG_CONFIG_HOME, else ".config" in the home.
std::string xdgConfigHome();
