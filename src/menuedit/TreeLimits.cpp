// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeLimits.h"

#include "FileProgress.h"

namespace fs = std::filesystem;

std::error_code TreeLimits::check(const fs::path &path, FileProgress &progress)
{
    progress.expect(1);
    std::error_code error;
    if (!fs::is_directory(fs::symlink_status(path, error)))
        return {};
    fs::recursive_directory_iterator it(path, fs::directory_options::none, error);
    for (int items = 0; !error && it != fs::recursive_directory_iterator(); it.increment(error)) {
        if (areMet(it.depth() + 1, ++items))
            return std::make_error_code(std::errc::file_too_large);
        if (!progress.goOn())
            return std::make_error_code(std::errc::operation_canceled);
        progress.expect(1);
    }
    return {}; // what cannot be read is told by the copy
}
