// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/MediaTrack.h"

#include <gtest/gtest.h>

#include "source/essence/FormatEnums.h"
#include "tests/support/fakes/RecordingLogger.h"

namespace {

QTImageFormat SomeFormat() {
    QTImageFormat format;
    format.pixelFormat = PF_BGRA;
    format.chromaSubSampling = CSS_4444;
    format.componentFormat = CT_UCHAR;
    format.componentRangeType = CRT_FullRange;
    format.colorSpace = CS_RGB;
    format.fieldOrder = 256;
    format.frameLayout = 256;
    format.orientation = 1;
    format.qt_params = {QuickTime::kBGRAPixelFormat, {4, 1}, {4, 1}, nullptr};
    return format;
}

void NoConversion(const ncfUInt8*, ncfUInt8*, std::size_t, std::size_t, ncfUInt32, ncfUInt32,
                  LevelPass&) {}

// A track that can hold an entry without a format.
class TrackWithAHole final : public MediaTrack {
public:
    TrackWithAHole() { formats_.resize(1); }
    ncfUInt32 GetTrackType() const override { return kVideo; }
};

TEST(MediaTrack, TellsItsKind) {
    EXPECT_EQ(VideoMediaTrack(MediaTrack::kVideo).GetTrackType(), 0u);
    EXPECT_EQ(VideoMediaTrack(MediaTrack::kVideoAlpha).GetTrackType(), 1u);
    EXPECT_EQ(AudioMediaTrack().GetTrackType(), 2u);
    EXPECT_TRUE(IsPictureTrack(VideoMediaTrack(MediaTrack::kVideo)));
    EXPECT_TRUE(IsPictureTrack(VideoMediaTrack(MediaTrack::kVideoAlpha)));
    EXPECT_FALSE(IsPictureTrack(AudioMediaTrack()));
    EXPECT_TRUE(IsAudioTrack(AudioMediaTrack()));
    EXPECT_FALSE(IsAudioTrack(VideoMediaTrack(MediaTrack::kVideoAlpha)));
}

TEST(MediaTrack, StartsWithoutFormatsOrChoice) {
    const VideoMediaTrack track(MediaTrack::kVideo);
    EXPECT_EQ(track.GetNumberOfFormats(), 0u);
    EXPECT_EQ(track.GetSelectedIndex(), 0u);
    EXPECT_FALSE(track.GetSelectedFormat());
}

TEST(MediaTrack, DropsAFormatThatItHas) {
    VideoMediaTrack track(MediaTrack::kVideo);
    track.AddFormat(SomeFormat());
    track.AddFormat(SomeFormat());
    EXPECT_EQ(track.GetNumberOfFormats(), 1u);
}

TEST(MediaTrack, EveryFieldButTheConversionTellsFormatsApart) {
    using Change = void (*)(QTImageFormat&);
    const Change changes[] = {
        [](QTImageFormat& f) { f.pixelFormat = PF_ARGB; },
        [](QTImageFormat& f) { f.chromaSubSampling = CSS_None; },
        [](QTImageFormat& f) { f.componentFormat = CT_10Bit; },
        [](QTImageFormat& f) { f.componentRangeType = CRT_VideoRange; },
        [](QTImageFormat& f) { f.colorSpace = CS_MONO; },
        [](QTImageFormat& f) { f.fieldOrder = 512; },
        [](QTImageFormat& f) { f.frameLayout = 512; },
        [](QTImageFormat& f) { f.orientation = 2; },
        [](QTImageFormat& f) { f.qt_params.fourCC = QuickTime::kNVZ2PixelFormat; },
        [](QTImageFormat& f) {
            f.qt_params.decodedBytesPerPixel = {8, 2};
        },
        [](QTImageFormat& f) {
            f.qt_params.outputBytesPerPixel = {8, 2};
        },
    };
    VideoMediaTrack track(MediaTrack::kVideo);
    track.AddFormat(SomeFormat());
    ncfUInt32 expected = 1;
    for (const Change change : changes) {
        QTImageFormat format = SomeFormat();
        change(format);
        track.AddFormat(format);
        EXPECT_EQ(track.GetNumberOfFormats(), ++expected) << "ratios are not reduced either";
    }
    QTImageFormat converted = SomeFormat();
    converted.qt_params.convert = NoConversion;
    track.AddFormat(converted);
    EXPECT_EQ(track.GetNumberOfFormats(), expected);
    MediaFormatPtr first;
    ASSERT_EQ(track.GetMediaFormat(0, first), NCF_OK);
    EXPECT_EQ(dynamic_cast<const QTImageFormat&>(*first).qt_params.convert, nullptr)
        << "the first stays";
}

TEST(MediaTrack, TellsSoundFormatsApart) {
    AudioMediaTrack track;
    track.AddFormat(QTAudioFormat(SF_PCM_INT_LE, 3, 24));
    track.AddFormat(QTAudioFormat(SF_PCM_INT_LE, 3, 24));
    EXPECT_EQ(track.GetNumberOfFormats(), 1u);
    track.AddFormat(QTAudioFormat(SF_PCM_INT_BE, 3, 24));
    track.AddFormat(QTAudioFormat(SF_PCM_INT_LE, 4, 24));
    track.AddFormat(QTAudioFormat(SF_PCM_INT_LE, 3, 20));
    EXPECT_EQ(track.GetNumberOfFormats(), 4u);
}

TEST(MediaTrack, FormatPastTheEndIsSilentlyInvalidAndAHoleIsAsserted) {
    FakeHost host;
    {
        const RecordingLog log(host);
        const TrackWithAHole track;
        MediaFormatPtr format;
        EXPECT_EQ(track.GetMediaFormat(1, format), NCF_E_INVALIDARG);
        EXPECT_TRUE(log.records().empty());
        EXPECT_EQ(track.GetMediaFormat(0, format), NCF_E_FAIL);
        EXPECT_TRUE(log.once("NCFASSERT( mediaFormat )MediaTrack::GetMediaFormat"));
    }
}

TEST(AudioMediaTrack, HasOneChannelUntilTold) {
    FakeHost host;
    {
        const RecordingLog log(host);
        AudioMediaTrack track;
        EXPECT_EQ(track.GetNumberAudioChannels(), 1u);
        EXPECT_EQ(track.SetNumberAudioChannels(6), NCF_OK);
        EXPECT_EQ(track.SetNumberAudioChannels(0), NCF_E_FAIL);
        EXPECT_EQ(track.GetNumberAudioChannels(), 6u);
        EXPECT_TRUE(
            log.once("NCFASSERT( num_channels > 0 )AudioMediaTrack::SetNumberAudioChannels"));
    }
}

TEST(FormatNumbers, AreTheHosts) {
    EXPECT_EQ(CSS_4220, 1u);
    EXPECT_EQ(CSS_4444, 4u);
    EXPECT_EQ(CSS_None, 128u);
    EXPECT_EQ(CRT_VideoRange, 1u);
    EXPECT_EQ(CRT_FullRange, 2u);
    EXPECT_EQ(CRT_UNDEFINED, 0x7FFFFFFFu);
    EXPECT_EQ(CT_UNDEFINED, 0x7FFFFFFFu);
    EXPECT_EQ(SF_PCM_INT_LE, 0x4132434Cu);
    EXPECT_EQ(SF_PCM_INT_BE, 0x41324342u);
    const auto code = [](const char* text) {
        ncfUInt32 number = 0;
        for (int i = 0; i < 4; ++i) {
            number = number << 8 | static_cast<ncfUInt8>(text[i]);
        }
        return number;
    };
    EXPECT_EQ(QuickTime::k2vuyPixelFormat, code("2vuy"));
    EXPECT_EQ(QuickTime::kv210PixelFormat, code("v210"));
    EXPECT_EQ(QuickTime::kBGRAPixelFormat, code("BGRA"));
    EXPECT_EQ(QuickTime::kRGBAPixelFormat, code("RGBA"));
    EXPECT_EQ(QuickTime::kNVZ1PixelFormat, code("NVZ1"));
    EXPECT_EQ(QuickTime::kNVZ2PixelFormat, code("NVZ2"));
    EXPECT_EQ(QuickTime::kb64aPixelFormat, code("b64a"));
    EXPECT_EQ(QuickTime::kb48rPixelFormat, code("b48r"));
    EXPECT_EQ(QuickTime::kr4flPixelFormat, code("r4fl"));
}

}  // namespace
