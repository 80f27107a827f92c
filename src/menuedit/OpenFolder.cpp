// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OpenFolder.h"

#include <string_view>

#include <fcntl.h>
#include <unistd.h>

namespace OpenFolder {

Stream open(int parent, const char *name)
{
    const int fd = ::openat(parent, name, O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC);
    DIR *const stream = fd < 0 ? nullptr : ::fdopendir(fd);
    if (!stream && fd >= 0)
        ::close(fd);
    return Stream(stream, ::closedir);
}

std::vector<std::string> namesIn(DIR *folder)
{
    std::vector<std::string> names;
    while (const dirent *entry = ::readdir(folder)) {
        const std::string_view name = entry->d_name;
        if (name != "." && name != "..")
            names.emplace_back(name);
    }
    return names;
}

} // namespace OpenFolder
