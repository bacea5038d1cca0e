// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <random>

#include "reference_host/movie_writer/TrackAtoms.h"
#include "tests/unit/header_parser/ParsedMovie.h"

// Random tables against a plain expansion of what they were made from: one
// entry for each sample, every answer looked up or searched for one by one.

namespace {

struct PlainSample {
    ncfUInt64 position;
    ncfUInt32 size;
    ncfUInt32 flags;
    ncfSInt64 decodeTime;
    ncfSInt64 duration;
    ncfSInt64 shown;  // on the table's own axis, then shifted
    unsigned description;
    ncfUInt64 nextChange;
};

class Model {
public:
    explicit Model(const movies::Track& track, ncfUInt64 dataStart) {
        Expand(track);
        Place(track, dataStart);
        FindChanges();
        Shift();
    }

    std::vector<PlainSample> samples;
    ncfUInt64 middlePosition = 0;
    ncfUInt64 middleSize = 0;
    ncfSInt64 displayEnd = 0;

    ncfUInt64 ShownAt(ncfSInt64 time) const {
        std::size_t best = samples.size();
        for (std::size_t i = 0; i < samples.size(); ++i) {
            if (samples[i].shown <= time &&
                (best == samples.size() || samples[i].shown >= samples[best].shown)) {
                best = i;
            }
        }
        return best + 1;
    }

private:
    void Expand(const movies::Track& track) {
        const bool allSync = std::all_of(track.samples.begin(), track.samples.end(),
                                         [](const movies::SampleRun& run) { return run.sync; });
        ncfSInt64 time = 0;
        for (const movies::SampleRun& run : track.samples) {
            for (std::uint64_t i = 0; i < run.count; ++i) {
                const ncfUInt32 flags = allSync || run.sync ? 1 : run.disposable ? 2 : 3;
                samples.push_back({0, run.size, flags, time, run.duration, time + run.displayOffset,
                                   run.description, 0});
                time += run.duration;
            }
        }
    }

    void Place(const movies::Track& track, ncfUInt64 position) {
        std::size_t sample = 0;
        std::vector<std::pair<ncfUInt64, ncfUInt64>> chunks;
        for (const movies::Chunk& chunk : movies::ChunksOf(track)) {
            chunks.emplace_back(position, chunk.size);
            ncfUInt64 at = position;
            for (std::uint64_t i = 0; i < chunk.samples; ++i, ++sample) {
                samples[sample].position = at;
                at += samples[sample].size;
            }
            position = at + track.gapBetweenChunks;
        }
        middlePosition = chunks[chunks.size() / 2].first;
        middleSize = chunks[chunks.size() / 2].second;
    }

    void FindChanges() {
        ncfUInt64 next = samples.size() + 1;
        for (std::size_t i = samples.size(); i-- > 0;) {
            samples[i].nextChange = next;
            const bool begins =
                i == 0 || samples[i].position != samples[i - 1].position + samples[i - 1].size ||
                samples[i].description != samples[i - 1].description;
            next = begins ? i + 1 : next;
        }
    }

