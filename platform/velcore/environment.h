// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <string>

/// The value of an environment variable; empty when it is not set.
std::string variable(const char *name);

/// The path in an environment variable without trailing "/"; empty when it is not absolute.
std::string absoluteVariable(const char *name);

/// \a name in the folder \a home, which may be "/".
std::string inHome(const std::string &home, const char *name);

/// XDG_CONFIG_HOME, else ".config" in the home.
std::string xdgConfigHome();
