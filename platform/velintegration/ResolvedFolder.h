// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>

/// Where a path leads, with all links followed; it need not exist. Empty when the links lead in a
/// circle, or where another user may have wanted it (see Vel::leadsThroughPlantedLink).
std::filesystem::path resolvedFolder(const std::filesystem::path &path);
