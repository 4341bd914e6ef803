// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <cstdio>
#include <ctime>

namespace pelloric::bench {

/// Seconds of the processor since it was made, so that other work on the machine counts little.
class StopWatch {
public:
    double seconds() const { return static_cast<double>(std::clock() - start_) / CLOCKS_PER_SEC; }

private:
    std::clock_t start_ = std::clock();
};

/// Prints how long something took for so many rows.
inline void print(const char* what, std::int64_t rows, double seconds, const char* remark)
{
    std::printf("%-34s %9lld rows %9.3f s %12.0f rows/s  %s\n", what, static_cast<long long>(rows),
        seconds, static_cast<double>(rows) / seconds, remark);
    std::fflush(stdout);
}

/// Prints a figure beside its budget.
inline void judge(const char* budget, double value, double limit, bool atMost)
{
    const bool met = atMost ? value <= limit : value >= limit;
    std::printf("    %-52s %10.2f  (%s %.2f: %s)\n", budget, value, atMost ? "at most" : "at least",
        limit, met ? "met" : "MISSED");
    std::fflush(stdout);
}

} // namespace pelloric::bench
