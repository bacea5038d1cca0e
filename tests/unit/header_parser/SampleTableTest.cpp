// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/SampleTable.h"

#include <gtest/gtest.h>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using movies::Movie;
using movies::SampleRun;

using Table = host::Ref<IQTSampleTable>;

Movie WithSamples(const std::vector<SampleRun>& samples, std::uint64_t perChunk = 10) {
    Movie movie = PlainMovie();
    movie.tracks[0].samples = samples;
    movie.tracks[0].samplesPerChunk = perChunk;
    return movie;
}

Table TableOf(const Movie& movie) {
    const ParsedMovie parsed(movie);
    EXPECT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
    return parsed.Samples();
}

std::vector<ncfSInt64> DisplayOffsets(const Table& table) {
    std::vector<ncfSInt64> offsets;
    for (ncfUInt64 i = 1; i <= Ask(table, &IQTSampleTable::GetNumSamples); ++i) {
        offsets.push_back(AskSample(table, &IQTSampleTable::GetDisplayOffset, i));
    }
    return offsets;
}

std::vector<ncfUInt32> Flags(const Table& table) {
    std::vector<ncfUInt32> flags;
    for (ncfUInt64 i = 1; i <= Ask(table, &IQTSampleTable::GetNumSamples); ++i) {
        flags.push_back(AskSample(table, &IQTSampleTable::GetSampleFlags, i));
    }
    return flags;
}

using Offsets = std::vector<ncfSInt64>;

TEST(SampleTable, RefusesNumbersThatItLacksAndLeavesTheOutputs) {
    const Table table = TableOf(PlainMovie());
    for (const ncfUInt64 sample : {ncfUInt64{0}, ncfUInt64{31}, ncfUInt64{1} << 32,
                                   (ncfUInt64{1} << 32) + 1, ~ncfUInt64{0}}) {
        ncfUInt64 wide = 42;
        ncfUInt32 narrow = 42;
        ncfSInt64 time = 42;
        EXPECT_EQ(table->GetDataOffset(sample, &wide), NCF_E_INVALIDARG);
        EXPECT_EQ(table->GetSampleFlags(sample, &narrow), NCF_E_INVALIDARG);
        EXPECT_EQ(table->GetNextDiscontiguousDataAttributeChange(sample, &wide), NCF_E_INVALIDARG);
        EXPECT_EQ(table->GetDataSizePerSample(sample, &narrow), NCF_E_INVALIDARG);
        EXPECT_EQ(table->GetDisplayOffset(sample, &time), NCF_E_INVALIDARG);
        EXPECT_EQ(table->GetDecodeDuration(sample, &time), NCF_E_INVALIDARG);
        EXPECT_EQ(wide, 42u);
        EXPECT_EQ(narrow, 42u);
        EXPECT_EQ(time, 42);
    }
}

