// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ResolvedFolder.h"

#include <velcore/files.h>

#include <system_error>

namespace fs = std::filesystem;

namespace {

constexpr int MostLinks = 40;

} // namespace

fs::path resolvedFolder(const fs::path &path)
{
    std::error_code error;
    fs::path result = fs::absolute(path, error);
    if (!result.has_filename()) // a trailing "/"
        result = result.parent_path();
    if (Vel::leadsThroughPlantedLink(result))
        return {};
    const fs::path canonical = fs::canonical(result, error);
    if (!error)
        return canonical;
    for (int i = 0; i < MostLinks; ++i) {
        if (!fs::is_symlink(fs::symlink_status(result, error)))
            return result;
        const fs::path next = fs::read_symlink(result, error);
        if (error)
            return {};
        result = next.is_absolute() ? next : result.parent_path() / next;
    }
    return {};
}
