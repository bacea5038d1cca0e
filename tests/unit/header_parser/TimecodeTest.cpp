// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Timecode.h"

#include <gtest/gtest.h>

#include <cstdio>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using movies::TimecodeFormat;

movies::Movie WithTimecode(const TimecodeFormat& format, std::int64_t start) {
    movies::Movie movie = PlainMovie();
    movie.tracks.push_back(movies::TimecodeTrack(format, start, 25));
    return movie;
}

TimecodeFormat CountOf(ncfUInt32 scale, ncfUInt32 duration, unsigned frames, unsigned flags = 2) {
    TimecodeFormat format;
    format.timeScale = scale;
    format.frameDuration = duration;
    format.numFrames = frames;
    format.flags = flags;
    return format;
}

// "01:00:00:00 25000/1000 25", with ";" for drop frame; else the code.
std::string Start(const ParsedMovie& parsed) {
    ncfUInt8 h = 0, m = 0, s = 0, f = 0;
    ncfUInt32 scale = 0, duration = 0, drop = 0, frames = 0;
    const NCFRESULT result =
        parsed->GetTimeCodeInfo(&h, &m, &s, &f, &scale, &duration, &drop, &frames);
    char text[80];
    if (result == NCF_OK) {
        std::snprintf(text, sizeof text, "%02u:%02u:%02u%c%02u %u/%u %u", h, m, s, drop ? ';' : ':',
                      f, scale, duration, frames);
    } else {
        std::snprintf(text, sizeof text, "%08X", static_cast<unsigned>(result));
    }
    return text;
}

std::string Start(const TimecodeFormat& format, std::int64_t frame) {
    return Start(ParsedMovie(WithTimecode(format, frame)));
}

TEST(Timecode, CountsFramesAtEachRate) {
    EXPECT_EQ(Start(CountOf(25, 1, 25), 90000), "01:00:00:00 25/1 25");
    EXPECT_EQ(Start(CountOf(24000, 1001, 24), 84480), "00:58:40:00 24000/1001 24");
    EXPECT_EQ(Start(CountOf(30000, 1001, 30), 108000), "01:00:00:00 30000/1001 30");
    EXPECT_EQ(Start(CountOf(50, 1, 50), 50 * 3600 + 49), "01:00:00:49 50/1 50");
    EXPECT_EQ(Start(CountOf(60000, 1001, 60), 216000), "01:00:00:00 60000/1001 60");
    EXPECT_EQ(Start(CountOf(25, 1, 25), 25 * 86400 - 1), "23:59:59:24 25/1 25");
}

TEST(Timecode, LeavesOutTheNumbersOfDropFrame) {
    const TimecodeFormat format = CountOf(30000, 1001, 30, 3);
    EXPECT_EQ(Start(format, 107892), "01:00:00;00 30000/1001 30");
    EXPECT_EQ(Start(format, 1799), "00:00:59;29 30000/1001 30");
    EXPECT_EQ(Start(format, 1800), "00:01:00;02 30000/1001 30");
    EXPECT_EQ(Start(format, 17981), "00:09:59;29 30000/1001 30");
    EXPECT_EQ(Start(format, 17982), "00:10:00;00 30000/1001 30");
    EXPECT_EQ(Start(format, 2589407), "23:59:59;29 30000/1001 30");
    EXPECT_EQ(Start(CountOf(60000, 1001, 60, 3), 3600), "00:01:00;04 60000/1001 60");
}

TEST(Timecode, HasNothingToLeaveOutAtOtherRates) {
    EXPECT_EQ(Start(CountOf(25, 1, 25, 3), 90000), "01:00:00;00 25/1 25");
}

TEST(Timecode, WrapsAtMidnightOnBothSides) {
    EXPECT_EQ(Start(CountOf(25, 1, 25), 25 * 86400), "00:00:00:00 25/1 25");
    EXPECT_EQ(Start(CountOf(25, 1, 25), -1), "23:59:59:24 25/1 25");
    EXPECT_EQ(Start(CountOf(30000, 1001, 30, 3), -1), "23:59:59;29 30000/1001 30");
}

TEST(Timecode, ReadsAPackedAddressWhereTheNumberIsNoFrameOfADay) {
    EXPECT_EQ(Start(CountOf(25, 1, 25), 0x01021F18), "01:02:31:24 25/1 25");
    EXPECT_EQ(Start(CountOf(25, 1, 25), 0x17BB3B00), "23:59:59:00 25/1 25");  // sign on top
}

TEST(Timecode, ReadsACounterWithoutSign) {
    const ncfUInt64 day = 25 * 86400;
    const ncfUInt64 frame = 0xF0000000 % day;
    char expected[40];
    std::snprintf(expected, sizeof expected, "%02u:%02u:%02u:%02u 25/1 25", unsigned(frame / 90000),
                  unsigned(frame / 1500 % 60), unsigned(frame / 25 % 60), unsigned(frame % 25));
    EXPECT_EQ(Start(CountOf(25, 1, 25, movies::kTimecodeCounter), 0xF0000000), expected);
}

TEST(Timecode, ReadsDescriptionsWithEitherReserve) {
    for (const bool wide : {false, true}) {
        for (const char* reel : {"", "A001"}) {
            TimecodeFormat format = CountOf(25, 1, 25);
            format.wideReserve = wide;
            format.reelName = reel;
            EXPECT_EQ(Start(format, 90000), "01:00:00:00 25/1 25");
        }
    }
}

