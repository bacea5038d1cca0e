// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/ClipFixture.h"

namespace {

class QuickTimeClipTiming : public ClipTest {
protected:
    static EditorSettings Settings(double editorRate) {
        EditorSettings settings;
        settings._areSettingsValid = 1;
        settings._editorFrameRate = editorRate;
        return settings;
    }
    static EditorSettings Forced(double editorRate, double forcedRate) {
        EditorSettings settings = Settings(editorRate);
        settings._forcedFrameRateEnabled = 1;
        settings._forcedFrameRate = forcedRate;
        return settings;
    }
    FakeAudioTrack& LoadSound() {
        parser->AddAudioTrack(2);
        Load();
        return *parser->audioTracks[0];
    }
    // A picture track of 25 frames a second.
    void LoadPictures() {
        LoadVideo();
        SetMedia(25, 1, 1);
        RateOf();
    }
    void SetMedia(ncfUInt64 samples, ncfUInt32 timescale, ncfUInt32 duration) {
        Video().table->numSamples = samples;
        Video().mediaTimescale = timescale;
        Video().mediaDuration = duration;
    }
    Rational RateOf(const EditorSettings& settings = EditorSettings()) {
        Rational rate;
        EXPECT_EQ(clip->SetEditRate(settings), NCF_OK);
        clip->GetEditRate(&rate);
        return rate;
    }
    ncfUInt64 LengthOf() {
        ncfUInt64 length = 0;
        EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_OK);
        clip->GetMovieLength(&length);
        return length;
    }
};

}  // namespace

// --- rate -------------------------------------------------------------------------------

TEST_F(QuickTimeClipTiming, SnapsTheMeanRateOfTheMedia) {
    LoadVideo();
    SetMedia(300, 2997, 30000);
    EXPECT_EQ(RateOf(), (Rational{30000, 1001}));
    EXPECT_TRUE(log->once("BaseClip::SetEditRateedit_rate: 30000/1001"));
}

TEST_F(QuickTimeClipTiming, AveragesAVaryingRate) {
    LoadVideo();
    SetMedia(1000, 600, 24000);  // 40 seconds
    EXPECT_EQ(RateOf(), (Rational{25, 1}));
}

// 74.9625 lies on the border between 75 and 75000/1001. A quotient that is
// taken too early falls on the other side.
TEST_F(QuickTimeClipTiming, MultipliesBeforeItDividesForTheRate) {
    LoadVideo();
    SetMedia(1999, 24000, 640000);
    EXPECT_EQ(RateOf(), (Rational{75, 1}));
}

TEST_F(QuickTimeClipTiming, AsksForTheRateInOrder) {
    LoadVideo();
    journal.clear();
    RateOf();
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"parser.GetVideoTrackCount", "video 1.TrackTimeToMediaTime",
                                        "video 1.GetSampleTable", "video 1 table.GetNumSamples",
                                        "video 1.GetMediaDuration", "video 1.GetMediaTS"}));
}

TEST_F(QuickTimeClipTiming, KeepsTheRateOfThePictureWhateverIsForced) {
    LoadVideo();
    SetMedia(250, 1000, 10000);
    EXPECT_EQ(RateOf(Forced(24.0, 50.0)), (Rational{25, 1}));
}

TEST_F(QuickTimeClipTiming, TakesTheEditorsRateForSoundOnly) {
    LoadSound();
    EXPECT_EQ(RateOf(Settings(23.976)), (Rational{24000, 1001}));
    EXPECT_EQ(RateOf(Forced(25.0, 50.0)), (Rational{25, 1}));
}

TEST_F(QuickTimeClipTiming, TakesASlowEditorsRate) {
    LoadSound();
    EXPECT_EQ(RateOf(Settings(1.0)), (Rational{1, 1}));
    EXPECT_EQ(clip->SetEditRate(Settings(0.011)), NCF_OK) << "taken, though it rounds to nothing";
}

