// SPDX-License-Identifier: MIT
#pragma once

#include "table.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <map>
#include <string>
#include <vector>

/// Runs the registered benchmarks and prints rows that compare two of them, both measured in this run.
class Ratios : public benchmark::BenchmarkReporter
{
public:
    bool ReportContext(const Context&) override { return true; }

    void ReportRuns(const std::vector<Run>& runs) override
    {
        for (const Run& run : runs)
            if (run.run_type == Run::RT_Iteration && !run.error_occurred)
                m_times[run.run_name.function_name].push_back(run.GetAdjustedRealTime()
                                                              / benchmark::GetTimeUnitMultiplier(run.time_unit) * 1e6);
    }

    /// The median of all repetitions, in microseconds.
    double median(const char* name) const { return Table::median(m_times.at(name)); }

    /// \a ours against \a limit, the time of each divided by how many operations it stands for.
    void row(const char* operation, const char* ours, const char* limit, double aim, double oursCount = 1) const
    {
        Table::row(operation, median(ours) / oursCount, median(limit), aim);
    }

    /// For information only.
    void row(const char* operation, const char* ours, const char* limit) const
    {
        Table::row(operation, median(ours), median(limit));
    }

    /// Repetitions of the benchmarks take turns, so that a slow moment of the machine meets all of them.
    void run(int& argc, char** argv)
    {
        std::string interleave = "--benchmark_enable_random_interleaving=true";
        std::vector<char*> arguments(argv, argv + argc);
        arguments.push_back(interleave.data());
        arguments.push_back(nullptr);
        argc = int(arguments.size()) - 1;
        benchmark::Initialize(&argc, arguments.data());
        benchmark::RunSpecifiedBenchmarks(this);
    }

private:
    std::map<std::string, std::vector<double>> m_times;
};

/// Registers a benchmark by the name that rows refer to.
template <typename Function>
benchmark::internal::Benchmark* measure(const char* name, Function function)
{
    return benchmark::RegisterBenchmark(name, function)->UseRealTime()->Repetitions(9)->MinTime(0.05);
}

/// As measure(), for a function that says itself how long each iteration took.
template <typename Function>
benchmark::internal::Benchmark* measureManually(const char* name, Function function)
{
    return benchmark::RegisterBenchmark(name, function)->UseManualTime()->Repetitions(9)->MinTime(0.05);
}
