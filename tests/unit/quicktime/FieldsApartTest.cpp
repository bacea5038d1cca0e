// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Streams that keep each field in a packet: two packets are one picture.

#include <gtest/gtest.h>

#include "tests/unit/quicktime/FieldCodedVideo.h"

using namespace quicktime_tests;

namespace {

constexpr int kPictures = 12;

class FieldsApart : public testing::TestWithParam<const char*> {
protected:
    void SetUp() override {
        const MadeMovie stream(FieldCodedVideo(kPictures), ".h264");
        // Fifty packets a second.
        movie_ = std::make_unique<MadeMovie>(
            "-f h264 -framerate 50 -i " + stream.Quoted() + " -c copy", GetParam());
    }
    std::unique_ptr<MadeMovie> movie_;
};

TEST_P(FieldsApart, ArePairedInTheSampleTable) {
    ASSERT_EQ(movie_->Probed("-show_entries packet=size").size(), std::size_t{2 * kPictures});
    const auto wrapper = OpenWrapper(movie_->Path());
    host::Ref<QTWrapper::IQTWSampleTable> table;
    ASSERT_EQ(wrapper->GetSampleTable(table.Out()), NCF_OK);
    ncfUInt64 count = 0;
    ASSERT_EQ(table->GetNumSamples(1, &count), NCF_OK);
    EXPECT_EQ(count, ncfUInt64{kPictures});
    ncfUInt32 size = 0;
    ASSERT_EQ(table->GetDataSizePerSample(1, 2, &size), NCF_OK);
    EXPECT_GE(size, 2u * 384u);
    EXPECT_EQ(table->HasOutOfOrderFrameDependencies(1), 0);
    // Neither a pair that lies apart nor a stream in pieces has one place.
    ncfUInt64 place = 77;
    if (std::string(GetParam()) == ".h264") {
        ncfUInt64 next = 0;
        ASSERT_EQ(table->GetDataOffset(1, 2, &place), NCF_OK);
        ASSERT_EQ(table->GetDataOffset(1, 3, &next), NCF_OK);
        EXPECT_EQ(next, place + size);
    } else {
        EXPECT_EQ(table->GetDataOffset(1, 2, &place), NCF_E_NOTSUPPORTED);
        EXPECT_EQ(table->GetNextDiscontiguousDataAttributeChange(1, 2, &place), NCF_E_NOTSUPPORTED);
        EXPECT_EQ(place, 77u);
    }
}

TEST_P(FieldsApart, CountAsOnePicture) {
    const auto wrapper = OpenWrapper(movie_->Path());
    ncfSInt32 num = 0, den = 0;
    ncfUInt64 length = 0;
    ASSERT_EQ(wrapper->DetermineMovieEditRateAndLength(0, 0, 0, &num, &den, &length, nullptr, 0, 0),
              NCF_OK);
    ncfBool sound = 7, picture = 7;
    ASSERT_EQ(wrapper->MovieTrackDurationIssues(25, 1, kPictures, &sound, &picture), NCF_OK);
    EXPECT_EQ(picture, 0);
    if (std::string(GetParam()) == ".ts") {  // the others tell no times, or other ones
        EXPECT_EQ(num, 25);
        EXPECT_EQ(den, 1);
        EXPECT_EQ(length, ncfUInt64{kPictures});
    }
    ncfUInt32 interlaced = 0, bits = 0, fields = 0;
    ASSERT_EQ(wrapper->QueryVideoDescBufferDetails(&interlaced, &bits), NCF_OK);
    EXPECT_EQ(interlaced, 1u);
    EXPECT_EQ(bits, 1u);  // top first; the picture comes out woven
    ASSERT_EQ(wrapper->GetFieldLayoutForTrack(1, &fields), 1);
    EXPECT_EQ(fields, 2u);
}

// In order, then to and fro: each picture has its own two fields.
TEST_P(FieldsApart, ComeOutWoven) {
    const auto reader = OpenVideo(movie_->Path(), Code("2vuy"));
    ASSERT_TRUE(reader);
    std::vector<ncfUInt64> order;
    for (ncfUInt64 i = 0; i < kPictures; ++i) {
        order.push_back(i);
    }
    order.insert(order.end(), {7, 2, 11, 5, 6, 0, 9});
    for (const ncfUInt64 number : order) {
        NCFRESULT result = NCF_OK;
        const Bytes picture = Picture(*reader, number, &result);
        ASSERT_EQ(result, NCF_OK) << number;
        ASSERT_EQ(picture.size(), std::size_t{16 * 32 * 2});
        EXPECT_EQ(picture[1], 16 + 4 * number) << number;
        EXPECT_EQ(picture[32 + 1], 16 + 4 * number + 2) << number;
    }
    NCFRESULT result = NCF_OK;
    Picture(*reader, kPictures, &result);
    EXPECT_EQ(result, NMA_E_NODATA);
}

INSTANTIATE_TEST_SUITE_P(Containers, FieldsApart, testing::Values(".ts", ".mpg", ".avi", ".h264"),
                         [](const auto& test) { return std::string(test.param).substr(1); });

}  // namespace
