// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How long it takes to describe a movie whose tables hold 100 to 10,000,000
// samples, beside reading and hashing the same bytes, and beside ffprobe. The
// media are a hole, so they cost nothing; with a hole of 100 GB in front of
// them nothing changes.

#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstdlib>
#include <map>
#include <memory>

#include "benchmarks/header_parser/LongMovie.h"
#include "benchmarks/support/Ratios.h"
#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/cliphost/Describe.h"

namespace {

LongMovieFile& FileOf(std::int64_t samples) {
    static std::map<std::int64_t, std::unique_ptr<LongMovieFile>> files;
    std::unique_ptr<LongMovieFile>& file = files[samples];
    if (!file) {
        file = std::make_unique<LongMovieFile>(static_cast<std::uint64_t>(samples));
    }
    return *file;
}

cliphost::Session& TheSession() {
    static cliphost::Session* const session = [] {
        cliphost::SessionOptions options;
        options.programFolder =
            std::filesystem::read_symlink("/proc/self/exe").parent_path().parent_path();
        return new cliphost::Session(options);
    }();
    return *session;
}

void Describe(benchmark::State& state) {
    const std::filesystem::path path = FileOf(state.range(0)).Path();
    cliphost::Session& session = TheSession();
    for (auto _ : state) {
        const cliphost::Description description = cliphost::DescribeMovie(session, path);
        if (!description.file) {
            state.SkipWithError(description.problem.c_str());
            break;
        }
    }
}

void ReadAndHash(benchmark::State& state) {
    const LongMovieFile& file = FileOf(state.range(0));
    constexpr std::uint64_t kPiece = 1 << 20;
    for (auto _ : state) {
        std::FILE* const stream = std::fopen(file.Path().c_str(), "rb");
        std::vector<unsigned char> bytes(file.HeaderSize());
        std::fseek(stream, static_cast<long>(file.HeaderPosition()), SEEK_SET);
        for (std::uint64_t at = 0; at < bytes.size(); at += kPiece) {
            const std::size_t wanted = std::min(kPiece, bytes.size() - at);
            if (std::fread(bytes.data() + at, 1, wanted, stream) != wanted) {
                state.SkipWithError("the header can't be read");
                break;
            }
        }
        std::fclose(stream);
        void* digest = nullptr;
        GUID id{};
        GenerateUMIDFromData_Begin(&digest);
        GenerateUMIDFromData_AddData(&digest, static_cast<ncfUInt32>(bytes.size()), bytes.data());
        GenerateUMIDFromData_Finish(&digest, &id);
        benchmark::DoNotOptimize(id);
    }
}

void Ffprobe(benchmark::State& state) {
    const std::string command = "ffprobe -v quiet -show_format -show_streams '" +
                                FileOf(state.range(0)).Path().string() + "' > /dev/null";
    for (auto _ : state) {
        if (std::system(command.c_str()) != 0) {
            state.SkipWithError("ffprobe failed");
            break;
        }
    }
}

BENCHMARK(Describe)
    ->RangeMultiplier(10)
    ->Range(100, 10000000)
    ->Unit(benchmark::kMicrosecond)
    ->UseRealTime();
BENCHMARK(ReadAndHash)
    ->RangeMultiplier(10)
    ->Range(100, 10000000)
    ->Unit(benchmark::kMicrosecond)
    ->UseRealTime();
BENCHMARK(Ffprobe)
    ->RangeMultiplier(10)
    ->Range(100, 10000000)
    ->Unit(benchmark::kMicrosecond)
    ->UseRealTime();

}  // namespace

int main(int argc, char** argv) {
    return RunWithRatios(argc, argv,
                         {{"Describe", "ReadAndHash", "at most 2, for long tables"},
                          {"Describe", "Ffprobe", "at most 0.3"}});
}
