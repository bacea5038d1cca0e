// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How long Chromium takes from opening a report of 1,000 clips, with the pictures and sound of
// each, until it can be used.

#include <benchmark/benchmark.h>

#include <cstdio>
#include <filesystem>
#include <string>
#include <vector>

#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "tests/support/Quoted.h"
#include "tests/support/TestFolder.h"

namespace {

constexpr int kOpenings = 7;

// What the openings took, in seconds, and what else was said of them.
struct Openings {
    std::vector<double> seconds;
    std::string said;
};

Openings OpenOften() {
    const TestFolder folder;
    const std::filesystem::path build =
        std::filesystem::read_symlink("/proc/self/exe").parent_path().parent_path();
    const std::string command = "/usr/bin/python3 " + Quoted(CLIPHOST_BROWSER) + " " +
                                Quoted(build / "cliphost") + " " + Quoted(folder.path()) + " " +
                                std::to_string(Sized(1000, 20)) + " " +
                                std::to_string(Sized(kOpenings, 1)) + " 2>&1";
    Openings openings;
    std::FILE* const pipe = popen(command.c_str(), "r");
    char line[1000];
    while (pipe && std::fgets(line, sizeof line, pipe)) {
        double seconds = 0;
        if (std::sscanf(line, "opened in %lf s", &seconds) == 1) {
            openings.seconds.push_back(seconds);
        } else {
            openings.said += line;
        }
    }
    if (!pipe || pclose(pipe) != 0) {
        openings.seconds.clear();
    }
    return openings;
}

}  // namespace

int main(int argc, char** argv) {
    const Openings openings = OpenOften();
    std::printf("%s", openings.said.c_str());
    if (openings.said.compare(0, 8, "skipped:") == 0) {
        return 0;
    }
    std::size_t next = 0;
    benchmark::RegisterBenchmark(
        "OpenReport",
        [&](benchmark::State& state) {
            if (openings.seconds.empty()) {
                state.SkipWithError("the report can't be opened");
                return;
            }
            for (auto _ : state) {
                state.SetIterationTime(openings.seconds[next++ % openings.seconds.size()]);
            }
        })
        ->Iterations(1)
        ->Repetitions(Sized(kOpenings, 1))
        ->UseManualTime()
        ->Unit(benchmark::kMillisecond);
    return RunWithRatios(argc, argv, {{"OpenReport", "", SecondsAtMost(1.5)}});
}
