// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Every record of the data files, reached by a movie of its code and raster that
// the movie builder writes. What is expected stands in KnownRecords.cpp, taken
// from public registers and not from the data files.

#include "tests/system/Facts.h"
#include "tests/system/KnownPictures.h"
#include "tests/system/SystemTest.h"

namespace {

movies::Movie MovieOf(const KnownRecord& record) {
    movies::VideoFormat format;
    format.codec = record.code;
    format.vendor = record.vendor;
    format.width = record.width;
    format.height = record.height;
    if (record.fields != 0) {
        format.fields = {record.fields, record.fields == 2 ? 9u : 0u};
    }
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(format, 5, 25, 1, 64));
    return movie;
}

std::string NameOf(const KnownRecord& record) {
    return std::string(record.code) + " " + std::to_string(record.width) + "x" +
           std::to_string(record.height) + " of " + std::to_string(record.fields) + " fields by '" +
           record.vendor + "'";
}

// One test for the codes that begin alike.
class KnownRecordsOf : public SystemTest, public testing::WithParamInterface<const char*> {};

TEST_P(KnownRecordsOf, AreReachedByTheirMovies) {
    const std::string beginning = GetParam();
    int described = 0;
    for (const KnownRecord& record : KnownRecords()) {
        if (std::string(record.code).compare(0, beginning.size(), beginning) == 0) {
            ExpectKnownPicture(Describe(MovieOf(record)), record, NameOf(record));
            ++described;
        }
    }
    EXPECT_GT(described, 0);
}

constexpr const char* kBeginnings[] = {"apco", "apcs", "apcn", "apch", "ap4h", "ap4x",
                                       "dv",   "mx",   "xd5",  "xdv",  "hdv",  "ai5",
                                       "ai1",  "2vuy", "v210", "2Vuy"};
INSTANTIATE_TEST_SUITE_P(Codes, KnownRecordsOf, testing::ValuesIn(kBeginnings),
                         [](const auto& test) { return std::string(test.param); });

// No record is left out by the beginnings above.
TEST(KnownRecordsTable, IsCoveredByTheTests) {
    for (const KnownRecord& record : KnownRecords()) {
        int covered = 0;
        for (const std::string beginning : kBeginnings) {
            covered += std::string(record.code).compare(0, beginning.size(), beginning) == 0;
        }
        EXPECT_EQ(covered, 1) << record.code;
    }
}

class UnknownRaster : public SystemTest {};

TEST_F(UnknownRaster, OfAKnownCodeTakesTheProvider) {
    KnownRecord record = *FindRecord("apch", 1920, 1080, 1);
    record.width = 1000;
    record.height = 500;
    EXPECT_EQ(PictureLine(Describe(MovieOf(record))),
              "provider ProRes 422 HQ stored 1000x500 shows 1000x500 FullFrame 2/1");
}

}  // namespace
