// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuWatch.h"

#include <velintegration/startmenufollowing.h>

#include <chrono>
#include <csignal>
#include <utility>

#include <poll.h>
#include <sys/signalfd.h>
#include <unistd.h>

namespace {

using Clock = std::chrono::steady_clock;

constexpr int Forever = -1;
// Without any news for as long, in milliseconds, everything has come that belongs together.
constexpr int QuietTime = 200;
constexpr auto LongestTime = std::chrono::seconds(1);

} // namespace

MenuWatch::MenuWatch(Update update)
    : m_update(std::move(update))
{
}

bool MenuWatch::watch()
{
    return m_folders.setFolders(VelStartMenu::followedFolders());
}

// First the folders are watched, then the menu is updated, so that nothing comes between the two; but
// what came meanwhile may lie in folders that have to be watched as well.
bool MenuWatch::run()
{
    sigset_t signals;
    sigemptyset(&signals);
    for (const int signal : {SIGTERM, SIGINT, SIGHUP})
        sigaddset(&signals, signal);
    sigprocmask(SIG_BLOCK, &signals, nullptr);
    m_signals = signalfd(-1, &signals, SFD_CLOEXEC);
    bool isWatching = m_signals >= 0 && watch();
    if (isWatching)
        m_update();
    while (isWatching && collect()) {
        isWatching = watch();
        m_update();
    }
    close(m_signals);
    return isWatching;
}

// Whether there is something to do; not when the program is to end.
bool MenuWatch::collect()
{
    News news = wait(Forever);
    const auto end = Clock::now() + LongestTime;
    while (news == News::Some && Clock::now() < end)
        news = wait(QuietTime);
    return news != News::End;
}

MenuWatch::News MenuWatch::wait(int milliseconds)
{
    const auto end = Clock::now() + std::chrono::milliseconds(milliseconds);
    for (;;) {
        const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(end - Clock::now()).count();
        if (milliseconds != Forever && left < 0)
            return News::None;
        pollfd descriptors[] = {{m_folders.descriptor(), POLLIN, 0}, {m_signals, POLLIN, 0}};
        poll(descriptors, 2, milliseconds == Forever ? Forever : int(left));
        if ((descriptors[1].revents & POLLIN) != 0)
            return News::End;
        if ((descriptors[0].revents & POLLIN) != 0 && m_folders.takeNews())
            return News::Some;
    }
}