TEST(SampleTable, RefusesNullOutputs) {
    const Table table = TableOf(PlainMovie());
    ncfUInt64 number = 0;
    EXPECT_EQ(table->GetNumSamples(nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetDataOffset(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetSampleFlags(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetNextDiscontiguousDataAttributeChange(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetDataSizePerSample(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetDisplayOffset(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetDecodeDuration(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetMaxDataSizeInBytes(nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetHasOutOfOrderFrameDependencies(nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetChunkFromTheMiddle(nullptr, &number), NCF_E_POINTER);
    EXPECT_EQ(table->GetChunkFromTheMiddle(&number, nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->DisplayTimeToFrameNum(0, nullptr), NCF_E_POINTER);
}

TEST(SampleTable, HasOnlySyncSamplesWithoutAList) {
    EXPECT_EQ(Flags(TableOf(WithSamples({{3, 100, 1}}))), (std::vector<ncfUInt32>{1, 1, 1}));
}

TEST(SampleTable, TellsSyncDisposableAndOtherSamplesApart) {
    const Movie movie = WithSamples({{1, 100, 1, 0, true, false},
                                     {1, 100, 1, 0, false, false},
                                     {2, 100, 1, 0, false, true},
                                     {1, 100, 1, 0, true, true},
                                     {1, 100, 1, 0, false, false}});
    EXPECT_EQ(Flags(TableOf(movie)), (std::vector<ncfUInt32>{1, 3, 2, 2, 1, 3}));
}

TEST(SampleTable, HasNoSyncSampleWithAnEmptyList) {
    Movie movie = WithSamples({{3, 100, 1}});
    movie.tracks[0].added = {movies::Box("stss").Version(0).U32(0)};
    EXPECT_EQ(Flags(TableOf(movie)), (std::vector<ncfUInt32>{3, 3, 3}));
}

TEST(SampleTable, CountsPartialSyncSamplesAsSync) {
    Movie movie = WithSamples({{4, 100, 1}});
    movie.tracks[0].added = {movies::Box("stss").Version(0).U32(1).U32(1),
                             movies::Box("stps").Version(0).U32(1).U32(3)};
    EXPECT_EQ(Flags(TableOf(movie)), (std::vector<ncfUInt32>{1, 3, 1, 3}));
}

// Among many entries or few, wherever the empty one stands.
TEST(SampleTable, PassesOverOffsetsOfNoSamples) {
    for (const unsigned entries : {3u, 16u, 40u}) {
        for (const unsigned empty : {0u, 1u, entries - 1}) {
            Movie movie = WithSamples({{entries, 100, 10}});
            movies::Box offsets = movies::Box("ctts").Version(0).U32(entries + 1);
            for (unsigned i = 0; i <= entries; ++i) {
                const bool isEmpty = i == empty;
                offsets.U32(isEmpty ? 0 : 1).U32(isEmpty ? static_cast<std::uint32_t>(-999) : 20);
            }
            movie.tracks[0].added = {offsets};
            const Table table = TableOf(movie);
            EXPECT_EQ(DisplayOffsets(table), Offsets(entries, 0)) << entries << ", " << empty;
            EXPECT_EQ(Ask(table, &IQTSampleTable::GetHasOutOfOrderFrameDependencies), 0);
        }
    }
}

TEST(SampleTable, HasNoDisplayOffsetsWithoutATable) {
    const Table table = TableOf(WithSamples({{3, 100, 1}}));
    EXPECT_EQ(DisplayOffsets(table), (Offsets{0, 0, 0}));
    EXPECT_EQ(Ask(table, &IQTSampleTable::GetHasOutOfOrderFrameDependencies), 0);
}

// I P B B in decode order, shown as I B B P: the table's own offsets begin at
// one frame, or at zero with negative ones; the answers are the same.
TEST(SampleTable, ShiftsItsDisplayOffsetsSoThatTheFirstPictureHasNone) {
    const Offsets expected = {0, 2000, -1000, -1000};
    for (const unsigned version : {0u, 1u}) {
        for (const std::int32_t start : {1000, 0, 5000, -3000}) {
            Movie movie = WithSamples({{1, 100, 1000, start},
                                       {1, 100, 1000, start + 2000},
                                       {2, 100, 1000, start - 1000}});
            movie.tracks[0].offsetVersion = version;
            const Table table = TableOf(movie);
            EXPECT_EQ(DisplayOffsets(table), expected) << start;
            EXPECT_EQ(Ask(table, &IQTSampleTable::GetHasOutOfOrderFrameDependencies), 1);
        }
    }
}

TEST(SampleTable, IsInOrderWhenAllOffsetsAreTheSame) {
    const Table table = TableOf(WithSamples({{5, 100, 1000, 2000}}));
    EXPECT_EQ(DisplayOffsets(table), (Offsets{0, 0, 0, 0, 0}));
    EXPECT_EQ(Ask(table, &IQTSampleTable::GetHasOutOfOrderFrameDependencies), 0);
}

TEST(SampleTable, FindsThePictureOnShowInDisplayOrder) {
    const Table table = TableOf(WithSamples(
        {{1, 100, 1000, 1000}, {1, 100, 1000, 3000}, {2, 100, 1000, 0}, {1, 100, 1000, 1000}}));
    const std::vector<ncfUInt64> shown = {1, 3, 4, 2, 5};
    for (std::size_t i = 0; i < shown.size(); ++i) {
        EXPECT_EQ(AskSample(table, &IQTSampleTable::DisplayTimeToFrameNum, i * 1000), shown[i]);
        EXPECT_EQ(AskSample(table, &IQTSampleTable::DisplayTimeToFrameNum, i * 1000 + 999),
                  shown[i]);
    }
    ncfUInt64 sample = 42;
    EXPECT_EQ(table->DisplayTimeToFrameNum(5000, &sample), NMA_E_NODATA);
    EXPECT_EQ(table->DisplayTimeToFrameNum(~ncfUInt64{0}, &sample), NMA_E_NODATA);
    EXPECT_EQ(sample, 42u);
}

TEST(SampleTable, GivesTheDurationOfEachRun) {
    const Table table = TableOf(WithSamples({{2, 100, 7}, {1, 100, 0}, {3, 100, 9}}));
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDecodeDuration, 2), 7);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDecodeDuration, 3), 0);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDecodeDuration, 6), 9);
}

TEST(SampleTable, ReadsSizesOfEveryForm) {
    const std::vector<SampleRun> samples = {{1, 3, 1}, {1, 15, 1}, {2, 0, 1}, {1, 9, 1}};
    for (const unsigned bits : {0u, 4u, 8u, 16u}) {
        Movie movie = WithSamples(samples, 2);
        movie.tracks[0].compactSizeBits = bits;
        const Table table = TableOf(movie);
        const ncfUInt32 expected[] = {3, 15, 0, 0, 9};
        for (ncfUInt64 i = 0; i < 5; ++i) {
            EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataSizePerSample, i + 1), expected[i]);
        }
        EXPECT_EQ(Ask(table, &IQTSampleTable::GetMaxDataSizeInBytes), 15u);
        const ncfUInt64 first = AskSample(table, &IQTSampleTable::GetDataOffset, 1);
        EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 2), first + 3);
        EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 5), first + 18);
    }
}

