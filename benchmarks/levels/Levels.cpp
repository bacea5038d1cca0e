// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What a picture costs on its way through the level tables, the extraction of
// alpha and the float conversion, beside a copy of the same bytes: those that
// the step reads. Each result is checked before the clock starts.

#include <benchmark/benchmark.h>

#include <cstring>
#include <random>
#include <vector>

#include "benchmarks/support/Ratios.h"
#include "source/essence/AlphaExtraction.h"
#include "source/essence/FloatConversion.h"
#include "source/essence/FormatEnums.h"
#include "source/essence/LevelTables.h"
#include "source/essence/MediaFormat.h"
#include "source/essence/PixelLevels.h"

namespace {

constexpr ncfUInt32 kWidth = 1920;
constexpr ncfUInt32 kHeight = 1080;
constexpr std::size_t kPixels = std::size_t{kWidth} * kHeight;

using Bytes = std::vector<ncfUInt8>;

// Smooth rows with a little noise, as pictures have.
Bytes Picture(std::size_t size) {
    std::mt19937 random(1);
    Bytes bytes(size);
    for (std::size_t i = 0; i < size; ++i) {
        bytes[i] = static_cast<ncfUInt8>((i >> 6) + random() % 4);
    }
    return bytes;
}

Bytes FloatPicture() {
    std::mt19937 random(1);
    std::uniform_real_distribution<float> part(0.0f, 1.0f);
    Bytes bytes(kPixels * kR4flPixelBytes);
    for (std::size_t i = 0; i < kPixels * 4; ++i) {
        const float value = part(random);
        std::memcpy(bytes.data() + i * sizeof value, &value, sizeof value);
    }
    return bytes;
}

void Count(benchmark::State& state, std::size_t bytes) {
    state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations() * bytes));
    state.counters["frames/s"] =
        benchmark::Counter(static_cast<double>(state.iterations()), benchmark::Counter::kIsRate);
}

void Copy(benchmark::State& state, std::size_t bytesAPixel) {
    const Bytes source = Picture(kPixels * bytesAPixel);
    Bytes destination(source.size());
    for (auto _ : state) {
        std::memcpy(destination.data(), source.data(), source.size());
        benchmark::ClobberMemory();
    }
    Count(state, source.size());
}

// In place: the picture is read and written where it lies. Runs over a copy so
// that the values don't drift to an end of the range.
void Levels(benchmark::State& state, ncfUInt32 pixelFormat, ncfUInt32 componentType,
            std::size_t bytesAPixel, ncfUInt32 mode) {
    Bytes picture = Picture(kPixels * bytesAPixel);
    const Bytes before(picture);
    RemapPixelLevels(pixelFormat, componentType, picture.data(), picture.size(), &mode);
    const LevelTables& tables = LevelTables::Get();
    if (mode == Expand_Levels && bytesAPixel == 4 && picture[4] != tables.expand8[before[4]]) {
        state.SkipWithError("the levels are wrong");
        return;
    }
    for (auto _ : state) {
        RemapPixelLevels(pixelFormat, componentType, picture.data(), picture.size(), &mode);
        benchmark::ClobberMemory();
    }
    Count(state, picture.size());
}

// A pixel format without levels, such as 'PF_Mono', leaves the conversion alone.
void Convert(benchmark::State& state, PixelConversion convertFrame, const Bytes& source,
             std::size_t bytesOut, ncfUInt32 pixelFormat = PF_Mono,
             ncfUInt32 mode = Default_Levels) {
    Bytes destination(kPixels * bytesOut);
    const auto convert = [&] {
        LevelPass levels(pixelFormat, CT_USHORT_BE_VideoRange, destination.data(),
                         destination.size(), mode);
        convertFrame(source.data(), destination.data(), source.size(), destination.size(), kWidth,
                     kHeight, levels);
        levels.Finish();
    };
    convert();
    if (destination == Bytes(destination.size())) {
        state.SkipWithError("nothing was converted");
        return;
    }
    for (auto _ : state) {
        convert();
        benchmark::ClobberMemory();
    }
    Count(state, source.size());
}

void CopyBGRA(benchmark::State& state) {
    Copy(state, 4);
}
void OpaqueBGRA(benchmark::State& state) {
    Levels(state, PF_BGRA, CT_UCHAR, 4, Default_Levels);
}
void ExpandBGRA(benchmark::State& state) {
    Levels(state, PF_BGRA, CT_UCHAR, 4, Expand_Levels);
}
void CompressBGRA(benchmark::State& state) {
    Levels(state, PF_BGRA, CT_UCHAR, 4, Compress_Levels);
}
void AlphaOfBGRA(benchmark::State& state) {
    Convert(state, &ExtractAlpha8, Picture(kPixels * 4), 1);
}
void CopyB64a(benchmark::State& state) {
    Copy(state, 8);
}
void OpaqueB64a(benchmark::State& state) {
    Levels(state, PF_ARGB, CT_USHORT_BE_VideoRange, 8, Default_Levels);
}
void ExpandB64a(benchmark::State& state) {
    Levels(state, PF_ARGB, CT_USHORT_BE_VideoRange, 8, Expand_Levels);
}
void CompressB64a(benchmark::State& state) {
    Levels(state, PF_ARGB, CT_USHORT_BE_VideoRange, 8, Compress_Levels);
}
void AlphaOfB64a(benchmark::State& state) {
    Convert(state, &ExtractAlpha10FromB64a, Picture(kPixels * 8), 2);
}
void CopyR4fl(benchmark::State& state) {
    Copy(state, 16);
}
void AlphaOfR4fl(benchmark::State& state) {
    Convert(state, &ExtractAlpha10FromR4fl, FloatPicture(), 2);
}
void R4flToB64a(benchmark::State& state) {
    Convert(state, &ConvertR4flToB64a, FloatPicture(), 8);
}
void R4flToOpaqueB64a(benchmark::State& state) {
    Convert(state, &ConvertR4flToB64a, FloatPicture(), 8, PF_ARGB);
}
void R4flToExpandedB64a(benchmark::State& state) {
    Convert(state, &ConvertR4flToB64a, FloatPicture(), 8, PF_ARGB, Expand_Levels);
}

BENCHMARK(CopyBGRA);
BENCHMARK(OpaqueBGRA);
BENCHMARK(ExpandBGRA);
BENCHMARK(CompressBGRA);
BENCHMARK(AlphaOfBGRA);
BENCHMARK(CopyB64a);
BENCHMARK(OpaqueB64a);
BENCHMARK(ExpandB64a);
BENCHMARK(CompressB64a);
BENCHMARK(AlphaOfB64a);
BENCHMARK(CopyR4fl);
BENCHMARK(AlphaOfR4fl);
BENCHMARK(R4flToB64a);
BENCHMARK(R4flToOpaqueB64a);
BENCHMARK(R4flToExpandedB64a);

}  // namespace

int main(int argc, char** argv) {
    std::vector<Pair> pairs;
    for (const char* ours : {"ExpandBGRA", "CompressBGRA", "OpaqueBGRA", "AlphaOfBGRA"}) {
        pairs.push_back({ours, "CopyBGRA", RateAtLeast(0.9)});
    }
    for (const char* ours : {"ExpandB64a", "CompressB64a", "OpaqueB64a", "AlphaOfB64a"}) {
        pairs.push_back({ours, "CopyB64a", RateAtLeast(0.9)});
    }
    for (const char* ours : {"R4flToB64a", "AlphaOfR4fl"}) {
        pairs.push_back({ours, "CopyR4fl", RateAtLeast(0.9)});
    }
    return RunWithRatios(argc, argv, pairs);
}
