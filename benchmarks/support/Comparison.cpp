// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Comparison.h"

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <utility>

namespace {

double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    const std::size_t middle = values.size() / 2;
    return values.size() % 2 ? values[middle] : (values[middle - 1] + values[middle]) / 2;
}

} // namespace

Comparison::Comparison(std::string title)
    : m_title(std::move(title))
{
}

void Comparison::add(const std::string &name, Work work, double limit)
{
    m_candidates.push_back({name, std::move(work), {}, limit, {}});
}

void Comparison::addTimed(const std::string &name, TimedWork work, double limit)
{
    m_candidates.push_back({name, {}, std::move(work), limit, {}});
}

void Comparison::setPreparation(Work preparation)
{
    m_preparation = std::move(preparation);
}

void Comparison::setRepetitions(int repetitions)
{
    m_repetitions = repetitions;
}

double Comparison::measure(const Candidate &candidate) const
{
    using Clock = std::chrono::steady_clock;
    if (m_preparation)
        m_preparation();
    if (candidate.timedWork) {
        double time = 0;
        for (int i = 0; i < m_repetitions; ++i)
            time += candidate.timedWork();
        return time / m_repetitions;
    }
    const Clock::time_point start = Clock::now();
    for (int i = 0; i < m_repetitions; ++i)
        candidate.work();
    return std::chrono::duration<double, std::micro>(Clock::now() - start).count() / m_repetitions;
}

bool Comparison::run(int rounds)
{
    const char *const part = std::getenv("VEL_BENCHMARK_PART");
    if (part && m_title.find(part) == std::string::npos)
        return true;
    if (const char *only = std::getenv("VEL_BENCHMARK_ONLY")) {
        for (const Candidate &candidate : m_candidates) {
            if (candidate.name == only)
                measure(candidate);
        }
        return true;
    }
    for (const Candidate &candidate : m_candidates)
        measure(candidate); // warms caches up
    for (int round = 0; round < rounds; ++round) {
        for (Candidate &candidate : m_candidates)
            candidate.times.push_back(measure(candidate));
    }
    return report();
}

bool Comparison::report() const
{
    const char *tableFile = std::getenv("VEL_BENCHMARK_TABLE");
    std::FILE *table = tableFile ? std::fopen(tableFile, "a") : nullptr;
    const Candidate &ours = m_candidates.front();
    const double ourTime = median(ours.times);
    bool kept = true;

    std::printf("%s\n  %-40s %12.1f us\n", m_title.c_str(), ours.name.c_str(), ourTime);
    for (auto peer = m_candidates.begin() + 1; peer != m_candidates.end(); ++peer) {
        std::vector<double> ratios;
        for (std::size_t i = 0; i < peer->times.size(); ++i)
            ratios.push_back(ours.times[i] / peer->times[i]);
        const double ratio = median(ratios);
        const double peerTime = median(peer->times);
        const bool within = peer->limit <= 0 || ratio <= peer->limit;
        kept = kept && within;

        char aim[64] = "-";
        if (peer->limit > 0)
            std::snprintf(aim, sizeof aim, "%.2f%s", peer->limit, within ? "" : " (missed)");
        std::printf("  %-40s %12.1f us   ratio %6.3f   aim %s\n", peer->name.c_str(), peerTime, ratio, aim);
        if (table) {
            std::fprintf(table, "| %s | %s | %.1f | %.1f | %.3f | %s |\n", m_title.c_str(),
                         peer->name.c_str(), ourTime, peerTime, ratio, aim);
        }
    }
    if (table)
        std::fclose(table);
    return kept;
}
