// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "benchmarks/support/Ratios.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdio>
#include <map>

#include "benchmarks/support/ColdFiles.h"

namespace {

// Keeps the wall time of every run, by name and arguments, beside printing it.
class KeepingReporter : public benchmark::ConsoleReporter {
public:
    void ReportRuns(const std::vector<Run>& runs) override {
        for (const Run& run : runs) {
            if (run.run_type == Run::RT_Iteration && !run.error_occurred) {
                times[run.run_name.function_name][run.run_name.args].push_back(
                    run.real_accumulated_time / static_cast<double>(run.iterations));
            }
        }
        ConsoleReporter::ReportRuns(runs);
    }

    std::map<std::string, std::map<std::string, std::vector<double>>> times;
};

double Median(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

}  // namespace

int RunWithRatios(int argc, char** argv, const std::vector<Pair>& pairs) {
    TakeColdOption(&argc, argv);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) {
        return 2;
    }
    KeepingReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    for (const Pair& pair : pairs) {
        const auto& ours = reporter.times[pair.ours];
        const auto& peers = reporter.times[pair.peer];
        for (const auto& [arguments, times] : ours) {
            const auto peer = peers.find(arguments);
            if (peer != peers.end()) {
                std::printf("ratio %s / %s %s: %.3f (wanted: %s)\n", pair.ours.c_str(),
                            pair.peer.c_str(), arguments.c_str(),
                            Median(times) / Median(peer->second), pair.wanted.c_str());
            }
        }
    }
    benchmark::Shutdown();
    return 0;
}