TEST(Timecode, TakesANumberOfFramesThatWasCutOffForTheRateRoundedUp) {
    EXPECT_EQ(Start(CountOf(90000, 3003, 29), 108000), "01:00:00:00 90000/3003 30");
    EXPECT_EQ(Start(CountOf(24000, 1001, 23), 86400), "01:00:00:00 24000/1001 24");
    EXPECT_EQ(Start(CountOf(60000, 2002, 30), 0), "00:00:00:00 60000/2002 30");
    EXPECT_EQ(Start(CountOf(25, 2, 12), 0), "00:00:00:00 25/2 13");
    EXPECT_EQ(Start(CountOf(30000, 1001, 25), 0), "00:00:00:00 30000/1001 25");
}

TEST(Timecode, HasNoDataWhereItCannotBeCountedWith) {
    EXPECT_EQ(Start(CountOf(25, 1, 0), 90000), "A000006A");
    movies::Movie movie = WithTimecode(CountOf(0, 1, 25), 90000);
    movie.tracks[1].mediaTimeScale = 25;
    EXPECT_EQ(Start(ParsedMovie(movie)), "A000006A");
    EXPECT_EQ(Start(CountOf(25, 0, 25), 90000), "A000006A");
    EXPECT_EQ(Start(CountOf(25, 1, 256), 90000), "A000006A");  // the low byte is 0
}

TEST(Timecode, HasNoDataWithoutASampleOfItsOwnFile) {
    movies::Movie movie = WithTimecode(CountOf(25, 1, 25), 90000);
    movie.tracks[1].samples.clear();
    EXPECT_EQ(Start(ParsedMovie(movie)), "A000006A");
    movie = WithTimecode(CountOf(25, 1, 25), 90000);
    movie.tracks[1].dataReferences = {{"url ", false, "file:///elsewhere"}};
    EXPECT_EQ(Start(ParsedMovie(movie)), "A000006A");
    movie = WithTimecode(CountOf(25, 1, 25), 90000);
    movie.tracks[1].samples[0].size = 3;
    EXPECT_EQ(Start(ParsedMovie(movie)), "A000006A");
    movie = WithTimecode(CountOf(25, 1, 25), 90000);
    movie.tracks[1].descriptions = {movies::Box("tmcd").Zeros(20)};
    EXPECT_EQ(Start(ParsedMovie(movie)), "A000006A");
}

TEST(Timecode, IsNotFoundInAMovieWithoutSuchATrack) {
    EXPECT_EQ(Start(ParsedMovie(PlainMovie())), "8000000C");
}

TEST(Timecode, IsThatOfTheFirstOfSeveralTracks) {
    movies::Movie movie = WithTimecode(CountOf(25, 1, 25), 90000);
    movie.tracks.push_back(movies::TimecodeTrack(CountOf(30, 1, 30), 30, 30));
    const ParsedMovie parsed(movie);
    EXPECT_EQ(Start(parsed), "01:00:00:00 25/1 25");
    EXPECT_EQ(Ask(&parsed.Parser(), &IQTParser::GetTimeCodeTrackCount), 2u);
    EXPECT_EQ(Ask(parsed.Timecode(1), &ITrackInfo::GetMediaTS), 30u);
}

TEST(Timecode, IsAskedForByItselfWhenItLiesFarAway) {
    movies::Movie movie = WithTimecode(CountOf(25, 1, 25), 90000);
    movie.header = movies::Place::kBeforeMedia;
    movie.inHeader = {movies::Box("free").U8(1)};
    EXPECT_EQ(ParsedMovie(movie).Passes(), 1u);
    movie.filler = 1 << 20;
    EXPECT_EQ(Start(ParsedMovie(movie)), "01:00:00:00 25/1 25");
    EXPECT_EQ(ParsedMovie(movie).Passes(), 2u);
}

// Zeros may be padding behind the end of the file.
TEST(Timecode, OfZeroIsAskedForAgainAndFailsBehindTheEnd) {
    movies::Movie movie = WithTimecode(CountOf(25, 1, 25), 0);
    movie.header = movies::Place::kBeforeMedia;
    movie.inHeader = {movies::Box("free").U8(1)};
    const movies::MadeMovie made = movies::Build(movie);
    EXPECT_EQ(Start(ParsedMovie(made)), "00:00:00:00 25/1 25");
    EXPECT_EQ(ParsedMovie(made).Passes(), 2u);
    const movies::Bytes cut = made.Range(0, made.headerPosition + made.headerSize);
    EXPECT_EQ(ParsedMovie(cut).Result(), NMA_E_NODATA);
}

TEST(Timecode, RefusesNullOutputs) {
    const ParsedMovie parsed(WithTimecode(CountOf(25, 1, 25), 90000));
    ncfUInt8 byte = 0;
    ncfUInt32 number = 0;
    for (int missing = 0; missing < 8; ++missing) {
        const auto b = [&](int i) { return i == missing ? nullptr : &byte; };
        const auto n = [&](int i) { return i == missing ? nullptr : &number; };
        EXPECT_EQ(parsed->GetTimeCodeInfo(b(0), b(1), b(2), b(3), n(4), n(5), n(6), n(7)),
                  NCF_E_POINTER);
    }
}

}  // namespace
