// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "reference_host/framework/String.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

using Wrapper = host::Ref<QTWrapper::IQuickTimeWrapper>;

struct Length {
    NCFRESULT result = NCF_OK;
    ncfSInt32 num = 0;
    ncfSInt32 den = 0;
    ncfUInt64 units = 0;
    std::vector<ncfUInt64> tracks;
};

Length Ask(const Wrapper& wrapper, double forced, double editor, ncfUInt32 single,
           bool byMovie = false) {
    Length length;
    length.tracks.resize(wrapper->GetNumberOfTracks());
    length.result = wrapper->DetermineMovieEditRateAndLength(
        forced, editor, single, &length.num, &length.den, &length.units, length.tracks.data(),
        static_cast<ncfUInt32>(length.tracks.size()), byMovie);
    return length;
}

TEST(QuickTimeWrapper, TellsRateAndLengthOfVideo) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=64x48:r=30000/1001:d=2 -f lavfi -i sine=d=1:r=48000 -c:v mpeg4 "
        "-c:a pcm_s16le");
    const Wrapper wrapper = OpenWrapper(movie.Path());
    ASSERT_TRUE(wrapper);
    const Length own = Ask(wrapper, 0.0, 50.0, 0);
    EXPECT_EQ(own.result, NCF_OK);
    EXPECT_EQ(own.num, 30000);
    EXPECT_EQ(own.den, 1001);
    EXPECT_EQ(own.units, 60u);
    ASSERT_EQ(own.tracks.size(), 2u);
    EXPECT_EQ(own.tracks[0], 60u);
    EXPECT_EQ(own.tracks[1], 30u);
    const Length forced = Ask(wrapper, 25.0, 50.0, 0);
    EXPECT_EQ(forced.num, 25);
    EXPECT_EQ(forced.den, 1);
    EXPECT_EQ(forced.units, 50u);
    EXPECT_EQ(Ask(wrapper, 0.01, 50.0, 0).num, 30000);  // too little to be meant
    EXPECT_EQ(Ask(wrapper, 0.0, 0.0, 0, true).units, 60u);
}

TEST(QuickTimeWrapper, GivesAStillTheLengthAskedFor) {
    const MadeMovie still("-f lavfi -i testsrc2=s=64x48 -frames:v 1", ".png");
    const Wrapper wrapper = OpenWrapper(still.Path());
    ASSERT_TRUE(wrapper);
    EXPECT_EQ(wrapper->MovieHasOneFrame(), 1);
    EXPECT_EQ(Ask(wrapper, 0.0, 30.0, 60).units, 60u);
    EXPECT_EQ(Ask(wrapper, 0.0, 30.0, 60).num, 30);
    EXPECT_EQ(Ask(wrapper, 0.0, 30.0, 0).units, 1u);
    EXPECT_EQ(Ask(wrapper, 24.0, 30.0, 0).num, 24);
    EXPECT_EQ(Ask(wrapper, 0.0, 0.0, 0).num, 25);
}

TEST(QuickTimeWrapper, TakesTheEditorsRateForSoundAlone) {
    const MadeMovie movie("-f lavfi -i sine=d=2.03:r=48000 -c:a pcm_s16le");
    const Wrapper wrapper = OpenWrapper(movie.Path());
    ASSERT_TRUE(wrapper);
    EXPECT_EQ(wrapper->MovieHasAudio(), 1);
    EXPECT_EQ(Ask(wrapper, 0.0, 25.0, 0).units, 50u);  // cut, not rounded
    EXPECT_EQ(Ask(wrapper, 50.0, 25.0, 0).units, 101u);
    EXPECT_EQ(Ask(wrapper, 0.0, 0.0, 0).result, NCF_E_FAIL);
    ncfUInt32 track = 7;
    EXPECT_EQ(wrapper->GetFirstVideoTrack(&track), 0);
    EXPECT_EQ(track, 7u);
    ncfUInt32 width = 7, height = 7;
    EXPECT_EQ(wrapper->GetMovieBox(&width, &height, nullptr, nullptr), NCF_E_NOTFOUND);
}