TEST_F(QuickTimeClipTiming, NeedsAnEditorsRateForSoundOnly) {
    LoadSound();
    Rational rate;
    EXPECT_EQ(clip->SetEditRate(EditorSettings()), NCF_E_UNEXPECTED);
    EXPECT_TRUE(log->once("QuickTimeClip::SetEditRateImplunknown edit rate!"));
    EXPECT_EQ(clip->GetEditRate(&rate), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(rate, (Rational{1, 1}));

    EditorSettings unasked;
    unasked._editorFrameRate = 25.0;  // not said to be valid
    EXPECT_EQ(clip->SetEditRate(unasked), NCF_E_UNEXPECTED);
    EXPECT_EQ(clip->SetEditRate(Settings(0.01)), NCF_E_UNEXPECTED);
    EXPECT_EQ(clip->SetEditRate(Forced(0.0, 25.0)), NCF_E_UNEXPECTED)
        << "a forced rate alone is none";
}

TEST_F(QuickTimeClipTiming, KeepsTheFormerRateWhenTheEditorGivesNone) {
    LoadSound();
    ASSERT_EQ(RateOf(Settings(25.0)), (Rational{25, 1}));
    EXPECT_EQ(clip->SetEditRate(EditorSettings()), NCF_E_UNEXPECTED);
    Rational rate;
    EXPECT_EQ(clip->GetEditRate(&rate), NCF_OK);
    EXPECT_EQ(rate, (Rational{25, 1}));
}

TEST_F(QuickTimeClipTiming, TakesTheEditorsRateWhenPicturesCannotBeCounted) {
    LoadVideo();
    parser->results["GetVideoTrackCount"] = NCF_E_FAIL;
    EXPECT_EQ(RateOf(Settings(50.0)), (Rational{50, 1}));
}

TEST_F(QuickTimeClipTiming, StopsAtEveryFailureOfTheRate) {
    struct {
        FakeCalls* calls;
        const char* operation;
        const char* expression;
    } steps[5];
    LoadVideo();
    steps[0] = {&Video(), "TrackTimeToMediaTime", "vti->TrackTimeToMediaTime(0, &mediaOffset)"};
    steps[1] = {&Video(), "GetSampleTable", "vti->GetSampleTable(stbl.outArg())"};
    steps[2] = {Video().table, "GetNumSamples", "stbl->GetNumSamples(&numSamples)"};
    steps[3] = {&Video(), "GetMediaDuration", "vti->GetMediaDuration(&mediaDuration)"};
    steps[4] = {&Video(), "GetMediaTS", "vti->GetMediaTS(&mediaTS)"};
    for (const auto& step : steps) {
        step.calls->results[step.operation] = NCF_E_ABORT;
        EXPECT_EQ(clip->SetEditRate(EditorSettings()), NCF_E_ABORT) << step.operation;
        EXPECT_TRUE(
            log->returned("80000007", step.expression, "QuickTimeClip::SetAverageFrameRate"));
        step.calls->results.clear();
    }
    EXPECT_EQ(log->count(ReturnRecord("80000007", "SetAverageFrameRate(editRate_)",
                                      "QuickTimeClip::SetEditRateImpl")),
              5);
}

TEST_F(QuickTimeClipTiming, HasNoRateWhereTheMediaHasNoDuration) {
    LoadVideo();
    SetMedia(300, 600, 0);
    Rational rate;
    EXPECT_EQ(clip->SetEditRate(EditorSettings()), NCF_OK);
    EXPECT_EQ(clip->GetEditRate(&rate), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Console(1, "The frame rate of the movie can't be determined.\n"), 1);
    SetMedia(0, 600, 0);
    EXPECT_EQ(clip->SetEditRate(EditorSettings()), NCF_OK);
    EXPECT_EQ(clip->GetEditRate(&rate), NMA_E_NOTINITIALIZED);
}

TEST_F(QuickTimeClipTiming, HasNoRateBelowHalfAFrameASecond) {
    LoadVideo();
    SetMedia(4, 100, 1000);
    Rational rate;
    EXPECT_EQ(clip->SetEditRate(EditorSettings()), NCF_OK);
    EXPECT_EQ(clip->GetEditRate(&rate), NMA_E_NOTINITIALIZED);
}

// --- length -----------------------------------------------------------------------------

TEST_F(QuickTimeClipTiming, RoundsTheLengthOfAPictureTrack) {
    LoadPictures();
    Video().linear = 0;
    Video().trackDuration = 12345;
    parser->timeScale = 1000;
    EXPECT_EQ(LengthOf(), 309u);
    EXPECT_TRUE(log->once("BaseClip::SetMovieLengthmovie_length[in_video_samples]: 309"));
    EXPECT_TRUE(log->once("QuickTimeClip::SetAVMovieLengthtrack is not linear!"));
}

TEST_F(QuickTimeClipTiming, CutsTheLengthOfSoundOnly) {
    LoadSound();
    RateOf(Settings(25.0));
    parser->duration = 12345;
    parser->timeScale = 1000;
    EXPECT_EQ(LengthOf(), 308u);
}

TEST_F(QuickTimeClipTiming, CountsALinearTrackInItsOwnScale) {
    LoadPictures();
    Video().linear = 1;
    Video().trackTimescale = 600;
    Video().trackDuration = 1200;
    parser->timeScale = 1000;
    journal.clear();
    EXPECT_EQ(LengthOf(), 50u);
    EXPECT_EQ(journal.count("parser.GetTimeScale"), 0);
}

TEST_F(QuickTimeClipTiming, GoesOnWithTheMoviesScaleWhenLinearityCannotBeAsked) {
    LoadPictures();
    Video().results["IsTrackLinear"] = NCF_E_FAIL;
    Video().trackDuration = 2000;
    EXPECT_EQ(LengthOf(), 50u);
    EXPECT_TRUE(log->once("QuickTimeClip::SetAVMovieLengthIsTrackLinear failed: 0x80000008"));
}

TEST_F(QuickTimeClipTiming, WorksTheLengthOutOnce) {
    LoadVideo();
    RateOf();
    const ncfUInt64 first = LengthOf();
    Video().trackDuration *= 2;
    EXPECT_EQ(LengthOf(), first);
}

TEST_F(QuickTimeClipTiming, HasNoLengthWhereNothingPlays) {
    LoadVideo();
    RateOf();
    Video().trackDuration = 0;
    ncfUInt64 length = 9;
    EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_OK);
    EXPECT_EQ(clip->GetMovieLength(&length), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(length, 0u);
    EXPECT_EQ(Console(1, "The length of the movie can't be determined.\n"), 1);
    Video().trackTimescale = 0;  // 0/0
    EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_OK);
    Video().trackDuration = 100;  // infinite
    EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_OK);
    EXPECT_EQ(clip->GetMovieLength(&length), NMA_E_NOTINITIALIZED);
}

