// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/HeaderScanner.h"

#include <gtest/gtest.h>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using header_parser::HeaderScanner;
using header_parser::ParserLimits;
using movies::Box;
using movies::Bytes;
using movies::Movie;
using movies::Place;

// Place and size of the movie atom as the builder knows them.
void ExpectFound(const Movie& movie) {
    const movies::MadeMovie made = movies::Build(movie);
    const ParsedMovie parsed(made);
    ASSERT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
    ncfUInt64 position = 0, size = 0;
    ASSERT_EQ(parsed->GetMOOVAtom(&position, &size), NCF_OK);
    EXPECT_EQ(position, made.headerPosition);
    EXPECT_EQ(size, made.headerSize);
    EXPECT_EQ(Ask(parsed.Samples(), &IQTSampleTable::GetNumSamples), 30u);
}

TEST(HeaderScanner, FindsTheHeaderBehindTheMedia) {
    ExpectFound(PlainMovie());
}

TEST(HeaderScanner, FindsTheHeaderInFrontOfTheMedia) {
    Movie movie = PlainMovie();
    movie.header = Place::kBeforeMedia;
    ExpectFound(movie);
}

TEST(HeaderScanner, NeedsNoFileTypeAtom) {
    Movie movie = PlainMovie();
    movie.brand.clear();
    ExpectFound(movie);
    movie.header = Place::kBeforeMedia;
    ExpectFound(movie);
}

TEST(HeaderScanner, PassesOverFillersAndUnknownAtoms) {
    Movie movie = PlainMovie();
    movie.leading = {
        Box("wide"),           Box("free").Zeros(100), Box("skip").Zeros(9000),
        Box("uuid").Zeros(16), Box("Abc1").Zeros(3),   Box("free").LargeSize().Zeros(5)};
    movie.trailing = {Box("free").Zeros(20)};
    ExpectFound(movie);
}

TEST(HeaderScanner, ReadsSixtyFourBitSizes) {
    Movie movie = PlainMovie();
    movie.largeMedia = true;
    movie.largeHeader = true;
    ExpectFound(movie);
    movie.header = Place::kBeforeMedia;
    ExpectFound(movie);
}

TEST(HeaderScanner, LeapsOverMediaBeyondFourGigabytes) {
    Movie movie = PlainMovie();
    movie.largeMedia = true;
    movie.filler = ncfUInt64{6} << 30;
    movie.tracks[0].largeOffsets = true;
    ExpectFound(movie);
    const ParsedMovie parsed(movie);
    EXPECT_LE(parsed.Passes(), 3u);
}

TEST(HeaderScanner, TakesMediaThatReachTheEndBehindTheHeader) {
    Movie movie = PlainMovie();
    movie.header = Place::kBeforeMedia;
    movie.mediaToEnd = true;
    ExpectFound(movie);
}

TEST(HeaderScanner, TakesAHeaderThatReachesTheEnd) {
    Movie movie = PlainMovie();
    movie.headerToEnd = true;
    ExpectFound(movie);
}

TEST(HeaderScanner, TakesAnEmptyAtomInAHeaderThatReachesTheEnd) {
    Movie movie = PlainMovie();
    movie.headerToEnd = true;
    movie.inHeader = {Box("free"), Box("free").U32(1), Box("free")};
    ExpectFound(movie);
}

TEST(HeaderScanner, TakesASixtyFourBitSizeInAHeaderThatReachesTheEnd) {
    Movie movie = PlainMovie();
    movie.headerToEnd = true;
    movie.inHeader = {Box("free").LargeSize().Zeros(30), Box("free").LargeSize(),
                      Box("free").U32(1)};
    ExpectFound(movie);
}

// The end of the file is not seen, so the read for what follows must hit at
// least one byte that is there.
TEST(HeaderScanner, TakesAHeaderThatReachesTheEndAtAnyLengthOfARead) {
    Movie movie = PlainMovie();
    movie.headerToEnd = true;
    const ncfUInt64 size = movies::Build(movie).size;
    for (ncfUInt64 more = 0; more < 40; ++more) {
        movie.inHeader = {Box("free").Zeros(4096 - size % 4096 - 24 + more)};
        ExpectFound(movie);
    }
}

TEST(HeaderScanner, GathersALargeHeaderInPiecesOfAMegabyte) {
    Movie movie = PlainMovie();
    movie.inHeader = {Box("free").Zeros(5 << 20)};
    const movies::MadeMovie made = movies::Build(movie);
    const auto parser = host::MakeRef<header_parser::QTParser>();
    ncfUInt64 position = 0;
    ncfUInt32 size = 4096;
    ncfUInt64 end = 0;
    NCFRESULT result = QT_E_MOREDATA;
    while (result == QT_E_MOREDATA) {
        EXPECT_LE(size, 1u << 20);
        EXPECT_GT(position + size, end);  // always onwards
        end = position + size;
        const Bytes bytes = made.Range(position, size);
        result = parser->ParseHeaders(bytes.data(), bytes.data() + size, position);
        if (result == QT_E_MOREDATA) {
            ASSERT_EQ(parser->GetRecomendedReadPosition(&position, &size), NCF_OK);
        }
        if (result == QT_E_MOREDATA && size == 1) {
            end = 0;  // the last byte is asked for again, see the next test
        }
    }
    EXPECT_EQ(result, NCF_OK);
}

TEST(HeaderScanner, AsksAgainForALastByteThatIsZero) {
    Movie movie = PlainMovie();
    movie.header = Place::kBeforeMedia;
    movie.inHeader = {Box("udta").U32(0)};
    EXPECT_EQ(ParsedMovie(movie).Passes(), 2u);
    movie.inHeader = {Box("udta").U8(1)};
    EXPECT_EQ(ParsedMovie(movie).Passes(), 1u);
}

TEST(HeaderScanner, StopsAtTheHeaderAndReadsNothingBehindIt) {
    Movie movie = PlainMovie();
    movie.header = Place::kBeforeMedia;
    movie.inHeader = {Box("free").U8(1)};
    movie.filler = ncfUInt64{1} << 33;
    movie.largeMedia = true;
    movie.tracks[0].largeOffsets = true;
    EXPECT_EQ(ParsedMovie(movie).Passes(), 1u);
}

TEST(HeaderScanner, RefusesBytesThatItDidNotAskFor) {
    const Bytes bytes = movies::Build(PlainMovie()).ToBytes();
    HeaderScanner::Progress progress{};
    HeaderScanner late((ParserLimits()));
    EXPECT_EQ(late.Feed(bytes.data(), bytes.data() + 16, 100, progress).code, NCF_E_INVALIDARG);
    HeaderScanner scanner((ParserLimits()));
    ASSERT_EQ(scanner.Feed(bytes.data(), bytes.data() + 4, 0, progress).code, NCF_OK);
    ASSERT_EQ(progress, HeaderScanner::Progress::kMore);
    EXPECT_EQ(scanner.Feed(bytes.data(), bytes.data() + 4, 0, progress).code, NCF_E_INVALIDARG);
}

}  // namespace
