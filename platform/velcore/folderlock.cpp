// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/folderlock.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <thread>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

using namespace std::chrono_literals;

namespace {

using Clock = std::chrono::steady_clock;

constexpr auto LongestStandstill = 1s;
constexpr auto LongestWait = 10s;
constexpr auto LongestPause = 4ms;
constexpr auto ShortestPause = 200us;
constexpr int FewestLooks = 16;

/// How long a lock has been waited for, and whether others got on meanwhile.
class Patience
{
public:
    explicit Patience(int folder)
        : m_folder(folder)
    {
        hasChanged();
    }

    /// Whether it is used up. A program that was hardly run itself, and looked a few times only, cannot tell
    /// a holder that hangs from one that waits for the processor.
    bool isUsedUp()
    {
        const Clock::time_point now = Clock::now();
        if (hasChanged()) {
            m_lastChange = now;
            m_looks = 0;
        }
        ++m_looks;
        return now - m_start >= LongestWait
            || (now - m_lastChange >= LongestStandstill && m_looks >= FewestLooks);
    }

    /// The time until the next look. Who has waited for longer asks more often, so that nobody is passed over
    /// for long.
    std::chrono::nanoseconds pause() const
    {
        const std::chrono::nanoseconds left = m_start + LongestStandstill - Clock::now();
        return std::clamp<std::chrono::nanoseconds>(left / 256, ShortestPause, LongestPause);
    }

private:
    // Who has held the lock leaves another file in the folder.
    bool hasChanged()
    {
        struct stat status;
        if (fstat(m_folder, &status) != 0)
            return false;
        const timespec before = m_changed;
        m_changed = status.st_mtim;
        return before.tv_sec != m_changed.tv_sec || before.tv_nsec != m_changed.tv_nsec;
    }

    const int m_folder;
    const Clock::time_point m_start = Clock::now();
    Clock::time_point m_lastChange = m_start;
    timespec m_changed = {};
    int m_looks = 0;
};

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
    if (errno != EWOULDBLOCK && errno != EINTR)
        return false;
    Patience patience(folder);
    do {
        std::this_thread::sleep_for(patience.pause());
        if (flock(folder, LOCK_EX | LOCK_NB) == 0)
            return true;
    } while ((errno == EWOULDBLOCK || errno == EINTR) && !patience.isUsedUp());
    return false;
}