    void Shift() {
        ncfSInt64 first = samples[0].shown;
        for (const PlainSample& sample : samples) {
            first = std::min(first, sample.shown);
        }
        for (PlainSample& sample : samples) {
            sample.shown -= first;
            displayEnd = std::max(displayEnd, sample.shown + sample.duration);
        }
    }
};

using Random = std::mt19937;

unsigned Below(Random& random, unsigned limit) {
    return static_cast<unsigned>(random() % limit);
}

movies::Track RandomTrack(Random& random) {
    movies::Track track = movies::VideoTrack(movies::VideoFormat(), 1, 600, 1);
    track.descriptions.push_back(movies::VideoFormat().ToBox());
    track.samples.clear();
    const unsigned runs = 1 + Below(random, 200);
    const bool hasOffsets = Below(random, 3) != 0;
    const bool hasDependencies = Below(random, 2) != 0;
    const bool hasOneSize = Below(random, 4) == 0;
    const bool hasTwoDescriptions = Below(random, 3) == 0;
    const bool hasOneDuration = Below(random, 2) == 0;
    const unsigned longest = 1 + Below(random, 40);
    for (unsigned i = 0; i < runs; ++i) {
        movies::SampleRun run;
        run.count = 1 + Below(random, longest);
        run.size = hasOneSize ? 123 : Below(random, 5) == 0 ? 0 : Below(random, 100000);
        run.duration = hasOneDuration ? 500 : Below(random, 6) == 0 ? 0 : 1 + Below(random, 1000);
        run.displayOffset = hasOffsets ? static_cast<int>(Below(random, 4000)) - 1000 : 0;
        run.sync = !hasDependencies || Below(random, 5) == 0;
        run.disposable = hasDependencies && Below(random, 2) == 0;
        run.description = hasTwoDescriptions ? 1 + Below(random, 2) : 1;
        track.samples.push_back(run);
    }
    track.samplesPerChunk = 1 + Below(random, 300);
    track.gapBetweenChunks = Below(random, 2) == 0 ? 0 : 5;
    track.largeOffsets = Below(random, 2) == 0;
    track.offsetVersion = Below(random, 2);
    return track;
}

void ExpectSame(IQTSampleTable* asked, const Model& model) {
    ASSERT_EQ(Ask(asked, &IQTSampleTable::GetNumSamples), model.samples.size());
    ncfUInt32 largest = 0;
    bool reordered = false;
    for (std::size_t i = 0; i < model.samples.size(); ++i) {
        const PlainSample& plain = model.samples[i];
        const ncfUInt64 n = i + 1;
        ASSERT_EQ(AskSample(asked, &IQTSampleTable::GetDataOffset, n), plain.position) << n;
        ASSERT_EQ(AskSample(asked, &IQTSampleTable::GetDataSizePerSample, n), plain.size) << n;
        ASSERT_EQ(AskSample(asked, &IQTSampleTable::GetSampleFlags, n), plain.flags) << n;
        ASSERT_EQ(AskSample(asked, &IQTSampleTable::GetDecodeDuration, n), plain.duration) << n;
        ASSERT_EQ(AskSample(asked, &IQTSampleTable::GetDisplayOffset, n),
                  plain.shown - plain.decodeTime)
            << n;
        ASSERT_EQ(AskSample(asked, &IQTSampleTable::GetNextDiscontiguousDataAttributeChange, n),
                  plain.nextChange)
            << n;
        largest = std::max(largest, plain.size);
        reordered = reordered || plain.shown != plain.decodeTime;
    }
    EXPECT_EQ(Ask(asked, &IQTSampleTable::GetMaxDataSizeInBytes), largest);
    EXPECT_EQ(Ask(asked, &IQTSampleTable::GetHasOutOfOrderFrameDependencies), reordered ? 1 : 0);
    ncfUInt64 position = 0, size = 0;
    ASSERT_EQ(asked->GetChunkFromTheMiddle(&position, &size), NCF_OK);
    EXPECT_EQ(position, model.middlePosition);
    EXPECT_EQ(size, model.middleSize);
}

void ExpectSameDisplay(IQTSampleTable* table, const Model& model, Random& random) {
    for (int i = 0; i < 60 && model.displayEnd > 0; ++i) {
        const auto time =
            static_cast<ncfSInt64>(random() % static_cast<ncfUInt64>(model.displayEnd));
        ASSERT_EQ(
            AskSample(table, &IQTSampleTable::DisplayTimeToFrameNum, static_cast<ncfUInt64>(time)),
            model.ShownAt(time))
            << "at " << time;
    }
    ncfUInt64 sample = 0;
    EXPECT_EQ(table->DisplayTimeToFrameNum(static_cast<ncfUInt64>(model.displayEnd), &sample),
              NMA_E_NODATA);
}

// Prints its seed; HEADER_PARSER_SEED takes it back.
TEST(SampleTables, AnswerAsAPlainExpansionWould) {
    const char* given = std::getenv("HEADER_PARSER_SEED");
    const unsigned seed =
        given != nullptr ? static_cast<unsigned>(std::stoul(given)) : std::random_device()();
    std::printf("seed %u\n", seed);
    Random random(seed);
    for (int round = 0; round < 150; ++round) {
        SCOPED_TRACE("seed " + std::to_string(seed) + " round " + std::to_string(round));
        movies::Movie movie;
        movie.tracks = {RandomTrack(random)};
        movie.duration = 1;
        const ncfUInt64 dataStart = 28;
        const Model model(movie.tracks[0], dataStart);
        const ParsedMovie parsed(movie);
        ASSERT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
        const auto table = parsed.Samples();
        ExpectSame(table.get(), model);
        ExpectSameDisplay(table.get(), model, random);
        if (HasFatalFailure()) {
            return;
        }
    }
}

}  // namespace
