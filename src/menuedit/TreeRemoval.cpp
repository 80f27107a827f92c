// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeRemoval.h"

#include "FileDescriptor.h"
#include "FileProgress.h"
#include "OpenFolder.h"

#include <cerrno>
#include <tuple>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace TreeRemoval {

namespace {

// By open folders, not by paths: another user may put a link in the place of what was looked at.
class Removal
{
public:
    enum class Rights { AsTheyAre, Taken };

    Removal(Rights rights, FileProgress &progress)
        : m_takesRights(rights == Rights::Taken)
        , m_progress(progress)
    {
    }

    void removeAt(int parent, const std::string &name, const Path &path);

    const Result &result() const { return m_result; }

private:
    void note(const std::error_code &error, const Path &path);

    const bool m_takesRights;
    FileProgress &m_progress;
    bool m_isCanceled = false;
    Result m_result;
};

void Removal::removeAt(int parent, const std::string &name, const Path &path)
{
    m_isCanceled = m_isCanceled || !m_progress.goOn();
    if (m_isCanceled)
        return note(std::make_error_code(std::errc::operation_canceled), path);
    if (::unlinkat(parent, name.c_str(), 0) == 0)
        return m_progress.advance();
    if (errno != EISDIR)
        return note(lastError(), path);
    // Whether they could be taken shows when the folder is opened.
    if (m_takesRights)
        std::ignore = ::fchmodat(parent, name.c_str(), S_IRWXU, AT_SYMLINK_NOFOLLOW);
    const OpenFolder::Stream folder = OpenFolder::open(parent, name.c_str());
    const std::error_code closed = folder ? std::error_code() : lastError();
    if (folder) {
        for (const std::string &child : OpenFolder::namesIn(folder.get()))
            removeAt(::dirfd(folder.get()), child, path / child);
    }
    if (::unlinkat(parent, name.c_str(), AT_REMOVEDIR) != 0)
        return note(closed ? closed : lastError(), path);
    m_progress.advance();
}

// What lies in a folder comes before the folder, which then only tells that it is not empty.
void Removal::note(const std::error_code &error, const Path &path)
{
    if (error != std::errc::no_such_file_or_directory && m_result.succeeded())
        m_result = {error, path};
}

} // namespace

Result remove(const Path &path, FileProgress &progress)
{
    Removal removal(Removal::Rights::AsTheyAre, progress);
    removal.removeAt(AT_FDCWD, path.string(), path);
    return removal.result();
}

void removeOwn(const Path &path, FileProgress &progress)
{
    UnstoppableProgress toTheEnd(progress);
    Removal(Removal::Rights::Taken, toTheEnd).removeAt(AT_FDCWD, path.string(), path);
}

void removeOwnAt(int parent, const std::string &name)
{
    FileProgress nobody;
    Removal(Removal::Rights::Taken, nobody).removeAt(parent, name, name);
}

} // namespace TreeRemoval