// The header's length is that of the longest track, which need not be the first.
TEST(QuickTimeWrapper, CountsByTheFirstTrackOrByTheHeaderAsAsked) {
    for (const char* first : {"testsrc2=s=64x48:r=25:d=1", "sine=d=1:r=48000"}) {
        const MadeMovie movie(std::string("-f lavfi -i ") + first +
                              " -f lavfi -i sine=d=2:r=48000 -map 0 -map 1 -c:v mpeg4 -c:a "
                              "pcm_s16le");
        const Wrapper wrapper = OpenWrapper(movie.Path());
        ASSERT_TRUE(wrapper);
        EXPECT_EQ(Ask(wrapper, 0.0, 25.0, 0, false).units, 25u) << first;
        EXPECT_EQ(Ask(wrapper, 0.0, 25.0, 0, true).units, 50u) << first;
    }
}

TEST(QuickTimeWrapper, NoticesTracksThatDisagreeWithTheLength) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=64x48:r=25:d=2 -f lavfi -i sine=d=1:r=48000 -c:v mpeg4 -c:a "
        "pcm_s16le");
    const Wrapper wrapper = OpenWrapper(movie.Path());
    ncfBool sound = 7, picture = 7;
    EXPECT_EQ(wrapper->MovieTrackDurationIssues(25, 1, 50, &sound, &picture), NCF_OK);
    EXPECT_EQ(sound, 1);
    EXPECT_EQ(picture, 0);
    EXPECT_EQ(wrapper->MovieTrackDurationIssues(25, 1, 26, &sound, &picture), NCF_OK);
    EXPECT_EQ(sound, 0);  // one unit is rounding
    EXPECT_EQ(picture, 1);
    EXPECT_EQ(wrapper->MovieTrackDurationIssues(25, 1, 0, &sound, &picture), NCF_OK);
    EXPECT_EQ(sound + picture, 0);
    EXPECT_EQ(wrapper->MovieTrackDurationIssues(0, 1, 50, &sound, &picture), NCF_E_INVALIDARG);
}

TEST(QuickTimeWrapper, TellsFieldsByTheirFirst) {
    struct Row {
        const char* order;
        ncfUInt32 interlaced, bits;
    };
    for (const Row& row : {Row{"progressive", 0, 0}, Row{"tt", 1, 9}, Row{"bb", 1, 8},
                           Row{"tb", 1, 1}, Row{"bt", 1, 0}}) {
        const MadeMovie movie(
            std::string("-f lavfi -i testsrc2=s=64x48:r=25:d=0.2 -c:v v210 -field_order ") +
            row.order);
        const Wrapper wrapper = OpenWrapper(movie.Path());
        ncfUInt32 interlaced = 7, bits = 7, fields = 7;
        EXPECT_EQ(wrapper->QueryVideoDescBufferDetails(&interlaced, &bits), NCF_OK) << row.order;
        EXPECT_EQ(interlaced, row.interlaced) << row.order;
        EXPECT_EQ(bits, row.bits) << row.order;
        EXPECT_EQ(wrapper->GetFieldLayoutForTrack(1, &fields), 1);
        EXPECT_EQ(fields, row.interlaced + 1);
    }
    const MadeMovie silent("-f lavfi -i testsrc2=s=64x48:r=25:d=0.2", ".gif");
    const Wrapper wrapper = OpenWrapper(silent.Path());
    ncfUInt32 a = 7, b = 7;
    EXPECT_EQ(wrapper->QueryVideoDescBufferDetails(&a, &b), NMA_E_FIELDS);
    EXPECT_EQ(wrapper->GetFieldLayoutForTrack(1, &a), 0);
    EXPECT_EQ(a + b, 14u);
}

TEST(QuickTimeWrapper, TellsTheMatrixOfTheCodec) {
    struct Row {
        const char* matrix;
        ncfBool is709, is601;
    };
    for (const Row& row : {Row{"bt709", 1, 0}, Row{"smpte240m", 1, 0}, Row{"bt470bg", 0, 1},
                           Row{"smpte170m", 0, 1}, Row{"bt2020nc", 0, 0}}) {
        const MadeMovie movie(std::string("-f lavfi -i testsrc2=s=64x48:r=25:d=0.2 -c:v libx264 "
                                          "-pix_fmt yuv420p -colorspace ") +
                              row.matrix);
        ncfBool is709 = 7, is601 = 7;
        EXPECT_EQ(OpenWrapper(movie.Path())->GetCodecColorSpaceInfo(&is709, &is601), NCF_OK);
        EXPECT_EQ(is709, row.is709) << row.matrix;
        EXPECT_EQ(is601, row.is601) << row.matrix;
    }
}

