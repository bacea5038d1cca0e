// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Every kind of container that the library opens: lengths, names, and where
// the bytes of samples stand.

#include <gtest/gtest.h>

extern "C" {
#include <libavformat/avformat.h>
}

#include "reference_host/framework/String.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

const std::string kPicture = "-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 ";
const std::string kSound = "-f lavfi -i sine=d=0.4:r=48000 ";

struct Row {
    const char* ending;
    std::string arguments;
    bool isPlain;  // samples stand in the file as they are
};

const std::vector<Row>& Rows() {
    static const std::vector<Row> rows = {
        {".mov", kPicture + kSound + "-c:v mpeg4 -bf 2 -c:a pcm_s16le", true},
        {".mp4", kPicture + "-c:v libx264 -bf 2 -movflags frag_keyframe+empty_moov", true},
        {".avi", kPicture + kSound + "-c:v mpeg4 -vtag FMP4 -c:a pcm_s16le", true},
        {".mpg", kPicture + kSound + "-c:v mpeg1video -c:a mp2", false},
        {".ts", kPicture + kSound + "-c:v mpeg2video -bf 2 -c:a mp2", false},
        {".mkv", kPicture + "-c:v mpeg4", false},
        {".gif", kPicture, true},
        {".m2v", kPicture + "-c:v mpeg2video", true},
        {".wav", kSound + "-c:a pcm_s24le", true},
        {".aiff", kSound + "-c:a pcm_s16be", true},
        {".au", kSound + "-c:a pcm_s16be", true},
        {".mp3", kSound, true},
        {".aac", kSound, true},
    };
    return rows;
}

// Bytes of a stream's packets one after the other, by the library itself.
Bytes PacketsOf(const std::filesystem::path& path, int stream) {
    Bytes bytes;
    AVFormatContext* input = nullptr;
    if (avformat_open_input(&input, path.c_str(), nullptr, nullptr) < 0) {
        ADD_FAILURE() << path;
        return bytes;
    }
    AVPacket* packet = av_packet_alloc();
    while (av_read_frame(input, packet) >= 0) {
        if (packet->stream_index == stream) {
            bytes.insert(bytes.end(), packet->data, packet->data + packet->size);
        }
        av_packet_unref(packet);
    }
    av_packet_free(&packet);
    avformat_close_input(&input);
    return bytes;
}

TEST(Containers, TellPlacesOfSamplesOnlyWhereTheirBytesAre) {
    for (const Row& row : Rows()) {
        SCOPED_TRACE(row.ending);
        const MadeMovie movie(row.arguments, row.ending);
        const Bytes file = movie.Content();
        const auto wrapper = OpenWrapper(movie.Path());
        ASSERT_TRUE(wrapper);
        host::Ref<QTWrapper::IQTWSampleTable> table;
        ASSERT_EQ(wrapper->GetSampleTable(table.Out()), NCF_OK);
        for (ncfUInt32 track = 1; track <= wrapper->GetNumberOfTracks(); ++track) {
            ncfUInt64 count = 0, place = 77;
            ASSERT_EQ(table->GetNumSamples(track, &count), NCF_OK);
            ASSERT_GT(count, 0u);
            if (!row.isPlain) {
                EXPECT_EQ(table->GetDataOffset(track, 1, &place), NCF_E_NOTSUPPORTED);
                EXPECT_EQ(table->GetDataOffset(track, 0, &place), NCF_E_INVALIDARG);
                EXPECT_EQ(place, 77u);
                continue;
            }
            Bytes found;
            for (ncfUInt64 sample = 1; sample <= count; ++sample) {
                ncfUInt32 size = 0;
                ASSERT_EQ(table->GetDataOffset(track, sample, &place), NCF_OK);
                ASSERT_EQ(table->GetDataSizePerSample(track, sample, &size), NCF_OK);
                ASSERT_LE(place + size, file.size());
                found.insert(found.end(), file.begin() + static_cast<std::ptrdiff_t>(place),
                             file.begin() + static_cast<std::ptrdiff_t>(place + size));
            }
            EXPECT_EQ(found, PacketsOf(movie.Path(), static_cast<int>(track) - 1)) << track;
        }
    }
}

TEST(Containers, TellRateLengthAndNames) {
    for (const Row& row : Rows()) {
        SCOPED_TRACE(row.ending);
        const MadeMovie movie(row.arguments, row.ending);
        const auto wrapper = OpenWrapper(movie.Path());
        ASSERT_TRUE(wrapper);
        ncfSInt32 num = 0, den = 0;
        ncfUInt64 length = 0;
        ASSERT_EQ(
            wrapper->DetermineMovieEditRateAndLength(0, 25, 60, &num, &den, &length, nullptr, 0, 0),
            NCF_OK);
        EXPECT_EQ(num, 25);
        EXPECT_EQ(den, 1);
        EXPECT_EQ(length, 10u);
        for (ncfUInt32 track = 1; track <= wrapper->GetNumberOfTracks(); ++track) {
            const auto name = host::MakeString(std::string_view(""));
            ASSERT_EQ(wrapper->GetCodecTypeName(track, name.get()), NCF_OK);
            EXPECT_FALSE(name->Text().empty()) << track;
            ncfUInt8 code[4] = {};
            if (wrapper->IsVideoTrack(track)) {
                EXPECT_EQ(wrapper->GetFourCCFromImageDescrptor(track, code), NCF_OK) << track;
            }
            EXPECT_EQ(wrapper->GetImageDescriptionCount(track), 1u);
            ncfUInt32 vendor = 7;
            EXPECT_EQ(wrapper->GetVendor(track, &vendor), NCF_OK);
            EXPECT_TRUE(vendor == 0 || vendor == Code("FFMP")) << vendor;
        }
    }
}

// What the file tells by its bytes alone: as long as its packets.
TEST(Containers, MeasureSoundThatTellsNoLength) {
    const MadeMovie movie("-f lavfi -i sine=d=3:r=48000 -c:a aac -b:a 20k", ".aac");
    const auto packets = movie.Probed("-show_entries packet=size").size();
    const auto wrapper = OpenWrapper(movie.Path());
    const double seconds =
        static_cast<double>(wrapper->GetTrackDuration(1)) / wrapper->GetMovieTimeScale();
    EXPECT_NEAR(seconds, static_cast<double>(packets) * 1024 / 48000, 0.0001);
}

}  // namespace
