#pragma once

#include <QCoreApplication>

#include <algorithm>
#include <chrono>
#include <ctime>
#include <functional>
#include <vector>

namespace report {

/// By the clock on the wall: for what waits for another process.
template <class Work>
double seconds(Work&& work) {
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

/// Of this process's own: what else the machine does is not in it.
template <class Work>
double ownSeconds(Work&& work) {
    const auto now = [] {
        timespec time{};
        clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
        return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_nsec) * 1e-9;
    };
    const double start = now();
    work();
    return now() - start;
}

inline double median(std::vector<double> values) {
    const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
    std::nth_element(values.begin(), middle, values.end());
    return *middle;
}

/// The median time of each contestant. They take turns, so that what else the machine does falls on
/// all of them; each warms up first.
inline std::vector<double> contest(int rounds, const std::vector<std::function<void()>>& all,
                                   bool byTheWall = false) {
    std::vector<std::vector<double>> times(all.size());
    for (int round = -rounds / 10 - 1; round < rounds; ++round)
        for (std::size_t n = 0; n < all.size(); ++n) {
            const double once = byTheWall ? seconds(all[n]) : ownSeconds(all[n]);
            if (round >= 0) times[n].push_back(once);
        }
    std::vector<double> medians;
    for (const auto& each : times) medians.push_back(median(each));
    return medians;
}

} // namespace report
