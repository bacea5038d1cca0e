// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What a call of cliphost costs when its input doubles, and doubles again, in processor time, less
// what it costs with next to no input. Work that is linear in the input takes twice the time, the
// sorting of a folder a tenth more, and tables that no longer fit in the processor's caches another
// tenth; quadratic work takes four times, and where it is a quarter of all, 2.5 times. So 2.3 is
// the bound. The largest inputs are those that the program takes as a whole: movies of 4,096 tracks
// with 1,024 sounds, documents of a mebibyte.

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "benchmarks/growth/TimedCommand.h"
#include "benchmarks/header_parser/LongMovie.h"
#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "reference_host/movie_writer/Movie.h"
#include "tests/support/TestFolder.h"

namespace {

namespace fs = std::filesystem;
using Arguments = std::vector<std::string>;

const TestFolder& Folder() {
    static const TestFolder folder;
    return folder;
}

fs::path InputOf(const std::string& kind, std::int64_t size) {
    return Folder() / (kind + "-" + std::to_string(size));
}

// The input of a kind and size, made when it is first asked for.
template <class Make>
fs::path Input(const std::string& kind, std::int64_t size, const Make& make) {
    const fs::path path = InputOf(kind, size);
    if (!fs::exists(path)) {
        make(path);
    }
    return path;
}

void Write(const movies::Movie& movie, const fs::path& path) {
    movies::Build(movie).WriteTo(path.string());
}

movies::Track Picture(std::uint64_t frames) {
    movies::VideoFormat format;
    format.codec = "apcn";
    return movies::VideoTrack(format, frames, 25, 1);
}

// --- the inputs ----------------------------------------------------------------------------

fs::path LongTables(std::int64_t size) {
    return Input("tables", size, [&](const fs::path& path) {
        Write(LongMovie(static_cast<std::uint64_t>(size)), path);
    });
}

// Sound in chunks that lie apart, so that each is a run of its own.
fs::path SoundInRuns(std::int64_t size) {
    return Input("runs", size, [&](const fs::path& path) {
        movies::Movie movie;
        movie.tracks.push_back(Picture(25));
        movies::Track sound =
            movies::SoundTrack(movies::SoundFormat(), static_cast<std::uint64_t>(size));
        sound.samplesPerChunk = 4;
        sound.gapBetweenChunks = 100;
        movie.tracks.push_back(sound);
        Write(movie, path);
    });
}

// A quarter of the tracks are sounds of one channel, one track is the picture, and the others are
// of kinds that a clip does not take.
fs::path ManyTracks(std::int64_t size) {
    return Input("tracks", size, [&](const fs::path& path) {
        movies::Movie movie;
        movie.tracks.push_back(Picture(25));
        movies::SoundFormat mono;
        mono.channels = 1;
        for (std::int64_t i = 1; i < size; ++i) {
            movie.tracks.push_back(i <= size / 4 ? movies::SoundTrack(mono, 48000)
                                                 : movies::OtherTrack("text", 1, 600, 600));
        }
        Write(movie, path);
    });
}

// Settings of one set, which the clip takes or passes over.
fs::path Settings(std::int64_t size) {
    return Input("settings", size, [&](const fs::path& path) {
        std::string xml =
            "<ncfComponents><component id='0E74B673-0CA8-403B-A142-986D79508637'>"
            "<track number='0'><activeSet>11111111-2222-3333-4444-555555555555</activeSet>"
            "<parameterSet id='11111111-2222-3333-4444-555555555555'><name>Mine</name>";
        for (std::int64_t i = 0; i < size; ++i) {
            char id[40];
            std::snprintf(id, sizeof id, "%08X-0A56-46CA-9260-D006F719B8A4",
                          static_cast<unsigned>(i));
            xml +=
                std::string("<parameter id='") + id + "'><valueUInt32>1</valueUInt32></parameter>";
        }
        Folder().Write(path.filename().string(),
                       xml + "</parameterSet></track></component></ncfComponents>");
    });
}

// A folder of which one entry in a hundred is a movie that the module takes, one a movie that it
// leaves out, and the others are no movies.
fs::path ManyEntries(std::int64_t size) {
    return Input("entries", size, [&](const fs::path& path) {
        fs::create_directory(path);
        for (std::int64_t i = 0; i < size; ++i) {
            const char* const ending = i % 100 == 0 ? ".mov" : i % 100 == 1 ? ".mp4" : ".txt";
            Folder().Write((path.filename() / (std::to_string(i) + ending)).string());
        }
    });
}

// A folder of movies alone: one file under many names.
fs::path ManyMovies(std::int64_t size) {
    const fs::path movie = LongTables(100);
    return Input("movies", size, [&](const fs::path& path) {
        fs::create_directory(path);
        for (std::int64_t i = 0; i < size; ++i) {
            fs::create_hard_link(movie, path / (std::to_string(i) + ".mov"));
        }
    });
}

// --- the calls -----------------------------------------------------------------------------

// One call, for inputs of three sizes.
struct Work {
    const char* name;
    fs::path (*input)(std::int64_t size);
    Arguments before;  // the input's path follows
    std::int64_t largest;
    int status = 0;  // that the call ends with
};

const std::vector<Work> kWorks = {
    {"SamplesOfPicture", LongTables, {"samples"}, 400000},
    {"SamplesAsJson", LongTables, {"samples", "--json"}, 200000},
    {"SamplesOfSound", SoundInRuns, {"samples", "--every"}, 400000},
    {"RunsOfSound", SoundInRuns, {"samples"}, 1600000},
    {"DescribeTables", LongTables, {"describe", "-q"}, 4000000},
    {"DescribeTracks", ManyTracks, {"describe", "-q"}, 4096},
    {"TreeOfTracks", ManyTracks, {"describe"}, 4096},
    {"JsonOfTracks", ManyTracks, {"describe", "--json"}, 4096},
    {"SaveTracks", ManyTracks, {"describe", "-q", "--out-dir"}, 4096},
    // FFmpeg takes a thousand tracks. Where it has to tell of more, the maps are shown all the
    // same, and that is told.
    {"FormatsOfTracks", ManyTracks, {"formats"}, 960},
    {"RunsOfTracks", ManyTracks, {"samples"}, 4096, Sized(1, 0)},
    {"Parameters", Settings, {"params"}, 9600},
    {"ScanEntries", ManyEntries, {"scan"}, 100000},
    {"ScanMovies", ManyMovies, {"scan"}, 32000},
    {"DescribeMovies", ManyMovies, {"describe", "-q", "--jobs", "1"}, 4000},
    {"DescribeMoviesInJobs", ManyMovies, {"describe", "--json", "--jobs", "2"}, 4000},
};

Arguments CommandOf(const Work& work, std::int64_t size) {
    const fs::path build = fs::read_symlink("/proc/self/exe").parent_path().parent_path();
    Arguments command = {(build / "cliphost").string()};
    command.insert(command.end(), work.before.begin(), work.before.end());
    if (work.before.back() == "--out-dir") {
        command.push_back((Folder() / "saved").string());
    }
    if (work.input == Settings) {
        command.insert(command.end(), {LongTables(100).string(), "--set-xml"});
    }
    command.push_back(work.input(size).string());
    return command;
}

// What the call takes however little its input is; less than zero where it fails.
double SecondsOfStart(const Work& work) {
    constexpr std::int64_t kLittle = 16;
    const Arguments command = CommandOf(work, kLittle);
    double least = SecondsOf(command);
    for (int i = 0; i < 4; ++i) {
        least = std::min(least, SecondsOf(command));
    }
    return least;
}

void Run(benchmark::State& state, const Work& work) {
    const Arguments command = CommandOf(work, state.range(0));
    double start = 0.0;
    if (Sized(true, false)) {  // of a brief run nothing else would be left
        start = SecondsOfStart(work);
        // Memory that the machine hands out for the first time would be laid to the size.
        SecondsOf(command, work.status);
    }
    for (auto _ : state) {
        const double seconds = SecondsOf(command, work.status);
        if (seconds < 0 || start < 0) {
            state.SkipWithError("the command failed");
            break;
        }
        state.SetIterationTime(std::max(seconds - start, 1e-4));
    }
}

void Register() {
    for (const Work& work : kWorks) {
        auto* const made = benchmark::RegisterBenchmark(
            work.name, [&work](benchmark::State& state) { Run(state, work); });
        const std::int64_t most =
            Sized(work.largest, std::max<std::int64_t>(work.largest / 256, 16));
        made->Arg(most / 4)->Arg(most / 2)->Arg(most);
        made->Repetitions(Sized(3, 1))->UseManualTime()->Unit(benchmark::kMillisecond);
    }
}

}  // namespace

int main(int argc, char** argv) {
    Register();
    std::vector<Pair> pairs;
    for (const Work& work : kWorks) {
        pairs.push_back({work.name, "", GrowthAtMost(2.3)});
    }
    return RunWithRatios(argc, argv, pairs);
}
