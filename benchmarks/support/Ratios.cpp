// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "benchmarks/support/Ratios.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <map>

#include "benchmarks/support/ColdFiles.h"

namespace {

// Of one run: the seconds that it took, and the items that it told of.
struct Measured {
    double seconds = 0;
    double itemsASecond = 0;  // 0: it counted none
};

// Keeps every run, by name and arguments, beside printing it.
class KeepingReporter : public benchmark::ConsoleReporter {
public:
    // Without colours, whose ends would stand before the rows in a file.
    KeepingReporter() : ConsoleReporter(OO_Tabular) {}

    void ReportRuns(const std::vector<Run>& runs) override {
        for (const Run& run : runs) {
            if (run.run_type == Run::RT_Iteration && !run.error_occurred) {
                const auto items = run.counters.find("items_per_second");
                kept[run.run_name.function_name][run.run_name.args].push_back(
                    {run.real_accumulated_time / static_cast<double>(run.iterations),
                     items == run.counters.end() ? 0.0 : items->second.value});
            }
        }
        ConsoleReporter::ReportRuns(runs);
    }

    std::map<std::string, std::map<std::string, std::vector<Measured>>> kept;
};

Measured Median(std::vector<Measured> runs) {
    std::sort(runs.begin(), runs.end(), [](const Measured& left, const Measured& right) {
        return left.seconds < right.seconds;
    });
    return runs[runs.size() / 2];
}

std::string Text(const char* form, double number) {
    char text[64];
    std::snprintf(text, sizeof text, form, number);
    return text;
}

std::string Duration(double seconds) {
    return seconds < 1e-6   ? Text("%.3g ns", seconds * 1e9)
           : seconds < 1e-3 ? Text("%.3g us", seconds * 1e6)
           : seconds < 1    ? Text("%.3g ms", seconds * 1e3)
                            : Text("%.3g s", seconds);
}

struct Verdict {
    std::string ratio;
    std::string wanted;
    bool isMet = true;
};

Verdict Judge(const Goal& goal, const Measured& ours, const Measured& peer) {
    const double times = ours.seconds / peer.seconds;
    const double rate = ours.itemsASecond > 0 ? ours.itemsASecond : 1 / ours.seconds;
    switch (goal.of) {
        case Goal::Of::TimeRatio:
        case Goal::Of::Growth:
            return {Text("%.3g", times), Text("at most %g", goal.bound), times <= goal.bound};
        case Goal::Of::RateRatio:
            return {Text("%.3g", 1 / times), Text("at least %g", goal.bound),
                    1 / times >= goal.bound};
        case Goal::Of::Time:
            return {"", "at most " + Duration(goal.bound), ours.seconds <= goal.bound};
        case Goal::Of::Rate:
            return {Text("%.3g a second", rate), Text("at least %.3g a second", goal.bound),
                    rate >= goal.bound};
        case Goal::Of::Nothing:
            break;
    }
    return {Text("%.3g", times), "", true};
}

void PrintRow(const std::string& work, const Pair& pair, const Measured& ours,
              const Measured* peer) {
    const std::size_t place = work.find_last_of(" :");
    const bool isHeld = pair.from == 0 || (place != std::string::npos &&
                                           std::atoll(work.c_str() + place + 1) >= pair.from);
    const Verdict verdict = Judge(isHeld ? pair.goal : NoGoal, ours, peer ? *peer : Measured{1, 0});
    const std::string name = pair.goal.of == Goal::Of::Growth ? "half of it" : pair.peer;
    std::printf("| %s | %s | %s | %s | %s | %s | %s |\n", work.c_str(), name.c_str(),
                peer ? Duration(peer->seconds).c_str() : "", Duration(ours.seconds).c_str(),
                verdict.ratio.c_str(), verdict.wanted.c_str(),
                verdict.wanted.empty() ? ""
                : verdict.isMet        ? "met"
                                       : "MISSED");
}

// The only argument of a benchmark that grows, halved.
std::string HalfOf(const std::string& arguments) {
    return std::to_string(std::atoll(arguments.c_str()) / 2);
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
        const bool isGrowth = pair.goal.of == Goal::Of::Growth;
        for (const auto& [arguments, runs] : reporter.kept[pair.ours]) {
            const std::string work = arguments.empty() ? pair.ours : pair.ours + " " + arguments;
            const auto& peers = reporter.kept[isGrowth ? pair.ours : pair.peer];
            const auto peer = peers.find(isGrowth ? HalfOf(arguments) : arguments);
            if (pair.peer.empty() && !isGrowth) {
                PrintRow(work, pair, Median(runs), nullptr);
            } else if (peer != peers.end()) {
                const Measured median = Median(peer->second);
                PrintRow(work, pair, Median(runs), &median);
            }
        }
    }
    benchmark::Shutdown();
    return 0;
}
