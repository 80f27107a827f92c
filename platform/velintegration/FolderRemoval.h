// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>

/// Whether there is anything at \a path, a link that leads nowhere included.
bool pathExists(const std::filesystem::path &path);

/// Removes \a path with everything in it, also from a folder that is read-only; links are removed,
/// not followed.
void removeAll(const std::filesystem::path &path);
