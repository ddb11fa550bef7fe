// SPDX-License-Identifier: MIT
#pragma once

#include <chrono>
#include <cstdio>
#include <cstdlib>

/// Time since a process was started: its first argument is the moment, in nanoseconds of the steady clock.
namespace StartClock {

inline long long now()
{
    return std::chrono::duration_cast<std::chrono::nanoseconds>(std::chrono::steady_clock::now().time_since_epoch())
        .count();
}

/// Prints microseconds since \a start and ends the process.
[[noreturn]] inline void report(long long start)
{
    std::printf("%.1f\n", double(now() - start) / 1000);
    std::fflush(stdout);
    std::_Exit(0);
}

} // namespace StartClock
