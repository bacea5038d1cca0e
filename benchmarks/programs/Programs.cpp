// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How long a caller waits for whole programs: cliphost that tells its version or its types, and
// that describes a movie without FFmpeg, beside ffprobe and mediainfo for one of these.

#include <benchmark/benchmark.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <string>
#include <vector>

#include "benchmarks/support/Ratios.h"
#include "reference_host/movie_writer/Movie.h"
#include "tests/support/Quoted.h"

namespace {

namespace fs = std::filesystem;

// Short movies, deleted when the process ends: pictures and sound, DV of PAL, sound alone.
class ShortMovies {
public:
    ShortMovies()
        : folder_(fs::temp_directory_path() / ("bench-program-" + std::to_string(getpid()))) {
        fs::create_directories(folder_);
        movies::VideoFormat prores;
        prores.codec = "apcn";
        movies::VideoFormat dv;
        dv.codec = "dvcp";
        dv.width = 720;
        dv.height = 576;
        const movies::Track sound = movies::SoundTrack(movies::SoundFormat(), 96000);
        Write("prores", {movies::VideoTrack(prores, 50, 25, 1), sound});
        Write("dv", {movies::VideoTrack(dv, 50, 25, 1), sound});
        Write("sound", {sound});
    }
    ~ShortMovies() { fs::remove_all(folder_); }
    std::string Folder() const { return Quoted(folder_); }
    std::string Path(const std::string& name) const { return Quoted(folder_ / (name + ".mov")); }

private:
    void Write(const std::string& name, const std::vector<movies::Track>& tracks) {
        movies::Movie movie;
        movie.tracks = tracks;
        movies::Build(movie).WriteTo((folder_ / (name + ".mov")).string());
    }

    fs::path folder_;
};

const ShortMovies& Movies() {
    static const ShortMovies movies;
    return movies;
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
    Run(state, Cliphost("scan " + Movies().Folder()));
}
void Describe(benchmark::State& state) {
    Run(state, Cliphost("describe " + Movies().Path("prores")));
}
void DescribeDv(benchmark::State& state) {
    Run(state, Cliphost("describe " + Movies().Path("dv")));
}
void DescribeSound(benchmark::State& state) {
    Run(state, Cliphost("describe " + Movies().Path("sound")));
}
void Ffprobe(benchmark::State& state) {
    Run(state, "ffprobe -v error -show_format -show_streams " + Movies().Path("prores"));
}
void Mediainfo(benchmark::State& state) {
    Run(state, "mediainfo " + Movies().Path("prores"));
}

BENCHMARK(Nothing)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Version)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Types)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Plugin)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Scan)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(Describe)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(DescribeDv)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(DescribeSound)->Unit(benchmark::kMillisecond)->UseRealTime();
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
                          {"DescribeDv", "", SecondsAtMost(0.008)},
                          {"DescribeSound", "", SecondsAtMost(0.008)},
                          {"Describe", "Ffprobe", TimesAtMost(0.25)},
                          {"Describe", "Mediainfo", TimesAtMost(1)}});
}
