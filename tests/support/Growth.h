// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <algorithm>
#include <ctime>
#include <limits>

/**
 * How the time for some work grows with its size.
 *
 * What others do on the machine is left out: processor time counts, and of several tries the
 * shortest. Linear work takes Factor times as long, quadratic work Factor times Factor; halfway
 * between the two, as ratios are counted, lies Most.
 */
namespace Growth {

constexpr int Factor = 16;
constexpr double Most = Factor * 4;

inline double processorTime()
{
    timespec time = {};
    ::clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return double(time.tv_sec) + double(time.tv_nsec) / 1e9;
}

/// The seconds that \a work takes, done so often that a clock can tell.
template <typename Work>
double secondsOf(const Work &work, int times)
{
    double best = std::numeric_limits<double>::max();
    for (int i = 0; i < 5; ++i) {
        const double start = processorTime();
        for (int n = 0; n < times; ++n)
            work();
        best = std::min(best, processorTime() - start);
        if (best > 1)
            break;
    }
    return best;
}

/// How many times as long \a large takes as \a small, whose size is a Factor less.
template <typename Small, typename Large>
double of(const Small &small, const Large &large)
{
    constexpr double Enough = 0.002;
    int times = 1;
    while (secondsOf(small, times) < Enough)
        times *= 2;
    return secondsOf(large, times) / secondsOf(small, times);
}

} // namespace Growth
