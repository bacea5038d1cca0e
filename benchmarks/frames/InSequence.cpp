// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Frames in sequence in each pixel format that is offered, from sources of 8, 10 and 12
// bits, beside the ffmpeg command that decodes the same file to the nearest format of its
// own. Its start is part of its time; with this many frames that is a few in a hundred.

#include <benchmark/benchmark.h>

#include <cstdlib>
#include <map>
#include <memory>
#include <vector>

#include "benchmarks/frames/SampleFilm.h"
#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "tests/support/Quoted.h"

namespace {

struct Layout {
    const char* name;
    ncfUInt32 fourCC;
    const char* ffmpegArguments;
};
constexpr Layout k2vuy{"2vuy", 0x32767579, "-pix_fmt uyvy422"};
constexpr Layout kV210{"v210", 0x76323130, "-c:v v210"};
constexpr Layout kB64a{"b64a", 0x62363461, "-pix_fmt rgba64be"};
constexpr Layout kR4fl{"r4fl", 0x7234666C, "-pix_fmt gbrapf32le"};
constexpr Layout kBgra{"BGRA", 0x42475241, "-pix_fmt bgra"};

// The decoder delivers 4:2:0 in 8 bits, 4:2:2 in 10 and 4:4:4 in 12.
struct Depth {
    const char* name;
    const char* codec;
    const char* interlaced;  // what the codec needs to be told for fields
    int frames;              // of 1920 by 1080
    std::vector<Layout> layouts;
};
const Depth kDepths[] = {
    {"8_bits",
     "-c:v libx264 -preset fast -g 25 -bf 2 -pix_fmt yuv420p -b:v 20M",
     " -flags +ildct+ilme -top 1",
     250,
     {k2vuy, kBgra}},
    {"10_bits",
     "-c:v prores_ks -profile:v 2",
     " -flags +ildct -top 1",
     100,
     {k2vuy, kV210, kB64a, kR4fl, kBgra}},
    {"12_bits",
     "-c:v prores_ks -profile:v 4 -pix_fmt yuv444p10",
     " -flags +ildct -top 1",
     80,
     {k2vuy, kV210, kB64a, kR4fl, kBgra}},
};

struct Raster {
    const char* name;
    const char* size;
    int share;  // of the frames
    bool isInterlaced;
};
constexpr Raster kRasters[] = {{"1080p", "1920x1080", 1, false},
                               {"1080i", "1920x1080", 1, true},
                               {"2160p", "3840x2160", 3, false}};

// Made when first asked for.
const SampleFilm& FilmOf(const Depth& depth, const Raster& raster) {
    static std::map<std::string, std::unique_ptr<SampleFilm>> films;
    auto& film = films[std::string(depth.name) + raster.name];
    if (!film) {
        film = std::make_unique<SampleFilm>(
            depth.codec + std::string(raster.isInterlaced ? depth.interlaced : ""),
            Sized(depth.frames / raster.share, 3), raster.size);
    }
    return *film;
}

void CountFrames(benchmark::State& state, int frames) {
    state.counters["frames/s"] =
        benchmark::Counter(static_cast<double>(frames) * static_cast<double>(state.iterations()),
                           benchmark::Counter::kIsRate);
}

void Reader(benchmark::State& state, const SampleFilm& film, const Layout& layout) {
    std::vector<unsigned char> picture;
    for (auto _ : state) {
        const auto reader = film.Open(layout.fourCC);
        if (!film.Works() || !reader) {
            state.SkipWithError("the film could not be made or opened");
            break;
        }
        picture.resize(reader->GetFrameBufferSize(0xFFFFFFFF, 0, 0));
        for (int i = 0; i < film.Frames(); ++i) {
            if (reader->ReadFrame(static_cast<ncfUInt64>(i), picture.data(), 0, 0, 0) != NCF_OK) {
                state.SkipWithError("a frame did not decode");
                return;
            }
        }
    }
    CountFrames(state, film.Frames());
}

void Ffmpeg(benchmark::State& state, const SampleFilm& film, const Layout& layout) {
    const std::string command = "ffmpeg -y -v error -i " + Quoted(film.Path()) + " -f rawvideo " +
                                layout.ffmpegArguments + " /dev/null";
    for (auto _ : state) {
        if (!film.Works() || std::system(command.c_str()) != 0) {
            state.SkipWithError("the ffmpeg command failed");
            break;
        }
    }
    CountFrames(state, film.Frames());
}

using Measure = void (*)(benchmark::State&, const SampleFilm&, const Layout&);

std::string Register(const char* who, Measure measure, const Depth& depth, const Raster& raster,
                     const Layout& layout) {
    const std::string name =
        std::string(who) + "/" + depth.name + "_" + raster.name + "_" + layout.name;
    benchmark::RegisterBenchmark(
        name.c_str(),
        [&, measure](benchmark::State& state) { measure(state, FilmOf(depth, raster), layout); })
        ->Unit(benchmark::kMillisecond)
        ->UseRealTime();
    return name;
}

}  // namespace

int main(int argc, char** argv) {
    std::vector<Pair> pairs;
    for (const Depth& depth : kDepths) {
        for (const Raster& raster : kRasters) {
            for (const Layout& layout : depth.layouts) {
                pairs.push_back({Register("Reader", Reader, depth, raster, layout),
                                 Register("Ffmpeg", Ffmpeg, depth, raster, layout),
                                 RateAtLeast(1)});
            }
        }
    }
    return RunWithRatios(argc, argv, pairs);
}
