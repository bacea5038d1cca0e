// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <sstream>

#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

using Table = host::Ref<QTWrapper::IQTWSampleTable>;

Table OpenTable(const std::filesystem::path& path) {
    Table table;
    const auto wrapper = OpenWrapper(path);
    EXPECT_TRUE(wrapper && wrapper->GetSampleTable(table.Out()) == NCF_OK);
    return table;
}

std::vector<std::string> Fields(const std::string& line) {
    std::vector<std::string> fields;
    std::istringstream text(line);
    for (std::string field; std::getline(text, field, ',');) {
        fields.push_back(field);
    }
    return fields;
}

// Positions, sizes, durations and flags as ffprobe lists the packets.
void ExpectPacketsOfFfprobe(const MadeMovie& movie) {
    const Table table = OpenTable(movie.Path());
    const auto packets = movie.Probed(
        "-ignore_editlist 1 -select_streams v:0 -show_entries "
        "packet=pts,dts,duration,size,pos,flags");
    ncfUInt64 count = 0;
    ASSERT_EQ(table->GetNumSamples(1, &count), NCF_OK);
    ASSERT_EQ(count, packets.size());
    ncfUInt32 most = 0;
    ncfSInt64 least = INT64_MAX;
    ncfSInt64 firstDecode = 0;
    for (std::size_t i = 0; i < packets.size(); ++i) {
        const auto fields = Fields(packets[i]);
        least = std::min<ncfSInt64>(least, std::stoll(fields[0]));
        firstDecode = i == 0 ? std::stoll(fields[1]) : firstDecode;
    }
    bool reorders = false;
    for (std::size_t i = 0; i < packets.size(); ++i) {
        const auto fields = Fields(packets[i]);
        ASSERT_EQ(fields.size(), 6u) << packets[i];
        ncfUInt64 position = 0;
        ncfUInt32 size = 0;
        ncfSInt64 duration = 0, offset = 0;
        QTWrapper::QTWSamplePropertyFlags_t flags{};
        ASSERT_EQ(table->GetDataOffset(1, i + 1, &position), NCF_OK);
        ASSERT_EQ(table->GetDataSizePerSample(1, i + 1, &size), NCF_OK);
        ASSERT_EQ(table->GetDecodeDuration(1, i + 1, &duration), NCF_OK);
        ASSERT_EQ(table->GetDisplayOffset(1, i + 1, &offset), NCF_OK);
        ASSERT_EQ(table->GetSampleFlags(1, i + 1, &flags), NCF_OK);
        EXPECT_EQ(duration, std::stoll(fields[2]));
        EXPECT_EQ(size, std::stoul(fields[3]));
        EXPECT_EQ(position, std::stoull(fields[4]));
        EXPECT_EQ(flags == QTWrapper::kQTWSampleSync, fields[5][0] == 'K');
        EXPECT_EQ(offset, std::stoll(fields[0]) - std::stoll(fields[1]) - (least - firstDecode));
        reorders = reorders || offset != 0;
        most = std::max(most, size);
    }
    EXPECT_EQ(table->GetMaxDataSize(1), most);
    EXPECT_EQ(table->HasOutOfOrderFrameDependencies(1) != 0, reorders);
}

TEST(MovieSampleTable, ListsThePacketsOfReorderedVideo) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=2 -c:v libx264 -bf 2 -g 12");
    ExpectPacketsOfFfprobe(movie);
    EXPECT_NE(OpenTable(movie.Path())->HasOutOfOrderFrameDependencies(1), 0);
}

TEST(MovieSampleTable, ListsThePacketsOfVideoInOrder) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=1 -c:v prores_ks");
    ExpectPacketsOfFfprobe(movie);
    EXPECT_EQ(OpenTable(movie.Path())->HasOutOfOrderFrameDependencies(1), 0);
}

TEST(MovieSampleTable, HoldsAlsoWhatTheEditListHides) {
    const MadeMovie whole("-f lavfi -i testsrc2=s=64x48:r=25:d=2 -c:v libx264 -bf 2 -g 25");
    const MadeMovie cut("-ss 0.6 -i " + whole.Quoted() + " -c copy");
    ExpectPacketsOfFfprobe(cut);
    ncfUInt64 count = 0;
    ASSERT_EQ(OpenTable(cut.Path())->GetNumSamples(1, &count), NCF_OK);
    EXPECT_GT(count, 35u);
}

