// SPDX-License-Identifier: MIT
#pragma once

#include "table.h"

#include <benchmark/benchmark.h>

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

    Samples samples(const char* name) const { return m_times.at(name); }

    /// \a ours against \a limit. \a oursCount tells for how many operations one of ours stands.
    void row(const char* operation, const char* ours, const char* limit, std::optional<double> aim = {},
             double oursCount = 1) const
    {
        Table::row(operation, samples(ours).scaled(1 / oursCount), samples(limit), aim);
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
