// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderRemoval.h"

#include <system_error>

namespace fs = std::filesystem;

bool pathExists(const fs::path &path)
{
    std::error_code error;
    return fs::exists(fs::symlink_status(path, error));
}

void removeAll(const fs::path &path)
{
    std::error_code error;
    const auto makeWritable = [](const fs::path &folder) {
        std::error_code ignored;
        fs::permissions(folder, fs::perms::owner_all, fs::perm_options::add, ignored);
    };
    if (fs::is_directory(fs::symlink_status(path, error))) {
        makeWritable(path);
        for (fs::recursive_directory_iterator it(path, error), end; !error && it != end;
             it.increment(error)) {
            if (fs::is_directory(it->symlink_status(error)))
                makeWritable(it->path());
        }
    }
    fs::remove_all(path, error);
}
