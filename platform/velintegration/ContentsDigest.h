// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <string>
#include <string_view>

/// A short text that two contents share only when they are the same, byte for byte.
std::string contentsDigest(std::string_view bytes);

/// The digest of what stands in a regular file; empty for a link, for anything else that is no
/// regular file, and for one that cannot be read or is larger than a desktop entry may be.
std::string fileDigest(const std::filesystem::path &path);