TEST(SampleTable, ReadsOffsetsOfBothForms) {
    for (const bool large : {false, true}) {
        Movie movie = PlainMovie();
        movie.tracks[0].largeOffsets = large;
        movie.filler = large ? ncfUInt64{5} << 30 : 100;
        movie.largeMedia = large;
        const ncfUInt64 data = 20 + (large ? 16 : 8) + movie.filler;  // ftyp, mdat
        const Table table = TableOf(movie);
        EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 1), data);
        EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 30), data + 2900);
    }
}

TEST(SampleTable, GivesTheChunkInTheMiddle) {
    Movie movie = WithSamples({{25, 100, 1}}, 10);  // three chunks: 10, 10, 5
    movie.tracks[0].gapBetweenChunks = 7;
    const auto middle = [](const Movie& m) {
        ncfUInt64 position = 0, size = 0;
        EXPECT_EQ(TableOf(m)->GetChunkFromTheMiddle(&position, &size), NCF_OK);
        return std::make_pair(position, size);
    };
    EXPECT_EQ(middle(movie), std::make_pair(ncfUInt64{28 + 1007}, ncfUInt64{1000}));
    movie.tracks[0].samples = {{15, 100, 1}};  // two chunks: number 1, the short one
    EXPECT_EQ(middle(movie), std::make_pair(ncfUInt64{28 + 1007}, ncfUInt64{500}));
    movie.tracks[0].samples = {{5, 100, 1}};
    EXPECT_EQ(middle(movie), std::make_pair(ncfUInt64{28}, ncfUInt64{500}));
}

TEST(SampleTable, ChangesWhereBytesDoNotFollow) {
    Movie movie = WithSamples({{25, 100, 1}}, 10);
    const auto next = [](const Movie& m, ncfUInt64 sample) {
        return AskSample(TableOf(m), &IQTSampleTable::GetNextDiscontiguousDataAttributeChange,
                         sample);
    };
    EXPECT_EQ(next(movie, 1), 26u);
    EXPECT_EQ(next(movie, 25), 26u);
    movie.tracks[0].gapBetweenChunks = 1;
    EXPECT_EQ(next(movie, 1), 11u);
    EXPECT_EQ(next(movie, 10), 11u);
    EXPECT_EQ(next(movie, 11), 21u);
    EXPECT_EQ(next(movie, 21), 26u);
}

TEST(SampleTable, ChangesWhereTheDescriptionDoes) {
    Movie movie = WithSamples({{5, 100, 1, 0, true, false, 1}, {5, 100, 1, 0, true, false, 2}});
    movie.tracks[0].descriptions.push_back(movies::VideoFormat().ToBox());
    const Table table = TableOf(movie);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetNextDiscontiguousDataAttributeChange, 2), 6u);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetNextDiscontiguousDataAttributeChange, 6), 11u);
}

TEST(SampleTable, FindsTheNextChangeAcrossHundredsOfChunks) {
    Movie movie = WithSamples({{600, 10, 1}, {1, 10, 1, 0, true, false, 2}, {1000, 10, 1}}, 1);
    movie.tracks[0].descriptions.push_back(movies::VideoFormat().ToBox());
    const Table table = TableOf(movie);
    const auto next = &IQTSampleTable::GetNextDiscontiguousDataAttributeChange;
    EXPECT_EQ(AskSample(table, next, 1), 601u);
    EXPECT_EQ(AskSample(table, next, 600), 601u);
    EXPECT_EQ(AskSample(table, next, 601), 602u);
    EXPECT_EQ(AskSample(table, next, 602), 1602u);
}

TEST(SampleTable, LetsTheLastChunkBeFilledInPart) {
    Movie movie = PlainMovie();
    movie.tracks[0].samples = {{25, 100, 1}};
    movie.tracks[0].replaced = {
        movies::Box("stsc").Version(0).U32(1).U32(1).U32(10).U32(1)};  // 30 places
    const Table table = TableOf(movie);
    EXPECT_EQ(Ask(table, &IQTSampleTable::GetNumSamples), 25u);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 25), 28u + 2400);
}

// Four thousand million samples of one size cost no memory.
TEST(SampleTable, HoldsAsManySamplesAsTheFormatCanCount) {
    Movie movie;
    movie.tracks = {movies::SoundTrack(movies::SoundFormat(), 0xFFFFFFFF)};
    movie.tracks[0].mediaTimeScale = 48000;
    movie.tracks[0].samplesPerChunk = 0x10000000;
    movie.tracks[0].largeOffsets = true;
    movie.largeMedia = true;
    const Table table = TableOf(movie);
    EXPECT_EQ(Ask(table, &IQTSampleTable::GetNumSamples), 0xFFFFFFFFu);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 0xFFFFFFFF),
              20 + 16 + ncfUInt64{0xFFFFFFFE} * 4);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::DisplayTimeToFrameNum, 0xFFFFFFFD), 0xFFFFFFFEu);
}

}  // namespace
