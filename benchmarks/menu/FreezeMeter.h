// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QTimer>

#include <algorithm>
#include <ctime>

/**
 * Notes the longest work between two turns of the event loop, in the processor time of this thread:
 * what else runs on the machine does not count.
 */
class FreezeMeter
{
public:
    FreezeMeter()
    {
        QObject::connect(&m_ticks, &QTimer::timeout, &m_ticks, [this] { tick(); });
        m_ticks.start(0);
    }

    /// The longest so far, in milliseconds.
    double longest()
    {
        tick();
        return m_longest;
    }

    /// The processor time of this thread in milliseconds.
    static double processorMilliseconds()
    {
        timespec time = {};
        clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
        return double(time.tv_sec) * 1e3 + double(time.tv_nsec) / 1e6;
    }

private:
    void tick()
    {
        const double now = processorMilliseconds();
        m_longest = std::max(m_longest, now - m_since);
        m_since = now;
    }

    QTimer m_ticks;
    double m_since = processorMilliseconds();
    double m_longest = 0;
};
