// How the benchmarks measure and print: medians, ratios, limits.
#pragma once

#include <algorithm>
#include <chrono>
#include <cstddef>
#include <cstdio>
#include <functional>
#include <vector>

inline double Milliseconds(const std::function<void()>& work)
{
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
}

inline double Median(std::vector<double> times)
{
    std::nth_element(times.begin(), times.begin() + std::ptrdiff_t(times.size() / 2), times.end());
    return times[times.size() / 2];
}

/// Prints a line; true when the ratio is within the limit.
inline bool Report(const char* what, double measured, double yardstick, double limit)
{
    const double ratio = measured / yardstick;
    std::printf("%-58s %9.3f ms / %9.3f ms = %5.2f (limit %.1f) %s\n", what, measured, yardstick, ratio, limit,
                ratio <= limit ? "ok" : "TOO SLOW");
    return ratio <= limit;
}