TEST_F(QuickTimeClipTiming, HandsFailuresOfTheLengthOn) {
    LoadVideo();
    Video().results["GetTrackDuration"] = NCF_E_ABORT;
    EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007", "vti->GetTrackDuration(&trackDuration)",
                              "QuickTimeClip::SetAVMovieLength"));
    EXPECT_TRUE(
        log->returned("80000007", "SetAVMovieLength()", "QuickTimeClip::SetMovieLengthImpl"));
    EXPECT_TRUE(log->returned("80000007", "SetMovieLengthImpl(editorSettings)",
                              "BaseClip::SetMovieLength"));
    parser->results["GetTimeScale"] = NCF_E_FAIL;
    Video().linear = 0;
    EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_E_FAIL);
    parser->results["GetVideoTrackCount"] = NCF_E_NOTFOUND;
    EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_E_NOTFOUND);
}

TEST_F(QuickTimeClipTiming, HandsFailuresOfTheSoundOnlyLengthOn) {
    LoadSound();
    parser->results["GetMovieDuration"] = NCF_E_ABORT;
    EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007", "SetOnlyAudioMovieLength()",
                              "QuickTimeClip::SetMovieLengthImpl"));
    parser->results["GetTimeScale"] = NCF_E_FAIL;
    EXPECT_EQ(clip->SetMovieLength(EditorSettings()), NCF_E_FAIL);
}

