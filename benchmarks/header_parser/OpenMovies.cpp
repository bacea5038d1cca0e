// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How long it takes to know a movie whose tables hold 100 to 10,000,000
// samples, beside reading the same header bytes and doing nothing with them.

#include <benchmark/benchmark.h>

#include <cstdio>
#include <map>
#include <memory>

#include "benchmarks/header_parser/LongMovie.h"
#include "benchmarks/support/Brief.h"
#include "benchmarks/support/Ratios.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/util/Ref.h"

namespace {

LongMovieFile& FileOf(std::uint64_t samples) {
    static std::map<std::uint64_t, std::unique_ptr<LongMovieFile>> files;
    std::unique_ptr<LongMovieFile>& file = files[samples];
    if (!file) {
        file = std::make_unique<LongMovieFile>(samples);
    }
    return *file;
}

struct Stream {
    explicit Stream(const LongMovieFile& file) : handle(std::fopen(file.Path().c_str(), "rb")) {
        std::setvbuf(handle, nullptr, _IONBF, 0);
    }
    ~Stream() { std::fclose(handle); }
    Stream(const Stream&) = delete;
    Stream& operator=(const Stream&) = delete;

    ncfUInt32 Read(ncfUInt64 position, ncfUInt8* to, ncfUInt32 size) const {
        std::fseek(handle, static_cast<long>(position), SEEK_SET);
        return static_cast<ncfUInt32>(std::fread(to, 1, size, handle));
    }
    std::FILE* handle;
};

void ParseHeader(benchmark::State& state) {
    const auto samples = static_cast<std::uint64_t>(state.range(0));
    const LongMovieFile& file = FileOf(samples);
    for (auto _ : state) {
        const Stream stream(file);
        const auto parser = host::MakeRef<header_parser::QTParser>();
        const NCFRESULT result = header_parser::ReadHeaders(
            *parser, [&](ncfUInt64 position, ncfUInt8* to, ncfUInt32 size) {
                return stream.Read(position, to, size);
            });
        host::Ref<IVideoTrackInfo> track;
        host::Ref<IQTSampleTable> table;
        ncfUInt64 count = 0;
        if (result != NCF_OK || parser->GetVideoTrackInfo(0, track.Out()) != NCF_OK ||
            track->GetSampleTable(table.Out()) != NCF_OK ||
            table->GetNumSamples(&count) != NCF_OK || count != samples) {
            state.SkipWithError("the movie was not understood");
            break;
        }
    }
    state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations() * file.HeaderSize()));
}

void ReadTheSameBytes(benchmark::State& state) {
    const LongMovieFile& file = FileOf(static_cast<std::uint64_t>(state.range(0)));
    constexpr ncfUInt64 kPiece = 1 << 20;
    for (auto _ : state) {
        const Stream stream(file);
        std::vector<ncfUInt8> bytes(file.HeaderSize());
        for (ncfUInt64 at = 0; at < bytes.size(); at += kPiece) {
            const auto size = static_cast<ncfUInt32>(std::min(kPiece, bytes.size() - at));
            stream.Read(file.HeaderPosition() + at, bytes.data() + at, size);
        }
        benchmark::DoNotOptimize(bytes.data());
    }
    state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations() * file.HeaderSize()));
}

BENCHMARK(ParseHeader)
    ->RangeMultiplier(10)
    ->Range(100, Sized(10000000, 1000))
    ->Unit(benchmark::kMicrosecond);
BENCHMARK(ReadTheSameBytes)
    ->RangeMultiplier(10)
    ->Range(100, Sized(10000000, 1000))
    ->Unit(benchmark::kMicrosecond);

}  // namespace

int main(int argc, char** argv) {
    return RunWithRatios(argc, argv, {{"ParseHeader", "ReadTheSameBytes", NoGoal}});
}
