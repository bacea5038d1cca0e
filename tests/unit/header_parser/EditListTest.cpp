// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/EditList.h"

#include <gtest/gtest.h>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using movies::Edit;

struct Linearity {
    bool linear;
    bool proportional;
    ncfSInt64 offset;
    ncfUInt32 scale;
};

// Movie time in 600ths, media time in 30ths of a second; one second of media.
ParsedMovie WithEdits(const std::vector<Edit>& edits, unsigned version = 0) {
    movies::Movie movie = PlainMovie();
    movie.tracks[0].edits = edits;
    movie.tracks[0].editVersion = version;
    return ParsedMovie(movie);
}

Linearity LinearityOf(const ParsedMovie& parsed) {
    ncfBool linear = 7, proportional = 7;
    Linearity result{};
    EXPECT_EQ(parsed.Video()->IsTrackLinear(&linear, &proportional, &result.offset, &result.scale),
              NCF_OK);
    result.linear = linear == 1;
    result.proportional = proportional == 1;
    return result;
}

ncfSInt64 MediaTime(const ParsedMovie& parsed, ncfUInt64 trackTime) {
    return AskSample(parsed.Video(), &ITrackInfo::TrackTimeToMediaTime, trackTime);
}

TEST(EditList, ThatIsMissingIsLinear) {
    const ParsedMovie parsed = WithEdits({});
    const Linearity linearity = LinearityOf(parsed);
    EXPECT_TRUE(linearity.linear);
    EXPECT_TRUE(linearity.proportional);
    EXPECT_EQ(linearity.offset, 0);
    EXPECT_EQ(MediaTime(parsed, 0), 0);
    EXPECT_EQ(MediaTime(parsed, 299), 14);
    EXPECT_EQ(MediaTime(parsed, 300), 15);
}

TEST(EditList, GivesTheScaleInWhichTheTrackDurationCounts) {
    const ParsedMovie parsed = WithEdits({{300, 0, 1.0}});
    EXPECT_EQ(LinearityOf(parsed).scale, Ask(&parsed.Parser(), &IQTParser::GetTimeScale));
}

