// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Frames in sequence in each pixel format that is offered, from a source of 8
// and one of 10 bits, beside the ffmpeg command that decodes the same file to
// the nearest format of its own. Its start is part of its time; with this many
// frames that is a few in a hundred.

#include <benchmark/benchmark.h>

#include <cstdlib>
#include <vector>

#include "benchmarks/frames/SampleFilm.h"
#include "benchmarks/support/Brief.h"
#include "tests/support/Quoted.h"

namespace {

const SampleFilm& FilmOf(int depth) {
    static const SampleFilm eight("-c:v libx264 -preset fast -g 25 -bf 2 -pix_fmt yuv420p -b:v 20M",
                                  Sized(250, 10));
    static const SampleFilm ten("-c:v prores_ks -profile:v 2", Sized(100, 10));
    return depth == 8 ? eight : ten;
}

void CountFrames(benchmark::State& state, int frames) {
    state.counters["frames/s"] =
        benchmark::Counter(static_cast<double>(frames) * static_cast<double>(state.iterations()),
                           benchmark::Counter::kIsRate);
}

void Reader(benchmark::State& state, int depth, ncfUInt32 fourCC) {
    const SampleFilm& film = FilmOf(depth);
    std::vector<unsigned char> picture;
    for (auto _ : state) {
        const auto reader = film.Open(fourCC);
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

void Ffmpeg(benchmark::State& state, int depth, const char* arguments) {
    const SampleFilm& film = FilmOf(depth);
    const std::string command =
        "ffmpeg -y -v error -i " + Quoted(film.Path()) + " -f rawvideo " + arguments + " /dev/null";
    for (auto _ : state) {
        if (!film.Works() || std::system(command.c_str()) != 0) {
            state.SkipWithError("the ffmpeg command failed");
            break;
        }
    }
    CountFrames(state, film.Frames());
}

#define PAIR(depth, code, fourCC, arguments)                    \
    BENCHMARK_CAPTURE(Reader, depth##_##code, depth, fourCC)    \
        ->Unit(benchmark::kMillisecond)                         \
        ->UseRealTime();                                        \
    BENCHMARK_CAPTURE(Ffmpeg, depth##_##code, depth, arguments) \
        ->Unit(benchmark::kMillisecond)                         \
        ->UseRealTime()

PAIR(8, 2vuy, 0x32767579, "-pix_fmt uyvy422");
PAIR(8, BGRA, 0x42475241, "-pix_fmt bgra");
PAIR(10, 2vuy, 0x32767579, "-pix_fmt uyvy422");
PAIR(10, v210, 0x76323130, "-c:v v210");
PAIR(10, b64a, 0x62363461, "-pix_fmt rgba64be");
PAIR(10, r4fl, 0x7234666C, "-pix_fmt gbrapf32le");
PAIR(10, BGRA, 0x42475241, "-pix_fmt bgra");

}  // namespace

BENCHMARK_MAIN();
