// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/files.h>

#include <cerrno>
#include <ctime>
#include <memory>
#include <string>
#include <tuple>
#include <vector>

#include <dirent.h>
#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

namespace {

constexpr time_t OldEnough = 60 * 60;

// An open folder, for what is done to its children: by its path it could be exchanged meanwhile.
class Folder
{
public:
    explicit Folder(int descriptor)
        : m_stream(descriptor < 0 ? nullptr : fdopendir(descriptor), closedir)
    {
        if (!m_stream && descriptor >= 0)
            close(descriptor);
    }

    bool isOpen() const { return m_stream != nullptr; }
    int descriptor() const { return dirfd(m_stream.get()); }
    Folder child(const char *name) const
    {
        return Folder(openat(descriptor(), name, O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC));
    }
    std::vector<std::string> names() const
    {
        std::vector<std::string> names;
        while (const dirent *entry = readdir(m_stream.get())) {
            const std::string name = entry->d_name;
            if (name != "." && name != "..")
                names.push_back(name);
        }
        return names;
    }

private:
    std::unique_ptr<DIR, int (*)(DIR *)> m_stream;
};

void removeChildren(const Folder &folder)
{
    fchmod(folder.descriptor(), S_IRWXU);
    for (const std::string &name : folder.names()) {
        if (unlinkat(folder.descriptor(), name.c_str(), 0) == 0 || errno != EISDIR)
            continue;
        // A folder that may not even be read has to be changed to be opened, which shows whether it was.
        std::ignore = fchmodat(folder.descriptor(), name.c_str(), S_IRWXU, AT_SYMLINK_NOFOLLOW);
        const Folder child = folder.child(name.c_str());
        if (child.isOpen())
            removeChildren(child);
        unlinkat(folder.descriptor(), name.c_str(), AT_REMOVEDIR);
    }
}

bool isLeftBehind(const Folder &folder, const std::string &name, mode_t type)
{
    struct stat status = {};
    return fstatat(folder.descriptor(), name.c_str(), &status, AT_SYMLINK_NOFOLLOW) == 0
        && (status.st_mode & S_IFMT) == type && status.st_uid == geteuid()
        && status.st_mtime < time(nullptr) - OldEnough;
}

void removeFolder(const Folder &above, const std::string &name)
{
    const Folder folder = above.child(name.c_str());
    // Whoever is still filling it holds a lock on it.
    if (!folder.isOpen() || flock(folder.descriptor(), LOCK_EX | LOCK_NB) != 0)
        return;
    removeChildren(folder);
    unlinkat(above.descriptor(), name.c_str(), AT_REMOVEDIR);
}

} // namespace

void Vel::removeLeftovers(const std::string &folder, Leftover kind,
                          const std::function<bool(std::string_view)> &isName)
{
    const Folder open(::open(folder.empty() ? "." : folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (!open.isOpen())
        return;
    for (const std::string &name : open.names()) {
        if (!isName(name))
            continue;
        if (kind == Leftover::File && isLeftBehind(open, name, S_IFREG))
            unlinkat(open.descriptor(), name.c_str(), 0);
        else if (kind == Leftover::Folder && isLeftBehind(open, name, S_IFDIR))
            removeFolder(open, name);
    }
}