TEST(QuickTimeWrapper, SeesAlphaInContainerAndPicture) {
    struct Row {
        const char* arguments;
        const char* ending;
        ncfBool told, shown;
    };
    for (const Row& row :
         {Row{"-c:v qtrle -pix_fmt argb", ".mov", 1, 1},
          Row{"-c:v qtrle -pix_fmt rgb24", ".mov", 0, 0},
          Row{"-c:v png -pix_fmt rgba", ".mov", 1, 1}, Row{"-c:v libx264", ".mov", 0, 0},
          Row{"-c:v prores_ks -profile:v 4 -pix_fmt yuva444p10", ".mov", 1, 1},
          Row{"", ".gif", 1, 1}, Row{"-frames:v 1 -pix_fmt pal8", ".png", 0, 0}}) {
        const MadeMovie movie(
            std::string("-f lavfi -i testsrc2=s=64x48:r=25:d=0.2 ") + row.arguments, row.ending);
        const Wrapper wrapper = OpenWrapper(movie.Path());
        ncfBool alpha = 7;
        EXPECT_EQ(wrapper->MovieContainsAlpha(QTWrapper::kAlphaCheckForImport, &alpha), NCF_OK);
        EXPECT_EQ(alpha, row.told) << row.arguments << row.ending;
        EXPECT_EQ(wrapper->MovieContainsAlpha(QTWrapper::kAlphaCheckForQTNMA, &alpha), NCF_OK);
        EXPECT_EQ(alpha, row.shown) << row.arguments << row.ending;
        EXPECT_EQ(wrapper->MovieContainsAlpha(2, &alpha), NCF_E_INVALIDARG);
    }
}

TEST(QuickTimeWrapper, TellsTimecode) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=64x48:r=30000/1001:d=1 -c:v mpeg4 -timecode 10:59:58\\;17");
    const Wrapper wrapper = OpenWrapper(movie.Path());
    ncfUInt32 track = 0;
    for (ncfUInt32 i = 1; i <= wrapper->GetNumberOfTracks(); ++i) {
        track = wrapper->IsTimeCodeTrack(i) ? i : track;
    }
    ASSERT_NE(track, 0u);
    ncfUInt8 h = 0, m = 0, s = 0, f = 0;
    ncfUInt32 scale = 0, duration = 0, drop = 0, frames = 0;
    ASSERT_EQ(
        wrapper->GetTimeCodeInfoForTrack(track, &h, &m, &s, &f, &scale, &duration, &drop, &frames),
        NCF_OK);
    EXPECT_EQ(h, 10);
    EXPECT_EQ(m, 59);
    EXPECT_EQ(s, 58);
    EXPECT_EQ(f, 17);
    EXPECT_EQ(scale * 1001u, duration * 30000u);
    EXPECT_EQ(drop, 1u);
    EXPECT_EQ(frames, 30u);
    EXPECT_EQ(
        wrapper->GetTimeCodeInfoForTrack(1, &h, &m, &s, &f, &scale, &duration, &drop, &frames),
        NCF_E_NOTFOUND);
}

