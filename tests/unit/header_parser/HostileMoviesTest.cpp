// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <chrono>
#include <random>

#include "tests/unit/header_parser/BrokenMovies.h"
#include "tests/unit/header_parser/ParsedMovie.h"
#include "tests/unit/header_parser/VisitEverything.h"

namespace {

using movies::Bytes;

// Passes that a file may cost: one for each megabyte and each atom of its top
// level, and a few for the ends. The broken files here have few atoms.
constexpr ncfUInt32 kFewPasses = 8;

class BrokenMovieTest : public testing::TestWithParam<BrokenMovie> {};

TEST_P(BrokenMovieTest, IsRefusedAtOnce) {
    const ParsedMovie parsed(GetParam().bytes);
    EXPECT_EQ(parsed.Result(), GetParam().expected) << parsed.Reason();
    EXPECT_LE(parsed.Passes(), GetParam().name == "many_empty_atoms" ? 200 : kFewPasses);
    ncfUInt32 count = 0;
    EXPECT_EQ(parsed->GetVideoTrackCount(&count), NMA_E_NOTINITIALIZED);
}

INSTANTIATE_TEST_SUITE_P(All, BrokenMovieTest, testing::ValuesIn(BrokenMovies()),
                         [](const auto& test) { return test.param.name; });

class WholeMovieTest : public testing::TestWithParam<BrokenMovie> {};

INSTANTIATE_TEST_SUITE_P(All, WholeMovieTest, testing::ValuesIn(WholeMovies()),
                         [](const auto& test) { return test.param.name; });

TEST_P(WholeMovieTest, IsTakenWhole) {
    const ParsedMovie parsed(GetParam().bytes);
    ASSERT_EQ(parsed.Result(), NCF_OK) << parsed.Reason();
    VisitEverything(parsed.Parser());
}

// Nothing that is cut within its header is taken for whole. A header whose
// own size is open ends where the file does, so it may be.
TEST_P(WholeMovieTest, IsRefusedWhenItsHeaderIsCutAnywhere) {
    const Bytes& whole = GetParam().bytes;
    const ParsedMovie parsed(whole);
    ncfUInt64 position = 0, size = 0;
    ASSERT_EQ(parsed->GetMOOVAtom(&position, &size), NCF_OK);
    const bool endIsOpen = GetParam().name == "header_to_end";
    for (ncfUInt64 length = 0; length < position + size; ++length) {
        const Bytes cut(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length));
        const ParsedMovie again(cut);
        if (endIsOpen && again.Result() == NCF_OK) {
            VisitEverything(again.Parser());
            continue;
        }
        ASSERT_NE(again.Result(), NCF_OK) << "cut at " << length;
        ASSERT_LE(again.Passes(), kFewPasses) << "cut at " << length;
    }
}

TEST_P(WholeMovieTest, IsTakenOrRefusedWithAnyBitTurnedOver) {
    const Bytes& whole = GetParam().bytes;
    const ParsedMovie parsed(whole);
    ncfUInt64 position = 0, size = 0;
    ASSERT_EQ(parsed->GetMOOVAtom(&position, &size), NCF_OK);
    Bytes bytes = whole;
    const auto start = std::chrono::steady_clock::now();
    for (ncfUInt64 at = 0; at < bytes.size(); ++at) {
        if (at >= 64 && (at < position || at >= position + size)) {
            continue;  // media
        }
        for (const unsigned bit : {0u, 3u, 7u}) {
            bytes[at] ^= static_cast<std::uint8_t>(1u << bit);
            const ParsedMovie again(bytes);
            ASSERT_LE(again.Passes(), kFewPasses) << "bit " << bit << " of byte " << at;
            if (again.Result() == NCF_OK) {
                VisitEverything(again.Parser());
            }
            bytes[at] ^= static_cast<std::uint8_t>(1u << bit);
        }
    }
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(60));
}

