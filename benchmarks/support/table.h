// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <cstdio>
#include <string>
#include <vector>

/// Rows of a benchmark: what an operation costs, what it could cost at best, and how far apart the two may be.
namespace Table {

inline double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    return values.at(values.size() / 2);
}

/// Microseconds as text of a fixed width, in nanoseconds when there are few.
inline std::string time(double microseconds)
{
    const bool isShort = microseconds < 1;
    char text[32];
    std::snprintf(text, sizeof text, "%9.1f %s", isShort ? microseconds * 1000 : microseconds, isShort ? "ns" : "us");
    return text;
}

inline void header()
{
    std::printf("%-58s %12s %12s %7s  %s\n", "operation", "ours", "limit", "ratio", "aim");
}

/// \a ours and \a limit in microseconds; for information only.
inline void row(const char* operation, double ours, double limit)
{
    std::printf("%-58s %s %s %7.2f  -\n", operation, time(ours).c_str(), time(limit).c_str(), ours / limit);
    std::fflush(stdout);
}

/// \a aim is the largest ratio that is good.
inline void row(const char* operation, double ours, double limit, double aim)
{
    const double ratio = ours / limit;
    std::printf("%-58s %s %s %7.2f  <= %.2f%s\n", operation, time(ours).c_str(), time(limit).c_str(), ratio, aim,
                ratio <= aim ? "" : "  MISSED");
    std::fflush(stdout);
}

} // namespace Table
