// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SampleMap.h"

#include <gtest/gtest.h>

#include "tests/support/fakes/StubSampleMapping.h"

using cliphost::MappedSample;
using cliphost::ReadMappedSample;
using cliphost::ReadRuns;
using cliphost::RunMap;

namespace {

struct Stored {
    ncfUInt64 position;
    ncfUInt32 size;
};

// A map over a list of samples, which answers as a module does: the size in 32
// bits, runs as far as bytes follow each other.
class FakeMap final : public StubSampleMapping {
public:
    explicit FakeMap(std::vector<Stored> samples) : samples_(std::move(samples)) {}

    std::vector<Stored> samples_;
    ncfUInt64 wrongBytes = 0;    // added to what runs are told to hold
    ncfUInt64 brokenAt = ~0ull;  // GetSamplePosition fails there
    NCFRESULT offsetResult = NCF_OK;
    std::size_t sizeQueries = 0;

    NCFRESULT GetNumberOfSamples(ncfUInt32 track, ncfUInt64* count) override {
        if (track != 0) {
            return NCF_E_FAIL;
        }
        *count = samples_.size();
        return NCF_OK;
    }
    NCFRESULT GetSampleSize(ncfUInt32, ncfUInt64 sample, ncfUInt64* size) override {
        ++sizeQueries;
        if (sample >= samples_.size()) {
            return NCF_E_INVALIDARG;
        }
        // The upper half stays as the caller had it.
        *size = (*size & ~0xFFFFFFFFull) | samples_[sample].size;
        return NCF_OK;
    }
    NCFRESULT GetSamplePosition(ncfUInt32, ncfUInt64 sample, ncfUInt64* position) override {
        if (sample >= samples_.size() || sample == brokenAt) {
            return NCF_E_FAIL;
        }
        *position = samples_[sample].position;
        return NCF_OK;
    }
    NCFRESULT GetSampleTemporalOffset(ncfUInt32, ncfUInt64, ncfSInt64* offset) override {
        *offset = 3;
        return offsetResult;
    }
    NCFRESULT GetSampleProperties(ncfUInt32, ncfUInt64, ncfUInt64* flags,
                                  ncfUInt32* dependencies) override {
        *flags = 2048;
        *dependencies = 1;
        return NCF_OK;
    }
    NCFRESULT GetNumberOfContiguousSamples(ncfUInt32, ncfUInt64, ncfSInt64* count) override {
        *count = -1;
        return NCF_OK;
    }
    NCFRESULT GetNumberOfContiguousBytes(ncfUInt32, ncfUInt64 sample, ncfUInt64* bytes) override {
        const ncfUInt64 begin = samples_.at(sample).position;
        Stored last{};
        do {
            last = samples_[sample];
            ++sample;
        } while (sample < samples_.size() &&
                 (samples_[sample].position == last.position ||
                  samples_[sample].position == last.position + last.size));
        *bytes = last.position + last.size - begin + wrongBytes;
        return NCF_OK;
    }
};

const std::vector<Stored> kTwoRuns = {{100, 10}, {110, 20}, {130, 5}, {500, 7}, {507, 1}};

}  // namespace

TEST(SampleMap, FindsTheRunsAndTheirSums) {
    FakeMap map(kTwoRuns);
    const RunMap runs = ReadRuns(map, 0, 508);
    EXPECT_EQ(runs.result, NCF_OK);
    EXPECT_EQ(runs.samples, 5u);
    EXPECT_EQ(runs.bytes, 43u);
    ASSERT_EQ(runs.runs.size(), 2u);
    EXPECT_EQ(runs.runs[0].first, 0u);
    EXPECT_EQ(runs.runs[0].count, 3u);
    EXPECT_EQ(runs.runs[0].position, 100u);
    EXPECT_EQ(runs.runs[0].bytes, 35u);
    EXPECT_EQ(runs.runs[1].first, 3u);
    EXPECT_EQ(runs.runs[1].count, 2u);
    EXPECT_TRUE(runs.faults.empty());
}

TEST(SampleMap, TellsSamplesBehindTheEndOfTheFile) {
    FakeMap map(kTwoRuns);
    const RunMap runs = ReadRuns(map, 0, 507);
    ASSERT_EQ(runs.faults.size(), 1u);
    EXPECT_NE(runs.faults[0].find("samples 3 to 4 lie at bytes 500 to 508, and the file ends at "
                                  "507"),
              std::string::npos)
        << runs.faults[0];
}

TEST(SampleMap, TellsARunThatIsNotTheSumOfItsSamples) {
    FakeMap map(kTwoRuns);
    map.wrongBytes = 2;
    const RunMap runs = ReadRuns(map, 0, 10000);
    EXPECT_FALSE(runs.faults.empty());
    EXPECT_NE(runs.faults[0].find("37 bytes follow each other"), std::string::npos)
        << runs.faults[0];
}

TEST(SampleMap, AsksForFewOfManySamplesOfOneSize) {
    std::vector<Stored> samples;
    for (ncfUInt32 i = 0; i < 100000; ++i) {
        samples.push_back({1000 + ncfUInt64{i} * 4, 4});
    }
    FakeMap map(samples);
    const RunMap runs = ReadRuns(map, 0, 1000 + 400000);
    ASSERT_EQ(runs.runs.size(), 1u);
    EXPECT_EQ(runs.runs[0].count, 100000u);
    EXPECT_EQ(runs.bytes, 400000u);
    EXPECT_TRUE(runs.faults.empty());
    EXPECT_LT(map.sizeQueries, 10u);
}

