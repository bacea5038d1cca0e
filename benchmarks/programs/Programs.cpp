// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How long a caller waits for whole programs: cliphost that tells its version or its types, and
// that describes one movie, beside ffprobe and mediainfo for the same movie.

#include <benchmark/benchmark.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <string>

#include "benchmarks/support/Ratios.h"
#include "tests/support/Quoted.h"
#include "tests/support/movies/Movie.h"

namespace {

namespace fs = std::filesystem;

// A short movie with one picture and one sound track in a folder of its own, deleted when the
// process ends.
class ShortMovie {
public:
    ShortMovie()
        : folder_(fs::temp_directory_path() / ("bench-program-" + std::to_string(getpid()))) {
        fs::create_directories(folder_);
        movies::Movie movie;
        movies::VideoFormat format;
        format.codec = "apcn";
        movie.tracks.push_back(movies::VideoTrack(format, 50, 25, 1));
        movie.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 96000));
        movies::Build(movie).WriteTo((folder_ / "short.mov").string());
    }
    ~ShortMovie() { fs::remove_all(folder_); }
    std::string Folder() const { return Quoted(folder_); }
    std::string Path() const { return Quoted(folder_ / "short.mov"); }

private:
    fs::path folder_;
};

const ShortMovie& TheMovie() {
    static const ShortMovie movie;
    return movie;
}

void Run(benchmark::State& state, const std::string& command) {
    for (auto _ : state) {
        if (std::system((command + " > /dev/null").c_str()) != 0) {
            state.SkipWithError("the command failed");
            break;
        }
    }
}

std::string Cliphost(const std::string& arguments) {
    const fs::path build = fs::read_symlink("/proc/self/exe").parent_path().parent_path();
    return Quoted(build / "cliphost") + " " + arguments;
}

// What any program costs that is started through a shell.
void Nothing(benchmark::State& state) {
    Run(state, "true");
}
void Version(benchmark::State& state) {
    Run(state, Cliphost("--version"));
}
void Types(benchmark::State& state) {
    Run(state, Cliphost("types"));
}
void Plugin(benchmark::State& state) {
    Run(state, Cliphost("plugin"));
}
void Scan(benchmark::State& state) {
    Run(state, Cliphost("scan " + TheMovie().Folder()));
}
void Describe(benchmark::State& state) {
    Run(state, Cliphost("describe " + TheMovie().Path()));
}
void Ffprobe(benchmark::State& state) {
    Run(state, "ffprobe -v error -show_format -show_streams " + TheMovie().Path());
}
void Mediainfo(benchmark::State& state) {
    Run(state, "mediainfo " + TheMovie().Path());
}

BENCHMARK(Nothing)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Version)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Types)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Plugin)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Scan)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Describe)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Ffprobe)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Mediainfo)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace

int main(int argc, char** argv) {
    return RunWithRatios(argc, argv,
                         {{"Version", "", SecondsAtMost(0.008)},
                          {"Types", "", SecondsAtMost(0.008)},
                          {"Plugin", "", SecondsAtMost(0.008)},
                          {"Scan", "", SecondsAtMost(0.008)},
                          {"Describe", "", SecondsAtMost(0.008)},
                          {"Describe", "Ffprobe", TimesAtMost(0.25)},
                          {"Describe", "Mediainfo", TimesAtMost(1)}});
}
