// SPDX-License-Identifier: MIT
#pragma once

#include "samples.h"

#include <cstdio>
#include <cstdlib>
#include <optional>

/// Rows of a benchmark: what an operation costs, what it could cost at best, and how far apart the two may be.
namespace Table {

/// Microseconds as text of a fixed width, in nanoseconds when there are few.
inline std::string time(double microseconds)
{
    const bool isShort = microseconds < 1;
    char text[32];
    std::snprintf(text, sizeof text, "%9.1f %s", isShort ? microseconds * 1000 : microseconds, isShort ? "ns" : "us");
    return text;
}

inline std::string cell(const Samples& samples)
{
    char spread[16];
    std::snprintf(spread, sizeof spread, " +-%2.0f%%", 100 * samples.spread());
    return time(samples.median()) + spread;
}

/// To the file that the program which collects all rows asks for.
inline void tellCollector(const char* operation, const Samples& ours, const Samples& limit, std::optional<double> aim)
{
    const char* const fileName = std::getenv("HMI_BENCH_ROWS");
    FILE* const file = fileName ? std::fopen(fileName, "a") : nullptr;
    if (!file)
        return;
    std::fprintf(file, "{\"operation\": \"%s\"", operation); // names of this tree's own, without quotes
    for (const auto& [name, samples] : {std::pair{"ours", &ours}, std::pair{"limit", &limit}})
        std::fprintf(file, ", \"%s\": {\"median_us\": %.6g, \"spread\": %.4g, \"repetitions\": %zu}", name,
                     samples->median(), samples->spread(), samples->count());
    std::fprintf(file, ", \"ratio\": %.4g", ours.median() / limit.median());
    if (aim)
        std::fprintf(file, ", \"aim\": %.4g", *aim);
    std::fprintf(file, "}\n");
    std::fclose(file);
}

/// \a aim is the largest ratio that is good; without one the row is for information only.
inline void row(const char* operation, const Samples& ours, const Samples& limit, std::optional<double> aim = {})
{
    const double ratio = ours.median() / limit.median();
    std::printf("%-58s %s %s %6.2f", operation, cell(ours).c_str(), cell(limit).c_str(), ratio);
    if (aim)
        std::printf("  <= %.2f%s\n", *aim, ratio <= *aim ? "" : "  MISSED");
    else
        std::printf("  -\n");
    std::fflush(stdout);
    tellCollector(operation, ours, limit, aim);
}

} // namespace Table
