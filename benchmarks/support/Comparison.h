// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <functional>
#include <string>
#include <vector>

/**
 * Times ways of doing the same work side by side in one run.
 *
 * The candidates take turns round by round, so that whatever else the machine does falls on
 * all of them alike. What counts is the ratio: for every round the time of the first candidate
 * (ours) is divided by that of each other one, and the median of these is reported.
 *
 * \code
 * Comparison comparison("settings file of 2,000 keys: load and read all");
 * comparison.add("VelSettings", [&] { ... });
 * comparison.add("QSettings INI", [&] { ... }, 1.1);  // ours takes at most 1.1 times as long
 * return comparison.run(15);
 * \endcode
 *
 * Every program prints a line for each candidate; with the variable VEL_BENCHMARK_TABLE set to
 * a file name, a Markdown row for each peer is appended to that file too. With the argument of
 * \c VEL_BENCHMARK_ONLY the candidate of that name alone runs, once (for callgrind); with
 * \c VEL_BENCHMARK_PART only comparisons that have that text in their title run.
 */
class Comparison
{
public:
    using Work = std::function<void()>;
    /// Work that takes its own time and returns it in microseconds.
    using TimedWork = std::function<double()>;

    explicit Comparison(std::string title);

    /// Adds a way of doing the work; the first one added is ours. \a limit is what we aim at:
    /// the largest ratio of ours to this one, 0 for none.
    void add(const std::string &name, Work work, double limit = 0);

    /// The same for work in which not all time counts, such as waiting for things to settle.
    void addTimed(const std::string &name, TimedWork work, double limit = 0);

    /// Runs before every single measurement, outside of the time taken.
    void setPreparation(Work preparation);

    /// Repeats the work so often within one measurement; for work of microseconds.
    void setRepetitions(int repetitions);

    /// Takes the measurements, prints the result and tells whether every limit was kept.
    bool run(int rounds = 15);

private:
    struct Candidate
    {
        std::string name;
        Work work;
        TimedWork timedWork; // instead of work
        double limit;
        std::vector<double> times; // microseconds for one repetition
    };

    double measure(const Candidate &candidate) const;
    bool report() const;

    std::string m_title;
    std::vector<Candidate> m_candidates;
    Work m_preparation;
    int m_repetitions = 1;
};
