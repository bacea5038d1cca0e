// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// How long it takes to describe a movie whose tables hold 100 to 10,000,000
// samples, beside reading and hashing the same bytes, and beside ffprobe. The
// media are a hole, so they cost nothing; with a hole of 100 GB in front of
// them nothing changes.

#include <benchmark/benchmark.h>
#include <fcntl.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <map>
#include <memory>

#include "benchmarks/header_parser/LongMovie.h"
#include "benchmarks/support/Brief.h"
#include "benchmarks/support/ColdFiles.h"
#include "benchmarks/support/Ratios.h"
#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/cliphost/Describe.h"
#include "tests/support/Quoted.h"

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
    // A virtual machine that gets memory from its host takes longer for that than for all
    // else, and one long description may be all that is timed.
    cliphost::DescribeMovie(session, path);
    for (auto _ : state) {
        MakeCold(state, path);
        const cliphost::Description description = cliphost::DescribeMovie(session, path);
        if (!description.file) {
            state.SkipWithError(LineOf(description.problem).c_str());
            break;
        }
    }
}

// The header's bytes, in the order of the file, with nothing read ahead, as the
// module reads them.
void ReadAndHash(benchmark::State& state) {
    const LongMovieFile& file = FileOf(state.range(0));
    constexpr std::uint64_t kSector = 4096;
    constexpr std::uint64_t kPiece = 1 << 20;
    const std::uint64_t start = file.HeaderPosition() / kSector * kSector;
    const std::uint64_t size = file.HeaderPosition() + file.HeaderSize() - start;
    const std::unique_ptr<void, void (*)(void*)> buffer(std::aligned_alloc(kSector, kPiece),
                                                        std::free);
    for (auto _ : state) {
        MakeCold(state, file.Path());
        const int descriptor = open(file.Path().c_str(), O_RDONLY);
        posix_fadvise(descriptor, 0, 0, POSIX_FADV_RANDOM);
        void* digest = nullptr;
        GUID id{};
        GenerateUMIDFromData_Begin(&digest);
        for (std::uint64_t at = 0; at < size; at += kPiece) {
            const ssize_t got =
                pread(descriptor, buffer.get(), kPiece, static_cast<off_t>(start + at));
            if (got <= 0) {
                state.SkipWithError("the header can't be read");
                break;
            }
            GenerateUMIDFromData_AddData(&digest, static_cast<ncfUInt32>(got),
                                         static_cast<const unsigned char*>(buffer.get()));
        }
        GenerateUMIDFromData_Finish(&digest, &id);
        close(descriptor);
        benchmark::DoNotOptimize(id);
    }
}

void Ffprobe(benchmark::State& state) {
    const std::filesystem::path path = FileOf(state.range(0)).Path();
    const std::string command =
        "ffprobe -v error -show_format -show_streams " + Quoted(path) + " > /dev/null 2>&1";
    for (auto _ : state) {
        MakeCold(state, path);
        if (std::system(command.c_str()) != 0) {
            state.SkipWithError("ffprobe failed");
            break;
        }
    }
}

BENCHMARK(Describe)
    ->RangeMultiplier(10)
    ->Range(100, Sized(10000000, 1000))
    ->Unit(benchmark::kMicrosecond)
    ->UseRealTime();
BENCHMARK(ReadAndHash)
    ->RangeMultiplier(10)
    ->Range(100, Sized(10000000, 1000))
    ->Unit(benchmark::kMicrosecond)
    ->UseRealTime();
BENCHMARK(Ffprobe)
    ->RangeMultiplier(10)
    ->Range(100, Sized(10000000, 1000))
    ->Unit(benchmark::kMicrosecond)
    ->UseRealTime();

}  // namespace

int main(int argc, char** argv) {
    return RunWithRatios(argc, argv,
                         {{"Describe", "ReadAndHash", TimesAtMost(2), 100000},
                          {"Describe", "Ffprobe", TimesAtMost(0.25)}});
}
