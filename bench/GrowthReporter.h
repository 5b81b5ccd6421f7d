// SPDX-License-Identifier: MIT
#pragma once

#include <benchmark/benchmark.h>
#include <algorithm>
#include <cstdio>
#include <map>
#include <string>
#include <vector>

namespace brindle::bench {

/// Prints the usual lines and keeps the times, to tell how they grow. Of repetitions
/// (`--benchmark_repetitions=5`) the fastest counts: what else the machine does only adds time.
class CGrowthReporter : public benchmark::ConsoleReporter {
public:
    CGrowthReporter() : ConsoleReporter(OO_Tabular) {}

    void ReportRuns(const std::vector<Run>& runs) override {
        ConsoleReporter::ReportRuns(runs);
        for (const Run& run : runs) {
            if (run.run_type != Run::RT_Iteration || run.run_name.args.empty()) continue;
            const double time = run.GetAdjustedCPUTime();
            const auto [at, isNew] =
                mTimes[run.run_name.function_name].try_emplace(std::stoul(run.run_name.args), time);
            if (!isNew) at->second = std::min(at->second, time);
        }
    }

    /// For what was timed at `least`, at 10 and at 100 times as many: the time against that of a
    /// tenth.
    void PrintGrowth(const char* ofWhat, unsigned long least) const {
        std::printf("\ntime against that of a tenth of the %-10s %12lu %12lu\n", ofWhat, 10 * least,
                    100 * least);
        for (const auto& [name, times] : mTimes) {
            if (times.count(least) + times.count(10 * least) + times.count(100 * least) < 3) {
                continue;
            }
            std::printf("%-45s %12.1f %12.1f\n", name.c_str(),
                        times.at(10 * least) / times.at(least),
                        times.at(100 * least) / times.at(10 * least));
        }
    }

private:
    std::map<std::string, std::map<unsigned long, double>> mTimes;
};

}  // namespace brindle::bench
