// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/folderlock.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <thread>

#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

using namespace std::chrono_literals;

namespace {

constexpr auto LongestWait = 1s;
constexpr auto LongestPause = 4ms;
constexpr auto ShortestPause = 200us;

} // namespace

Vel::FolderLock::FolderLock(const std::string &folder)
    : m_folder(open(folder.empty() ? "." : folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC))
    , m_isHeld(m_folder >= 0 && lockFolder(m_folder))
{
}

Vel::FolderLock::~FolderLock()
{
    if (m_folder >= 0)
        close(m_folder);
}

bool Vel::lockFolder(int folder)
{
    if (flock(folder, LOCK_EX | LOCK_NB) == 0)
        return true;
    const auto end = std::chrono::steady_clock::now() + LongestWait;
    do {
        const std::chrono::nanoseconds left = end - std::chrono::steady_clock::now();
        if ((errno != EWOULDBLOCK && errno != EINTR) || left <= 0s)
            return false;
        // Who has waited for longer asks more often, so that nobody is passed over for long.
        std::this_thread::sleep_for(
            std::clamp<std::chrono::nanoseconds>(left / 256, ShortestPause, LongestPause));
    } while (flock(folder, LOCK_EX | LOCK_NB) != 0);
    return true;
}
