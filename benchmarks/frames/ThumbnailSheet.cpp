// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The processor time of twelve thumbnails from a film with long groups of pictures: whole calls of
// cliphost, beside ffmpeg that decodes sync samples alone and puts as many into one picture.

#include <benchmark/benchmark.h>
#include <sys/resource.h>

#include <cstdlib>
#include <filesystem>

#include "benchmarks/frames/SampleFilm.h"
#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "tests/support/Quoted.h"

namespace {

namespace fs = std::filesystem;

// Two minutes: one group for each thumbnail.
const SampleFilm& Film() {
    static const SampleFilm film(
        "-c:v libx264 -preset veryfast -g 250 -keyint_min 250 -sc_threshold 0 -bf 2 "
        "-pix_fmt yuv420p -b:v 10M",
        Sized(3000, 24));
    return film;
}

double Seconds(const timeval& time) {
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) * 1e-6;
}

double SecondsOfChildren() {
    rusage used{};
    getrusage(RUSAGE_CHILDREN, &used);
    return Seconds(used.ru_utime) + Seconds(used.ru_stime);
}

void Run(benchmark::State& state, const std::string& command) {
    if (!Film().Works()) {
        state.SkipWithError("the film could not be made");
        return;
    }
    const fs::path sheet = Film().Path() + ".png";
    for (auto _ : state) {
        const double before = SecondsOfChildren();
        if (std::system((command + " " + Quoted(sheet) + " > /dev/null").c_str()) != 0) {
            state.SkipWithError("the command failed");
            break;
        }
        state.SetIterationTime(SecondsOfChildren() - before);
    }
    std::error_code ignored;
    fs::remove(sheet, ignored);
}

void Contact(benchmark::State& state) {
    const fs::path build = fs::read_symlink("/proc/self/exe").parent_path().parent_path();
    Run(state, Quoted(build / "cliphost") + " contact " + Quoted(Film().Path()) + " -o");
}

void Ffmpeg(benchmark::State& state) {
    Run(state, "ffmpeg -y -v error -skip_frame nokey -i " + Quoted(Film().Path()) +
                   " -vf scale=320:180:flags=area,tile=4x3 -frames:v 1");
}

BENCHMARK(Contact)->Unit(benchmark::kMillisecond)->UseManualTime();
BENCHMARK(Ffmpeg)->Unit(benchmark::kMillisecond)->UseManualTime();

}  // namespace

int main(int argc, char** argv) {
    return RunWithRatios(
        argc, argv, {{"Contact", "", SecondsAtMost(0.4)}, {"Contact", "Ffmpeg", TimesAtMost(1)}});
}
