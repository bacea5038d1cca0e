// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How much faster two jobs describe a folder than one, and how much faster the machine lets two
// programs be that know nothing of each other and take half of the folder each.

#include <benchmark/benchmark.h>

#include <cstdlib>
#include <filesystem>
#include <string>

#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "benchmarks/support/ShortMovies.h"
#include "tests/support/Quoted.h"
#include "tests/support/TestFolder.h"

namespace {

namespace fs = std::filesystem;

const int kMovies = Sized(8000, 20);

// Half of the movies in either folder.
class TwoFolders {
public:
    TwoFolders() {
        for (const char* const half : {"a", "b"}) {
            fs::create_directory(folder_ / half);
            WriteShortMovies(folder_ / half, kMovies / 2);
        }
    }
    std::string Half(const char* name) const { return Quoted(folder_ / name); }

private:
    TestFolder folder_;
};

const TwoFolders& Folders() {
    static const TwoFolders folders;
    return folders;
}

std::string Described(const std::string& jobs, const std::string& folders) {
    const fs::path build = fs::read_symlink("/proc/self/exe").parent_path().parent_path();
    return Quoted(build / "cliphost") + " describe -q --jobs " + jobs + " " + folders +
           " > /dev/null 2>&1";
}

void Run(benchmark::State& state, const std::string& command) {
    for (auto _ : state) {
        if (std::system(command.c_str()) != 0) {
            state.SkipWithError("the command failed");
            break;
        }
    }
}

void OneJob(benchmark::State& state) {
    Run(state, Described("1", Folders().Half("a") + " " + Folders().Half("b")));
}
void TwoJobs(benchmark::State& state) {
    Run(state, Described("2", Folders().Half("a") + " " + Folders().Half("b")));
}
void TwoPrograms(benchmark::State& state) {
    Run(state, Described("1", Folders().Half("a")) + " & " + Described("1", Folders().Half("b")) +
                   " && wait $!");
}

BENCHMARK(OneJob)->Unit(benchmark::kMillisecond)->UseRealTime()->Repetitions(5);
BENCHMARK(TwoJobs)->Unit(benchmark::kMillisecond)->UseRealTime()->Repetitions(5);
BENCHMARK(TwoPrograms)->Unit(benchmark::kMillisecond)->UseRealTime()->Repetitions(5);

}  // namespace

int main(int argc, char** argv) {
    return RunWithRatios(argc, argv,
                         {{"TwoJobs", "OneJob", RateAtLeast(1.8)},
                          {"TwoPrograms", "OneJob", NoGoal},
                          {"TwoJobs", "TwoPrograms", NoGoal}});
}