TEST_F(QuickTimeClipTiming, ChecksItsOutputs) {
    LoadVideo();
    EXPECT_EQ(clip->GetEditRate(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetMovieLength(nullptr), NCF_E_POINTER);
    Rational rate{7, 7};
    ncfUInt64 length = 7;
    EXPECT_EQ(clip->GetEditRate(&rate), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(rate, (Rational{1, 1}));
    EXPECT_EQ(clip->GetMovieLength(&length), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(length, 0u);
}

// --- sound in samples ---------------------------------------------------------------------

TEST_F(QuickTimeClipTiming, CountsTheSamplesOfASoundTrack) {
    FakeAudioTrack& track = LoadSound();
    track.trackDuration = 1001;
    parser->timeScale = 30000;
    ncfUInt64 samples = 0;
    EXPECT_EQ(clip->CalculateAudioTrackLengthInSamples(2, &samples), NCF_OK);
    EXPECT_EQ(samples, 1602u);  // 1601.6
    track.mediaTimescale = 44100;
    track.mediaDuration = 44100;
    EXPECT_EQ(clip->CalculateMediaOnTrackLengthInSamples(2, &samples), NCF_OK);
    EXPECT_EQ(samples, 48000u);
    track.mediaDuration = 1000;
    EXPECT_EQ(clip->CalculateMediaOnTrackLengthInSamples(2, &samples), NCF_OK);
    EXPECT_EQ(samples, 1088u);
    track.mediaDuration = 1001;
    EXPECT_EQ(clip->CalculateMediaOnTrackLengthInSamples(2, &samples), NCF_OK);
    EXPECT_EQ(samples, 1090u);  // 1089.5
    EXPECT_EQ(clip->CalculateMediaOnTrackLengthInSamples(99, &samples), NCF_E_NOTFOUND);
    EXPECT_EQ(samples, 0u);
}

TEST_F(QuickTimeClipTiming, ReachesBeyondTheSignedRangeInSamples) {
    FakeAudioTrack& track = LoadSound();
    track.trackDuration = 1u << 31;
    track.description->rate = 4294967296.0;
    parser->timeScale = 1;
    ncfUInt64 samples = 0;
    EXPECT_EQ(clip->CalculateAudioTrackLengthInSamples(2, &samples), NCF_OK);
    EXPECT_EQ(samples, ncfUInt64{1} << 63);
}

TEST_F(QuickTimeClipTiming, CountsNoSamplesWithoutTimeScale) {
    LoadSound();
    parser->timeScale = 0;
    ncfUInt64 samples = 5;
    EXPECT_EQ(clip->CalculateAudioTrackLengthInSamples(2, &samples), NCF_OK);
    EXPECT_EQ(samples, 0u);
}

TEST_F(QuickTimeClipTiming, HandsFailuresOfTheSampleCountOn) {
    FakeAudioTrack& track = LoadSound();
    ncfUInt64 samples = 5;
    EXPECT_EQ(clip->CalculateAudioTrackLengthInSamples(2, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(clip->CalculateMediaOnTrackLengthInSamples(2, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(clip->CalculateAudioTrackLengthInSamples(99, &samples), NCF_E_NOTFOUND);
    EXPECT_EQ(samples, 0u);
    track.results["GetTrackDuration"] = NCF_E_ABORT;
    EXPECT_EQ(clip->CalculateAudioTrackLengthInSamples(2, &samples), NCF_E_ABORT);
    track.results = {{"GetMediaDuration", NCF_E_ABORT}};
    EXPECT_EQ(clip->CalculateMediaOnTrackLengthInSamples(2, &samples), NCF_E_ABORT);
    track.results = {{"GetMediaTS", NCF_E_HANDLE}};
    EXPECT_EQ(clip->CalculateMediaOnTrackLengthInSamples(2, &samples), NCF_E_HANDLE);
    track.results.clear();
    parser->results["GetTimeScale"] = NCF_E_FAIL;
    EXPECT_EQ(clip->CalculateAudioTrackLengthInSamples(2, &samples), NCF_E_FAIL);
    track.descriptionCount = 2;
    EXPECT_EQ(clip->CalculateAudioTrackLengthInSamples(2, &samples), NCF_E_NOTFOUND);
    EXPECT_TRUE(log->returned("8000000c", "GetAudioTrackMetadata(qtTrack, &audioInfo)",
                              "QuickTimeClip::CalculateAudioTrackLengthInSamples"));
}
