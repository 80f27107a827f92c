// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeRemoval.h"

#include "OpenFolder.h"

#include <cerrno>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace TreeRemoval {

void remove(const std::filesystem::path &path)
{
    removeAt(AT_FDCWD, path.string());
}

// By open folders, not by paths: another user may put a link in the place of what was looked at.
void removeAt(int parent, const std::string &name)
{
    if (::unlinkat(parent, name.c_str(), 0) == 0 || errno != EISDIR)
        return;
    ::fchmodat(parent, name.c_str(), S_IRWXU, AT_SYMLINK_NOFOLLOW);
    if (const OpenFolder::Stream folder = OpenFolder::open(parent, name.c_str())) {
        for (const std::string &child : OpenFolder::namesIn(folder.get()))
            removeAt(::dirfd(folder.get()), child);
    }
    ::unlinkat(parent, name.c_str(), AT_REMOVEDIR);
}

} // namespace TreeRemoval