TEST(EditList, MayLeaveOutItsLastTwoAnswers) {
    ncfBool linear = 0, proportional = 0;
    const auto track = WithEdits({}).Video();
    EXPECT_EQ(track->IsTrackLinear(&linear, &proportional, nullptr, nullptr), NCF_OK);
    EXPECT_EQ(track->IsTrackLinear(nullptr, &proportional, nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(track->IsTrackLinear(&linear, nullptr, nullptr, nullptr), NCF_E_POINTER);
}

TEST(EditList, OfOneEditWithAnOffsetIsLinear) {
    for (const unsigned version : {0u, 1u}) {
        const ParsedMovie parsed = WithEdits({{500, 4, 1.0}}, version);
        EXPECT_TRUE(LinearityOf(parsed).linear);
        EXPECT_EQ(LinearityOf(parsed).offset, 4);
        EXPECT_EQ(MediaTime(parsed, 0), 4);
        EXPECT_EQ(MediaTime(parsed, 499), 4 + 24);
        EXPECT_EQ(Ask(parsed.Video(), &ITrackInfo::GetTrackDuration), 500u);
    }
}

TEST(EditList, WithAnEmptyEditIsNeitherLinearNorProportional) {
    for (const unsigned version : {0u, 1u}) {
        const ParsedMovie parsed = WithEdits({{100, -1, 1.0}, {600, 3, 1.0}}, version);
        EXPECT_FALSE(LinearityOf(parsed).linear);
        EXPECT_FALSE(LinearityOf(parsed).proportional);
        EXPECT_EQ(MediaTime(parsed, 0), -1);
        EXPECT_EQ(MediaTime(parsed, 99), -1);
        EXPECT_EQ(MediaTime(parsed, 100), 3);
        EXPECT_EQ(MediaTime(parsed, 120), 4);
    }
}

TEST(EditList, OfSeveralEditsOutOfOrderPlaysEachInItsTime) {
    const ParsedMovie parsed = WithEdits({{200, 20, 1.0}, {200, 0, 1.0}, {200, 10, 1.0}});
    EXPECT_FALSE(LinearityOf(parsed).linear);
    EXPECT_FALSE(LinearityOf(parsed).proportional);
    EXPECT_EQ(MediaTime(parsed, 0), 20);
    EXPECT_EQ(MediaTime(parsed, 199), 29);
    EXPECT_EQ(MediaTime(parsed, 200), 0);
    EXPECT_EQ(MediaTime(parsed, 400), 10);
    EXPECT_EQ(MediaTime(parsed, 599), 19);
}

TEST(EditList, OfSeveralEditsThatJoinIsLinear) {
    EXPECT_TRUE(LinearityOf(WithEdits({{200, 5, 1.0}, {200, 15, 1.0}})).linear);
    EXPECT_EQ(LinearityOf(WithEdits({{200, 5, 1.0}, {200, 15, 1.0}})).offset, 5);
    EXPECT_FALSE(LinearityOf(WithEdits({{200, 5, 1.0}, {200, 17, 1.0}})).linear);
}

TEST(EditList, WithAnotherRateIsProportionalButNotLinear) {
    const ParsedMovie parsed = WithEdits({{300, 2, 2.0}});
    EXPECT_FALSE(LinearityOf(parsed).linear);
    EXPECT_TRUE(LinearityOf(parsed).proportional);
    EXPECT_EQ(MediaTime(parsed, 100), 2 + 10);
    const ParsedMovie slow = WithEdits({{1200, 0, 0.5}});
    EXPECT_EQ(MediaTime(slow, 600), 15);
}

TEST(EditList, WithTwoRatesIsNotProportional) {
    EXPECT_FALSE(LinearityOf(WithEdits({{200, 0, 1.0}, {200, 10, 0.5}})).proportional);
}

TEST(EditList, WithARateOfZeroDwellsOnItsMediaTime) {
    const ParsedMovie parsed = WithEdits({{600, 7, 0.0}});
    EXPECT_FALSE(LinearityOf(parsed).proportional);
    EXPECT_EQ(MediaTime(parsed, 599), 7);
}

TEST(EditList, PlaysBackwardsNoFurtherThanTheStart) {
    const ParsedMovie parsed = WithEdits({{600, 10, -1.0}});
    EXPECT_FALSE(LinearityOf(parsed).linear);
    EXPECT_EQ(MediaTime(parsed, 100), 5);
    EXPECT_EQ(MediaTime(parsed, 599), 0);
}

TEST(EditList, PassesOverEditsWithoutLength) {
    const ParsedMovie parsed = WithEdits({{0, 9, 1.0}, {600, 2, 1.0}, {0, 1, 1.0}});
    EXPECT_TRUE(LinearityOf(parsed).linear);
    EXPECT_EQ(MediaTime(parsed, 0), 2);
}

TEST(EditList, OfOneEditWithoutLengthPlaysAllBehindItsStart) {
    movies::Movie movie = PlainMovie();
    movie.tracks[0].edits = {{0, 3, 1.0}};
    movie.tracks[0].trackDuration = 540;
    const ParsedMovie parsed(movie);
    EXPECT_TRUE(LinearityOf(parsed).linear);
    EXPECT_EQ(MediaTime(parsed, 539), 3 + 26);
}

TEST(EditList, HasNoMediaBehindTheEndOfTheTrack) {
    ncfSInt64 mediaTime = 42;
    for (const ParsedMovie& parsed : {WithEdits({}), WithEdits({{600, 3, 1.0}})}) {
        EXPECT_EQ(parsed.Video()->TrackTimeToMediaTime(600, &mediaTime), NMA_E_NODATA);
        EXPECT_EQ(parsed.Video()->TrackTimeToMediaTime(~ncfUInt64{0}, &mediaTime), NMA_E_NODATA);
        EXPECT_EQ(mediaTime, 42);
        EXPECT_EQ(parsed.Video()->TrackTimeToMediaTime(0, nullptr), NCF_E_POINTER);
    }
}

TEST(MultiplyDivide, RoundsDownAndSaturates) {
    using header_parser::MultiplyDivide;
    EXPECT_EQ(MultiplyDivide(10, 3, 4), 7u);
    EXPECT_EQ(MultiplyDivide(~ncfUInt64{0}, 7, 7), ~ncfUInt64{0});
    EXPECT_EQ(
        MultiplyDivide(ncfUInt64{1} << 40, 1000000007, 600),
        (ncfUInt64{1} << 40) / 600 * 1000000007 + (ncfUInt64{1} << 40) % 600 * 1000000007 / 600);
    EXPECT_EQ(MultiplyDivide(~ncfUInt64{0}, 2, 1), ~ncfUInt64{0});
    EXPECT_EQ(MultiplyDivide(5, 0, 9), 0u);
}

}  // namespace