TEST(SampleMap, IsNotDeceivedBySamplesThatOnlyBeginAndEndAlike) {
    // First and last of one size, and as many bytes as if all were.
    FakeMap map({{0, 4}, {4, 2}, {6, 6}, {12, 4}, {100, 1}});
    const RunMap runs = ReadRuns(map, 0, 200);
    EXPECT_EQ(runs.bytes, 17u);
    ASSERT_EQ(runs.runs.size(), 2u);
    EXPECT_EQ(runs.runs[0].count, 4u);
    EXPECT_TRUE(runs.faults.empty());
}

// As of sound that is coded in blocks, counted frame by frame: the last block of a
// run may hold fewer.
TEST(SampleMap, CountsAPacketOfSeveralSamplesOnce) {
    std::vector<Stored> samples;
    for (ncfUInt32 i = 0; i < 10 * 1017 + 5; ++i) {
        samples.push_back({36 + ncfUInt64{i / 1017} * 1024, 1024});
    }
    FakeMap one(samples);
    RunMap runs = ReadRuns(one, 0, 36 + 11 * 1024);
    ASSERT_EQ(runs.runs.size(), 1u);
    EXPECT_EQ(runs.runs[0].count, samples.size());
    EXPECT_EQ(runs.runs[0].bytes, 11u * 1024);
    EXPECT_EQ(runs.bytes, 11u * 1024);
    EXPECT_TRUE(runs.faults.empty());
    EXPECT_LT(one.sizeQueries, 40u);
    // A second run, in packets that hold fewer.
    const std::size_t behind = samples.size();
    for (ncfUInt32 i = 0; i < 30; ++i) {
        samples.push_back({50000 + ncfUInt64{i / 7} * 1024, 1024});
    }
    FakeMap two(samples);
    runs = ReadRuns(two, 0, 60000);
    ASSERT_EQ(runs.runs.size(), 2u);
    EXPECT_EQ(runs.runs[0].count, behind);
    EXPECT_EQ(runs.runs[1].first, behind);
    EXPECT_EQ(runs.runs[1].count, 30u);
    EXPECT_EQ(runs.bytes, (11u + 5u) * 1024);
    EXPECT_TRUE(runs.faults.empty());
    EXPECT_EQ(ReadRuns(two, 0, 52000).faults.size(), 1u);
}

TEST(SampleMap, MeasuresARunWhosePacketsHoldDifferentNumbersOfSamples) {
    FakeMap map({{0, 8}, {0, 8}, {0, 8}, {8, 8}, {16, 8}, {16, 8}, {100, 8}, {100, 8}});
    const RunMap runs = ReadRuns(map, 0, 200);
    ASSERT_EQ(runs.runs.size(), 2u);
    EXPECT_EQ(runs.runs[0].count, 6u);
    EXPECT_EQ(runs.runs[0].bytes, 24u);
    EXPECT_EQ(runs.runs[1].count, 2u);
    EXPECT_EQ(runs.bytes, 32u);
    EXPECT_TRUE(runs.faults.empty());
}

TEST(SampleMap, EndsAtSamplesWithoutBytes) {
    FakeMap map({{10, 0}, {10, 0}, {10, 5}});
    const RunMap runs = ReadRuns(map, 0, 100);
    EXPECT_EQ(runs.samples, 3u);
    std::uint64_t held = 0;
    for (const auto& run : runs.runs) {
        held += run.count;
    }
    EXPECT_EQ(held, 3u);
    EXPECT_EQ(runs.bytes, 5u);
    EXPECT_TRUE(ReadRuns(*std::make_unique<FakeMap>(std::vector<Stored>{}), 0, 0).runs.empty());
}

TEST(SampleMap, CarriesTheCodeOfAFailedQuery) {
    FakeMap map(kTwoRuns);
    EXPECT_EQ(ReadRuns(map, 1, 1000).result, NCF_E_FAIL);
    map.brokenAt = 3;
    EXPECT_EQ(ReadRuns(map, 0, 1000).result, NCF_E_FAIL);
    MappedSample sample;
    EXPECT_EQ(ReadMappedSample(map, 0, 3, sample), NCF_E_FAIL);
    EXPECT_EQ(ReadMappedSample(map, 0, 99, sample), NCF_E_INVALIDARG);
}

TEST(SampleMap, ReadsAllOfASampleAndTakesMinusOneAsAnAnswer) {
    FakeMap map(kTwoRuns);
    MappedSample sample;
    ASSERT_EQ(ReadMappedSample(map, 0, 1, sample), NCF_OK);
    EXPECT_EQ(sample.position, 110u);
    EXPECT_EQ(sample.size, 20u);
    EXPECT_EQ(sample.temporalOffset, 3);
    EXPECT_EQ(sample.properties, 2048u);
    EXPECT_EQ(sample.dependencies, 1u);
    EXPECT_EQ(sample.contiguousSamples, -1);
    EXPECT_EQ(sample.contiguousBytes, 25u);
}

TEST(SampleMap, LeavesAnOffsetThatCantBeFoundOut) {
    FakeMap map(kTwoRuns);
    map.offsetResult = NCF_E_FAIL;
    MappedSample sample;
    ASSERT_EQ(ReadMappedSample(map, 0, 1, sample), NCF_OK);
    EXPECT_FALSE(sample.temporalOffset.has_value());
}

TEST(SampleMap, SaysPropertiesInWords) {
    EXPECT_EQ(cliphost::WordsForProperties(1024), "stands alone");
    EXPECT_EQ(cliphost::WordsForProperties(2048), "needs one other");
    EXPECT_EQ(cliphost::WordsForProperties(4096), "needs two others");
    EXPECT_EQ(cliphost::WordsForProperties(7), "7");
}