TEST(QuickTimeWrapper, DescribesTracks) {
    const MadeMovie movie(
        "-f lavfi -i testsrc2=s=720x480:r=25:d=1 -f lavfi -i testsrc2=s=64x48:r=25:d=1 "
        "-f lavfi -i sine=d=1:r=48000 -map 0 -map 1 -map 2 -c:v prores_ks -vendor apl0 "
        "-aspect:v:0 4:3 -c:a pcm_s24be -ac 2 -metadata creation_time=2020-01-02T03:04:05Z");
    const Wrapper wrapper = OpenWrapper(movie.Path());
    ASSERT_TRUE(wrapper);
    EXPECT_EQ(wrapper->GetNumberOfTracks(), 3u);
    EXPECT_EQ(wrapper->GetDescribedTrackCount(), 3u);
    EXPECT_EQ(wrapper->MovieHasMultipleVideoTracks(0, 0), 1);
    EXPECT_EQ(wrapper->MovieIsSelfContained(0, 0, 0) & 0xFF, 1u);
    EXPECT_EQ(wrapper->GetImageDescriptionCount(1), 1u);
    EXPECT_EQ(wrapper->GetImageDescriptionCount(0), 0u);
    EXPECT_EQ(wrapper->IsVideoTrack(0), 0);
    EXPECT_EQ(wrapper->IsVideoTrack(1), 1);
    EXPECT_EQ(wrapper->IsAudioTrack(3), 1);
    EXPECT_EQ(wrapper->MovieHasOneFrame(), 0);
    ncfUInt8 code[5] = {};
    ASSERT_EQ(wrapper->GetFourCCFromImageDescrptor(1, code), NCF_OK);
    EXPECT_STREQ(reinterpret_cast<char*>(code), "apch");
    ASSERT_EQ(wrapper->GetFourCCFromImageDescrptor(3, code), NCF_OK);
    EXPECT_STREQ(reinterpret_cast<char*>(code), "in24");
    EXPECT_EQ(wrapper->GetFourCCFromImageDescrptor(4, code), NCF_E_NOTFOUND);
    ncfUInt32 vendor = 0, width = 0, height = 0, above = 0, below = 0;
    ASSERT_EQ(wrapper->GetVendor(1, &vendor), NCF_OK);
    EXPECT_NE(vendor, 0u);
    ASSERT_EQ(wrapper->GetMovieBox(&width, &height, &above, &below), NCF_OK);
    EXPECT_EQ(width, 720u);
    EXPECT_EQ(height, 480u);
    EXPECT_EQ(above, 4u);
    EXPECT_EQ(below, 3u);
    EXPECT_EQ(wrapper->QTWSetMovieBox(0, 0, 480, 720), NCF_OK);
    // What is asked for 65536 comes as 0 in the box's 16 bits.
    EXPECT_EQ(wrapper->QTWSetMovieBox(0, 0, 0, 720), NCF_OK);
    EXPECT_EQ(wrapper->QTWSetMovieBox(0, 0, 480, 0), NCF_OK);
    EXPECT_EQ(wrapper->PreparePixelFormat(Code("2vuy")), NCF_OK);
    EXPECT_LT(wrapper->PreparePixelFormat(Code("none")), 0);
    EXPECT_EQ(wrapper->GetMovieCreationTime(), 2082844800u + 1577934245u);
    EXPECT_EQ(wrapper->GetTrackDuration(1), wrapper->GetMovieTimeScale());
    EXPECT_EQ(wrapper->GetTrackDuration(9), 0u);
    const auto name = host::MakeString(std::string_view(""));
    ASSERT_EQ(wrapper->GetCodecTypeName(1, name.get()), NCF_OK);
    EXPECT_EQ(name->Text(), U"Apple ProRes 422 HQ");
    ncfUInt32 channels = 0, bits = 0;
    EXPECT_EQ(wrapper->GetAudioInfoForTrack(3, &channels, nullptr, nullptr, nullptr, nullptr,
                                            nullptr, &bits, nullptr, nullptr),
              NCF_OK);
    EXPECT_EQ(channels, 2u);
    EXPECT_EQ(bits, 24u);
}

// A media data reference without its flag names another file.
TEST(QuickTimeWrapper, NoticesMediaInOtherFiles) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 -c:v mpeg4");
    Bytes content = movie.Content();
    const std::string text(content.begin(), content.end());
    const std::size_t place = text.find("url ", text.find("dref"));
    ASSERT_NE(place, std::string::npos);
    content[place + 7] = 0;
    const MadeMovie other(content, ".mov");
    const Wrapper wrapper = OpenWrapper(other.Path());
    ASSERT_TRUE(wrapper);
    EXPECT_EQ(wrapper->MovieIsSelfContained(0, 0, 0), 0u);
}

// Readers open the file for themselves.
TEST(QuickTimeWrapper, MayGoBeforeItsReaders) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 -c:v mpeg4");
    const auto reader = OpenVideo(movie.Path(), Code("2vuy"));  // its wrapper has gone
    ASSERT_TRUE(reader);
    EXPECT_FALSE(Picture(*reader, 2).empty());
}

}  // namespace
