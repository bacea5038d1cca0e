// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "reference_host/framework/String.h"
#include "reference_host/quicktime/QuickTimeProperty.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

// Before a movie is open every operation says so and leaves outputs alone.
void ExpectNothing(QTWrapper::IQuickTimeWrapper& w) {
    ncfUInt32 a = 7, b = 7, c = 7, d = 7;
    ncfUInt8 bytes[4] = {7, 7, 7, 7};
    ncfBool x = 7, y = 7;
    ncfSInt32 n = 7, m = 7;
    ncfUInt64 l = 7;
    host::Ref<QTWrapper::IQTWSampleTable> table;
    host::Ref<QTWrapper::IQTAudioReader> audio;
    host::Ref<QTWrapper::IQTVideoReader> video;
    const auto name = host::MakeString(std::string_view("kept"));
    EXPECT_EQ(w.PreparePixelFormat(Code("2vuy")), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetSampleTable(table.Out()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetQTAudioReader(audio.Out()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetQTVideoReader(video.Out()), NMA_E_NOTINITIALIZED);
    EXPECT_FALSE(table || audio || video);
    EXPECT_EQ(w.QueryVideoDescBufferDetails(&a, &b), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetCodecColorSpaceInfo(&x, &y), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.MovieHasOneFrame(), 0);
    EXPECT_EQ(w.GetResolutionId(1), 0u);
    EXPECT_EQ(w.GetCodecTypeName(1, name.get()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.MovieTrackDurationIssues(25, 1, 10, &x, &y), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.MovieHasMultipleVideoTracks(0, 0), 0);
    EXPECT_EQ(w.GetFirstVideoTrack(&a), 0);
    EXPECT_EQ(w.GetFieldLayoutForTrack(1, &a), 0);
    EXPECT_EQ(w.GetFourCCFromImageDescrptor(1, bytes), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetImageDescriptionCount(1), 0u);
    EXPECT_EQ(w.MovieContainsAlpha(0, &x), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetAudioInfoForTrack(1, &a, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr,
                                     nullptr, nullptr),
              NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetMovieBox(&a, &b, &c, &d), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetMovieCreationTime(), 0u);
    EXPECT_EQ(w.GetDescribedTrackCount(), 0u);
    EXPECT_EQ(w.MovieIsSelfContained(0, 0, 0), 0u);
    EXPECT_EQ(w.GetTimeCodeInfoForTrack(1, bytes, bytes, bytes, bytes, &a, &b, &c, &d),
              NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.IsVideoTrack(1), 0);
    EXPECT_EQ(w.IsAudioTrack(1), 0);
    EXPECT_EQ(w.IsTimeCodeTrack(1), 0);
    EXPECT_EQ(w.GetNumberOfTracks(), 0u);
    EXPECT_EQ(w.MovieHasAudio(), 0);
    EXPECT_EQ(w.DetermineMovieEditRateAndLength(0, 0, 0, &n, &m, &l, nullptr, 0, 0),
              NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.QTWSetMovieBox(0, 0, 10, 10), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetVendor(1, &a), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(w.GetTrackDuration(1), 0u);
    EXPECT_EQ(w.GetMovieTimeScale(), 0u);
    EXPECT_EQ(a + b + c + d + l + bytes[0], 7u * 6u);
    EXPECT_EQ(x + y + n + m, 28);
}

TEST(UnopenedWrapper, AnswersThatNoMovieIsOpen) {
    ExpectNothing(*host::MakeRef<host::QuickTimeWrapper>());
}

TEST(UnopenedWrapper, ForgetsTheMovieBeforeAFailure) {
    const MadeMovie movie("-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 -c:v mpeg4");
    const auto wrapper = OpenWrapper(movie.Path());
    ASSERT_TRUE(wrapper);
    const auto nowhere = host::MakeString(std::string_view("\\no\\such\\file.mov"));
    EXPECT_EQ(wrapper->NewMovieFromFilePath(nowhere.get()), NCF_E_FAIL);
    ExpectNothing(*wrapper);
    EXPECT_EQ(wrapper->NewMovieFromFilePath(nullptr), NCF_E_POINTER);
}

TEST(UnopenedProperty, AnswersThatNoMovieIsOpen) {
    const auto property = host::MakeRef<host::QuickTimeProperty>();
    host::Ref<INCFBuffer> codes;
    ncfUInt32 value = 7;
    EXPECT_EQ(property->GetCodecPixelFormats(codes.Out(), &value), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(property->GetCodecStorageType(&value), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(property->DoesCodecSupportRGB_CCIR(&value), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(value, 7u);
    const auto name = host::MakeString(std::string_view(""));
    EXPECT_EQ(property->GetCodecName(Code("avc1"), name.get()), NCF_OK);
    EXPECT_EQ(name->Text(), U"H.264");
}

}  // namespace
