// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Questions about samples at random places of a table, beside a look-up in an
// array that has an entry for each sample. The answers are compared before the
// clock starts.

#include <benchmark/benchmark.h>

#include <map>
#include <random>
#include <vector>

#include "benchmarks/header_parser/LongMovie.h"
#include "benchmarks/support/Ratios.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/movie_writer/TrackAtoms.h"
#include "reference_host/util/Ref.h"

namespace {

struct Plain {
    ncfUInt64 position;
    ncfSInt64 offset;
    ncfUInt32 size;
    ncfUInt32 flags;
};

struct Contest {
    std::vector<Plain> array;
    host::Ref<IQTSampleTable> table;
    std::vector<ncfUInt32> places;  // random, from zero
    bool agree = true;
};

void Expand(const movies::MadeMovie& made, const movies::Track& track, Contest& contest) {
    ncfUInt64 position = 0;
    const auto parser = host::MakeRef<header_parser::QTParser>();
    header_parser::ReadHeaders(*parser, [&](ncfUInt64 at, ncfUInt8* to, ncfUInt32 size) {
        const movies::Bytes bytes = made.Range(at, size);
        std::copy(bytes.begin(), bytes.end(), to);
        return size;
    });
    host::Ref<IVideoTrackInfo> info;
    parser->GetVideoTrackInfo(0, info.Out());
    info->GetSampleTable(contest.table.Out());
    contest.table->GetDataOffset(1, &position);
    std::size_t sample = 0;
    for (const movies::Chunk& chunk : movies::ChunksOf(track)) {
        ncfUInt64 at = position;
        for (std::uint64_t i = 0; i < chunk.samples; ++i, ++sample) {
            const movies::SampleRun& run = track.samples[sample];
            // The smallest display time is that of the first picture.
            contest.array.push_back(
                {at, ncfSInt64{run.displayOffset} - 100, run.size, run.sync ? 1u : 3u});
            at += run.size;
        }
        position = at + track.gapBetweenChunks;
    }
}

bool Agree(const Contest& contest) {
    for (std::size_t i = 0; i < contest.array.size(); ++i) {
        Plain asked{};
        contest.table->GetDataOffset(i + 1, &asked.position);
        contest.table->GetDisplayOffset(i + 1, &asked.offset);
        contest.table->GetDataSizePerSample(i + 1, &asked.size);
        contest.table->GetSampleFlags(i + 1, &asked.flags);
        const Plain& plain = contest.array[i];
        if (asked.position != plain.position || asked.offset != plain.offset ||
            asked.size != plain.size || asked.flags != plain.flags) {
            return false;
        }
    }
    return true;
}

Contest& ContestOf(std::uint64_t samples) {
    static std::map<std::uint64_t, Contest> contests;
    Contest& contest = contests[samples];
    if (contest.array.empty()) {
        const movies::Movie movie = LongMovie(samples);
        Expand(movies::Build(movie), movie.tracks.front(), contest);
        contest.agree = Agree(contest);
        std::mt19937 random(7);
        for (int i = 0; i < 65536; ++i) {
            contest.places.push_back(static_cast<ncfUInt32>(random() % samples));
        }
    }
    return contest;
}

template <typename Query>
void Run(benchmark::State& state, Query query) {
    Contest& contest = ContestOf(static_cast<std::uint64_t>(state.range(0)));
    if (!contest.agree) {
        state.SkipWithError("the table does not answer as the array does");
        return;
    }
    std::size_t next = 0;
    ncfUInt64 sum = 0;
    for (auto _ : state) {
        sum += query(contest, contest.places[next++ % contest.places.size()]);
    }
    benchmark::DoNotOptimize(sum);
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()));
}

void Offset(benchmark::State& state) {
    Run(state, [](const Contest& contest, ncfUInt32 place) {
        ncfUInt64 position = 0;
        contest.table->GetDataOffset(ncfUInt64{place} + 1, &position);
        return position;
    });
}

void Size(benchmark::State& state) {
    Run(state, [](const Contest& contest, ncfUInt32 place) {
        ncfUInt32 size = 0;
        contest.table->GetDataSizePerSample(ncfUInt64{place} + 1, &size);
        return ncfUInt64{size};
    });
}

void Flags(benchmark::State& state) {
    Run(state, [](const Contest& contest, ncfUInt32 place) {
        ncfUInt32 flags = 0;
        contest.table->GetSampleFlags(ncfUInt64{place} + 1, &flags);
        return ncfUInt64{flags};
    });
}

void DisplayOffset(benchmark::State& state) {
    Run(state, [](const Contest& contest, ncfUInt32 place) {
        ncfSInt64 offset = 0;
        contest.table->GetDisplayOffset(ncfUInt64{place} + 1, &offset);
        return static_cast<ncfUInt64>(offset);
    });
}

void NextChange(benchmark::State& state) {
    Run(state, [](const Contest& contest, ncfUInt32 place) {
        ncfUInt64 next = 0;
        contest.table->GetNextDiscontiguousDataAttributeChange(ncfUInt64{place} + 1, &next);
        return next;
    });
}

void ShownAt(benchmark::State& state) {
    Run(state, [](const Contest& contest, ncfUInt32 place) {
        ncfUInt64 sample = 0;
        contest.table->DisplayTimeToFrameNum(ncfUInt64{place} * 100, &sample);
        return sample;
    });
}

void PlainArray(benchmark::State& state) {
    Run(state,
        [](const Contest& contest, ncfUInt32 place) { return contest.array[place].position; });
}

BENCHMARK(PlainArray)->Arg(1000)->Arg(1000000);
BENCHMARK(Offset)->Arg(1000)->Arg(1000000);
BENCHMARK(Size)->Arg(1000)->Arg(1000000);
BENCHMARK(Flags)->Arg(1000)->Arg(1000000);
BENCHMARK(DisplayOffset)->Arg(1000)->Arg(1000000);
BENCHMARK(NextChange)->Arg(1000)->Arg(1000000);
BENCHMARK(ShownAt)->Arg(1000)->Arg(1000000);

}  // namespace

int main(int argc, char** argv) {
    std::vector<Pair> pairs;
    for (const char* query :
         {"Offset", "Size", "Flags", "DisplayOffset", "NextChange", "ShownAt"}) {
        pairs.push_back({query, "", ASecondAtLeast(5e6)});
    }
    return RunWithRatios(argc, argv, pairs);
}