TEST(MovieSampleTable, CountsFramesOfLinearSound) {
    const MadeMovie movie("-f lavfi -i sine=d=1:r=48000 -ac 2 -c:a pcm_s24le");
    const Table table = OpenTable(movie.Path());
    ncfUInt64 count = 0, position = 0, first = 0, next = 0;
    ncfUInt32 size = 0;
    ncfSInt64 duration = 0;
    ASSERT_EQ(table->GetNumSamples(1, &count), NCF_OK);
    EXPECT_EQ(count, 48000u);
    ASSERT_EQ(table->GetDataOffset(1, 1, &first), NCF_OK);
    ASSERT_EQ(table->GetDataOffset(1, 1001, &position), NCF_OK);
    EXPECT_EQ(position, first + 6000);
    ASSERT_EQ(table->GetDataSizePerSample(1, 700, &size), NCF_OK);
    EXPECT_EQ(size, 6u);
    ASSERT_EQ(table->GetDecodeDuration(1, 700, &duration), NCF_OK);
    EXPECT_EQ(duration, 1);
    ASSERT_EQ(table->GetNextDiscontiguousDataAttributeChange(1, 5, &next), NCF_OK);
    EXPECT_EQ(next, 48001u);  // one run of bytes from end to end
    EXPECT_EQ(table->GetMaxDataSize(1), 6u);
}

TEST(MovieSampleTable, TellsWhereBytesStopFollowing) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=64x48:r=25:d=2 -f lavfi -i sine=d=2 -c:v prores_ks -c:a aac");
    const Table table = OpenTable(movie.Path());
    const auto packets =
        movie.Probed("-ignore_editlist 1 -select_streams v:0 -show_entries packet=size,pos");
    for (std::size_t i = 0; i < packets.size(); ++i) {
        std::size_t end = i + 1;
        while (end < packets.size() && std::stoull(Fields(packets[end])[1]) ==
                                           std::stoull(Fields(packets[end - 1])[1]) +
                                               std::stoull(Fields(packets[end - 1])[0])) {
            ++end;
        }
        ncfUInt64 next = 0;
        ASSERT_EQ(table->GetNextDiscontiguousDataAttributeChange(1, i + 1, &next), NCF_OK);
        EXPECT_EQ(next, end + 1);
    }
}

// Its packets tell no durations and the file tells no length.
TEST(MovieSampleTable, LetsTheLastSampleLastAsLongAsTheOneBefore) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=20:d=0.5 -c:v flv", ".flv");
    const Table table = OpenTable(movie.Path());
    ncfUInt64 count = 0;
    ASSERT_EQ(table->GetNumSamples(1, &count), NCF_OK);
    ASSERT_EQ(count, 10u);
    for (ncfUInt64 sample = 1; sample <= count; ++sample) {
        ncfSInt64 duration = 0;
        ASSERT_EQ(table->GetDecodeDuration(1, sample, &duration), NCF_OK);
        EXPECT_EQ(duration, 50) << sample;
    }
    const MadeMovie still("-f lavfi -i testsrc2=s=64x48 -frames:v 1 -c:v flv", ".flv");
    ncfSInt64 duration = 77;
    ASSERT_EQ(OpenTable(still.Path())->GetDecodeDuration(1, 1, &duration), NCF_OK);
    EXPECT_EQ(duration, 0);
}

TEST(MovieSampleTable, RefusesNumbersThatThereAreNot) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 -c:v mpeg4");
    const Table table = OpenTable(movie.Path());
    ncfUInt64 value = 77;
    EXPECT_EQ(table->GetDataOffset(1, 0, &value), NCF_E_INVALIDARG);
    EXPECT_EQ(table->GetDataOffset(1, 11, &value), NCF_E_INVALIDARG);
    EXPECT_EQ(table->GetDataOffset(1, ~ncfUInt64{0}, &value), NCF_E_INVALIDARG);
    EXPECT_EQ(table->GetDataOffset(2, 1, &value), NCF_E_NOTFOUND);
    EXPECT_EQ(table->GetNumSamples(0, &value), NCF_E_NOTFOUND);
    EXPECT_EQ(value, 77u);
    EXPECT_EQ(table->GetNumSamples(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(table->GetMaxDataSize(5), 0u);
    EXPECT_EQ(table->HasOutOfOrderFrameDependencies(5), 0);
}

}  // namespace
