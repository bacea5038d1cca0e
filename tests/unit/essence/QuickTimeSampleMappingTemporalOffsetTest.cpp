// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <limits>

#include "tests/unit/essence/support/MappingFixture.h"

namespace {

class TemporalOffset : public MappingFixture {
protected:
    void Samples(std::vector<ncfSInt64> offsets, ncfSInt64 duration = 1000) {
        clip->video.clear();
        mapping->mediaTracks_.clear();
        AddVideo(7, std::move(offsets)).duration = duration;
        Bind();
    }
    NCFRESULT Ask(ncfUInt64 sample) {
        offset = 77;
        return interface->GetSampleTemporalOffset(0, sample, &offset);
    }
    // Places that were asked for their display offset, the sample's own left out.
    std::vector<std::string> Probes() {
        std::vector<std::string> lines = journal.startingWith("clip.GetDisplayOffset 7 ");
        for (std::string& line : lines) {
            line = line.substr(std::strlen("clip.GetDisplayOffset 7 "));
        }
        lines.erase(lines.begin());
        return lines;
    }
    ncfSInt64 offset = 0;
};

TEST_F(TemporalOffset, IsZeroForWhatIsInItsPlaceWithinATenthEitherWay) {
    Samples({0, 100, -100, 101, -101});
    for (const ncfUInt64 sample : {0, 1, 2}) {
        EXPECT_EQ(Ask(sample), NCF_OK);
        EXPECT_EQ(offset, 0);
    }
    EXPECT_TRUE(Probes().size() == 2) << "no other sample was asked";
    journal.clear();
    Ask(3);
    EXPECT_FALSE(Probes().empty()) << "one more is out of place";
    journal.clear();
    Ask(4);
    EXPECT_FALSE(Probes().empty());
}

TEST_F(TemporalOffset, FindsThePartnerOneStepAhead) {
    Samples({2000, -1000, -1000, 0});
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(offset, 1);
}

TEST_F(TemporalOffset, PartnerMayFallShortByATenthInEitherDirection) {
    Samples({5000, -900, 5000, 0});
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(offset, 1);
    Samples({900, 5000});
    EXPECT_EQ(Ask(1), NCF_OK);
    EXPECT_EQ(offset, -1);
    Samples({899, 5000});
    EXPECT_EQ(Ask(1), NCF_E_FAIL) << "one less is too far off";
}

TEST_F(TemporalOffset, FollowsAReorderedGroup) {
    // Decode order I0 P3 B1 B2 P6 B4 B5: shown at 0 3 1 2 6 4 5.
    Samples({0, 2000, -1000, -1000, 2000, -1000, -1000});
    const ncfSInt64 expected[] = {0, 1, 1, -2, 1, 1, -2};
    for (ncfUInt64 sample = 0; sample < 7; ++sample) {
        EXPECT_EQ(Ask(sample), NCF_OK) << sample;
        EXPECT_EQ(offset, expected[sample]) << sample;
    }
}

TEST_F(TemporalOffset, ForwardGoesFirstAtEachDistance) {
    // Both neighbours of sample 1 are displayed in its place.
    Samples({1000, 5000, -1000, 0});
    EXPECT_EQ(Ask(1), NCF_OK);
    EXPECT_EQ(offset, 1);
}

TEST_F(TemporalOffset, LastSampleLooksBackOnly) {
    Samples({0, 0, 2000, 0, 5000});
    EXPECT_EQ(Ask(4), NCF_OK);
    EXPECT_EQ(offset, -2);
    EXPECT_EQ(Probes(), (Lines{"4", "3"}));
}

TEST_F(TemporalOffset, IndexBeforeTheFirstSampleWrapsAndTheClipEndsTheSearch) {
    Samples({5000, 0, 0, 0});
    EXPECT_EQ(Ask(0), NCF_E_INVALIDARG);
    EXPECT_EQ(Probes(), (Lines{"2", "3", "-1"}))
        << "at distance 1 the way back sees zero and asks nothing";
    EXPECT_EQ(offset, 77);
    EXPECT_TRUE(log->once(
        Record("80000003", "media_->GetDisplayOffset(trackQT, sample + 1 - curPos, &qtOffset)",
               "GetSampleTemporalOffset")));
}

TEST_F(TemporalOffset, BothWaysExhaustedFailSilently) {
    Samples({5000});
    EXPECT_EQ(Ask(0), NCF_E_FAIL);
    EXPECT_EQ(offset, 77);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(TemporalOffset, ExhaustedForwardGoesOnBackToTheStart) {
    Samples({0, 0, 0, 5000});
    EXPECT_EQ(Ask(3), NCF_E_FAIL);
    EXPECT_EQ(Probes(), (Lines{"3", "2", "1"}));
}

TEST_F(TemporalOffset, SampleWithoutDurationFailsWhereItWouldDivide) {
    Samples({500, 0}, 0);
    EXPECT_EQ(Ask(0), NCF_E_FAIL);
    EXPECT_EQ(Probes(), Lines{"2"});
    journal.clear();
    EXPECT_EQ(Ask(1), NCF_OK) << "in its place: nothing is divided";
    EXPECT_EQ(offset, 0);
}

TEST_F(TemporalOffset, SampleWithoutDurationFailsOnTheWayBackToo) {
    Samples({0, 500}, 0);
    EXPECT_EQ(Ask(1), NCF_E_FAIL);
    EXPECT_EQ(Probes(), Lines{"1"});
}

TEST_F(TemporalOffset, NegativeDurationIsRefused) {
    Samples({std::numeric_limits<ncfSInt64>::min(), 5, 5}, -1);
    EXPECT_EQ(Ask(1), NCF_E_FAIL);
    EXPECT_TRUE(Probes().empty());
}

TEST_F(TemporalOffset, ComparesTheLow32BitsOfTheOffset) {
    Samples({ncfSInt64{1} << 32, ncfSInt64{0x80000000}, 0});
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(offset, 0) << "the low half is 0";
    journal.clear();
    Ask(1);
    EXPECT_FALSE(Probes().empty()) << "the least 32-bit number has no small absolute value";
}

TEST_F(TemporalOffset, ExtremeOffsetsDoNotOverflow) {
    const ncfSInt64 least = std::numeric_limits<ncfSInt64>::min();
    const ncfSInt64 most = std::numeric_limits<ncfSInt64>::max();
    Samples({most, 5000, least, least, most});
    EXPECT_LT(Ask(1), 0);
    Ask(2);
}

TEST_F(TemporalOffset, GivesTheFailureOfEachCall) {
    Samples({5000, 0});
    const std::pair<const char*, const char*> calls[] = {
        {"GetNumSamples", "media_->GetNumSamples(trackQT, &numSamples)"},
        {"GetDecodeDuration", "media_->GetDecodeDuration(trackQT, sample+1, &decodeDuration)"},
        {"GetDisplayOffset", "media_->GetDisplayOffset(trackQT, sample+1, &qtOffset)"},
    };
    for (const auto& call : calls) {
        clip->results = {{call.first, NCF_E_ABORT}};
        EXPECT_EQ(Ask(0), NCF_E_ABORT);
        EXPECT_TRUE(log->once(Record("80000007", call.second, "GetSampleTemporalOffset")))
            << call.first;
    }
}

TEST_F(TemporalOffset, FailureOfAProbeEndsTheSearch) {
    Samples({0, 5000, 0, -1000});
    clip->results = {{"GetDisplayOffset 7 3", NCF_E_ABORT}};
    EXPECT_EQ(Ask(1), NCF_E_ABORT) << "the way forward";
    EXPECT_EQ(Probes(), Lines{"3"});
    EXPECT_TRUE(log->once(
        Record("80000007", "media_->GetDisplayOffset(trackQT, sample + 1 + curPos, &qtOffset)",
               "GetSampleTemporalOffset")));
    journal.clear();
    clip->results = {{"GetDisplayOffset 7 1", NCF_E_HANDLE}};
    EXPECT_EQ(Ask(1), NCF_E_HANDLE) << "the way back";
    EXPECT_EQ(Probes(), (Lines{"3", "1"}));
    EXPECT_EQ(offset, 77);
}

TEST_F(TemporalOffset, FailureOfAProbeComesBeforeThatOfTheDivision) {
    Samples({500, 0}, 0);
    clip->results = {{"GetDisplayOffset 7 2", NCF_E_ABORT}};
    EXPECT_EQ(Ask(0), NCF_E_ABORT);
}

TEST_F(TemporalOffset, DistanceIsComparedInFullWidth) {
    const ncfSInt64 turn = ncfSInt64{1} << 32;
    Samples({5, turn + 1, 5, -turn - 1, 5}, 1);
    EXPECT_EQ(Ask(2), NCF_E_FAIL) << "neighbours a whole turn away are no partners";
}

TEST_F(TemporalOffset, TenthIsRoundedDown) {
    Samples({100, 101, 0}, 1009);
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(offset, 0);
    journal.clear();
    Ask(1);
    EXPECT_FALSE(Probes().empty());
}

TEST_F(TemporalOffset, PastTheLastSampleIsTheClipsFailure) {
    Samples({0, 0});
    EXPECT_EQ(Ask(2), NCF_E_INVALIDARG);
}

}  // namespace