// Prints its seed; HEADER_PARSER_SEED takes it back.
TEST_P(WholeMovieTest, IsTakenOrRefusedWithRandomDamage) {
    const char* given = std::getenv("HEADER_PARSER_SEED");
    const unsigned seed =
        given != nullptr ? static_cast<unsigned>(std::stoul(given)) : std::random_device()();
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    const ParsedMovie parsed(GetParam().bytes);
    ncfUInt64 position = 0, size = 0;
    ASSERT_EQ(parsed->GetMOOVAtom(&position, &size), NCF_OK);
    const std::uint8_t values[] = {0, 1, 0x7F, 0x80, 0xFF};
    for (int round = 0; round < 3000; ++round) {
        Bytes bytes = GetParam().bytes;
        for (unsigned i = 0; i <= random() % 4; ++i) {
            const ncfUInt64 at = position + random() % size;
            for (ncfUInt64 k = at; k < at + 1 + random() % 4 && k < bytes.size(); ++k) {
                bytes[k] =
                    random() % 2 == 0 ? values[random() % 5] : static_cast<std::uint8_t>(random());
            }
        }
        const ParsedMovie again(bytes);
        ASSERT_LE(again.Passes(), kFewPasses) << "seed " << seed << " round " << round;
        if (again.Result() == NCF_OK) {
            VisitEverything(again.Parser());
        }
    }
}

TEST(MissingAtom, IsNamedByTheReason) {
    for (const char* const atom : {"tkhd", "mdia", "mdhd", "minf", "stbl", "stsz", "stco"}) {
        movies::Movie movie = PlainMovie();
        movie.tracks[0].omitted = {atom};
        const ParsedMovie parsed(movie);
        EXPECT_LT(parsed.Result(), 0) << atom;
        EXPECT_NE(parsed.Reason().find(std::string("it lacks '") + atom + "'"), std::string::npos)
            << parsed.Reason();
    }
}

// Two of everything that has a limit.
movies::Movie MovieOfTwo() {
    movies::Movie movie = PlainMovie();
    movie.tracks.push_back(movie.tracks.front());
    movie.leading = {movies::Box("free"), movies::Box("free")};
    movie.tracks[0].edits = {{300, 0, 1.0}, {300, 0, 1.0}};
    movies::VideoFormat format;
    format.rasterText.emplace(100, 'x');
    movie.tracks[0].descriptions = {format.ToBox(), format.ToBox()};
    return movie;
}

using header_parser::ParserLimits;

TEST(ParserLimits, EachTakesWhatComesUpToIt) {
    const movies::Movie movie = MovieOfTwo();
    ParserLimits limits;
    limits.maxTracks = 2;
    limits.maxTopLevelAtoms = 5;  // ftyp, free, free, mdat, moov
    limits.maxHeaderBytes = movies::Build(movie).headerSize;
    limits.maxEditsInTrack = 2;
    limits.maxDescriptionsInTrack = 2;
    limits.maxAttributeText = 100;
    EXPECT_EQ(ParsedMovie(movie, limits).Result(), NCF_OK) << ParsedMovie(movie, limits).Reason();
    --limits.maxHeaderBytes;
    EXPECT_EQ(ParsedMovie(movie, limits).Result(), NCF_E_OUTOFMEMORY);
}

TEST(ParserLimits, EachRefusesAMovieThatTheDefaultTakes) {
    const struct {
        const char* name;
        void (*narrow)(ParserLimits&);
        bool compressed = false;
    } rows[] = {
        {"tracks", [](ParserLimits& limits) { limits.maxTracks = 1; }},
        {"atoms", [](ParserLimits& limits) { limits.maxTopLevelAtoms = 4; }},
        {"header bytes", [](ParserLimits& limits) { limits.maxHeaderBytes = 500; }},
        {"edits", [](ParserLimits& limits) { limits.maxEditsInTrack = 1; }},
        {"descriptions", [](ParserLimits& limits) { limits.maxDescriptionsInTrack = 1; }},
        {"attribute text", [](ParserLimits& limits) { limits.maxAttributeText = 99; }},
        {"inflated bytes", [](ParserLimits& limits) { limits.maxInflatedBytes = 500; }, true},
        {"inflation", [](ParserLimits& limits) { limits.maxInflationRatio = 1; }, true},
    };
    movies::Movie movie = MovieOfTwo();
    for (const auto& row : rows) {
        movie.compressed = row.compressed;
        EXPECT_EQ(ParsedMovie(movie).Result(), NCF_OK) << ParsedMovie(movie).Reason();
        ParserLimits limits;
        row.narrow(limits);
        EXPECT_EQ(ParsedMovie(movie, limits).Result(), NCF_E_OUTOFMEMORY) << row.name;
    }
}

}  // namespace
