// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/OtherClipFixture.h"

namespace {

class OtherClipTiming : public OtherClipTest {
protected:
    static EditorSettings Settings() {
        EditorSettings settings;
        settings._areSettingsValid = 1;
        settings._editorFrameRate = 24.0;
        settings._forcedFrameRateEnabled = 1;
        settings._forcedFrameRate = 30.0;
        settings._singleFrameDuration = 90;
        settings._movieDurationCalculationToUse = EditorSettings::kUseMovieHeader;
        return settings;
    }
    int RateCalls() { return journal.count("wrapper.DetermineMovieEditRateAndLength"); }

    Rational rate;
    ncfUInt64 length = 77;
};

const char kDetermine[] =
    "qtWrapper_->DetermineMovieEditRateAndLength( editorSettings._areSettingsValid && "
    "editorSettings._forcedFrameRateEnabled ? editorSettings._forcedFrameRate : 0.0, "
    "editorSettings._areSettingsValid ? editorSettings._editorFrameRate : 0.0, "
    "editorSettings._areSettingsValid ? editorSettings._singleFrameDuration : 0, "
    "&movieEditRate.numerator, &movieEditRate.denominator, &length_, "
    "trackLengthInFramesArray.get(), TRACKLENGTH_ARRAY_LEN, "
    "editorSettings._movieDurationCalculationToUse == EditorSettings::kUseMovieHeader )";

}  // namespace

TEST_F(OtherClipTiming, SettlesRateAndLengthTogetherAndOnce) {
    LoadUsual();
    EXPECT_EQ(other->GetEditRate(&rate), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(other->GetMovieLength(&length), NMA_E_NOTINITIALIZED);
    wrapper->rate = {30000, 1001};
    EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
    EXPECT_EQ(other->GetMovieLength(&length), NCF_OK);
    EXPECT_EQ(length, 250u);
    EXPECT_EQ(other->SetMovieLength(Settings()), NCF_OK);
    EXPECT_EQ(other->SetMovieLengthImpl(Settings()), NCF_OK);
    wrapper->rate = {50, 1};
    EXPECT_EQ(other->SetEditRate(EditorSettings()), NCF_OK);
    EXPECT_EQ(other->GetEditRate(&rate), NCF_OK);
    EXPECT_EQ(rate, (Rational{30000, 1001}));
    EXPECT_EQ(RateCalls(), 1);
}

TEST_F(OtherClipTiming, SettlesBothAlsoWhenTheLengthIsAskedFirst) {
    LoadUsual();
    EXPECT_EQ(other->SetMovieLength(Settings()), NCF_OK);
    EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
    EXPECT_EQ(other->GetEditRate(&rate), NCF_OK);
    EXPECT_EQ(rate, (Rational{25, 1}));
    EXPECT_EQ(RateCalls(), 1);
}

TEST_F(OtherClipTiming, PassesTheEditorsSettings) {
    LoadUsual();
    EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
    EXPECT_EQ(wrapper->rateArguments, "30.000000 24.000000 90 1");
}

TEST_F(OtherClipTiming, PassesAForcedRateOnlyWhenEnabled) {
    LoadUsual();
    EditorSettings settings = Settings();
    settings._forcedFrameRateEnabled = 0;
    settings._movieDurationCalculationToUse = EditorSettings::kUseTracks;
    EXPECT_EQ(other->SetEditRate(settings), NCF_OK);
    EXPECT_EQ(wrapper->rateArguments, "0.000000 24.000000 90 0");
}

TEST_F(OtherClipTiming, PassesZerosForSettingsThatAreNotValid) {
    LoadUsual();
    EditorSettings settings = Settings();
    settings._areSettingsValid = 0;
    EXPECT_EQ(other->SetEditRate(settings), NCF_OK);
    EXPECT_EQ(wrapper->rateArguments, "0.000000 0.000000 0 1") << "the choice of length stays";
}

TEST_F(OtherClipTiming, GivesRoomForTheLengthOfEachTrack) {
    wrapper->AddPicture(7);
    LoadOther();
    EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
    EXPECT_EQ(wrapper->trackLengths, std::vector<ncfUInt64>(7, 0)) << "zeroed";
}

TEST_F(OtherClipTiming, GivesNoRoomForNoTracks) {
    LoadUsual();
    wrapper->highestTrack = 0;
    EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
    EXPECT_TRUE(wrapper->trackLengths.empty());
}

TEST_F(OtherClipTiming, GivesRoomForNoMoreTracksThanAMovieCanHave) {
    for (const ncfUInt32 highest : {65536u, 0xFFFFFFFFu}) {
        LoadUsual();
        wrapper->highestTrack = highest;
        EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
        ASSERT_EQ(wrapper->trackLengths.size(), 65535u) << highest;
    }
}

TEST_F(OtherClipTiming, RefusesALengthOfZero) {
    LoadUsual();
    wrapper->length = 0;
    EXPECT_EQ(other->SetEditRate(Settings()), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Console(1, "The length of the movie can't be determined.\n"), 1);
    EXPECT_EQ(other->GetEditRate(&rate), NMA_E_NOTINITIALIZED) << "the rate is not taken";
    EXPECT_TRUE(log->returned("a0000068", "SetEditRateAndLengthImpl(editorSettings)",
                              "OtherClip::SetEditRateImpl"));
    EXPECT_EQ(other->SetMovieLength(Settings()), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(log->returned("a0000068", "SetEditRateAndLengthImpl(editorSettings)",
                              "OtherClip::SetMovieLengthImpl"));
    EXPECT_EQ(RateCalls(), 2) << "asked again";
}

TEST_F(OtherClipTiming, HandsTheWrappersFailureOn) {
    LoadUsual();
    wrapper->results["DetermineMovieEditRateAndLength"] = NCF_E_ABORT;
    EXPECT_EQ(other->SetEditRate(Settings()), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007", kDetermine, "OtherClip::SetEditRateAndLengthImpl"));
    EXPECT_EQ(other->GetMovieLength(&length), NMA_E_NOTINITIALIZED);
}

TEST_F(OtherClipTiming, SnapsTheRateThatTheWrapperTells) {
    struct {
        Rational told;
        Rational kept;
    } const kCases[] = {
        {{25, 1}, {25, 1}},
        {{2997, 100}, {30000, 1001}},
        {{50, 2}, {25, 1}},
        {{60000, 1001}, {60000, 1001}},
    };
    for (const auto& expected : kCases) {
        LoadUsual();
        wrapper->rate = expected.told;
        EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
        EXPECT_EQ(other->GetEditRate(&rate), NCF_OK);
        EXPECT_EQ(rate, expected.kept);
    }
}

TEST_F(OtherClipTiming, HasNoRateWhenTheWrapperTellsNone) {
    for (const Rational told : {Rational{0, 0}, Rational{25, 0}, Rational{0, 1}, Rational{-5, 1}}) {
        LoadUsual();
        wrapper->rate = told;
        EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
        EXPECT_EQ(other->GetEditRate(&rate), NMA_E_NOTINITIALIZED);
        EXPECT_EQ(Console(1, "The frame rate of the movie can't be determined.\n"), 1);
    }
}

// --- sound -----------------------------------------------------------------------------

TEST_F(OtherClipTiming, CountsTheSamplesOfASoundTrack) {
    LoadUsual();
    wrapper->trackDuration = 601;
    EXPECT_EQ(other->CalculateAudioTrackLengthInSamples(2, &length), NCF_OK);
    EXPECT_EQ(length, 48080u);
    wrapper->sampleRate = 44100.0;
    wrapper->trackDuration = 1;
    EXPECT_EQ(other->CalculateAudioTrackLengthInSamples(2, &length), NCF_OK);
    EXPECT_EQ(length, 74u) << "73.5 and a half, cut";
    EXPECT_EQ(wrapper->lastTrack, 2u);
}

TEST_F(OtherClipTiming, CountsNoSamplesWithoutATimeScale) {
    LoadUsual();
    wrapper->movieTimeScale = 0;
    for (const ncfUInt64 duration : {ncfUInt64{0}, ncfUInt64{600}}) {
        wrapper->trackDuration = duration;
        length = 77;
        EXPECT_EQ(other->CalculateAudioTrackLengthInSamples(2, &length), NCF_OK);
        EXPECT_EQ(length, 0u) << duration;
    }
}

TEST_F(OtherClipTiming, CountsNoSamplesOfOtherTracks) {
    LoadUsual();
    EXPECT_EQ(other->CalculateAudioTrackLengthInSamples(1, &length), NCF_E_NOTFOUND);
    EXPECT_EQ(length, 0u);
    EXPECT_EQ(LastRecord(), ReturnRecord("8000000c", "GetAudioTrackMetadata(qtTrack, &audioInfo)",
                                         "OtherClip::CalculateAudioTrackLengthInSamples"));
    EXPECT_EQ(other->CalculateAudioTrackLengthInSamples(2, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(trackLength)OtherClip::CalculateAudioTrackLengthInSamples");
}

TEST_F(OtherClipTiming, CutsSoundToThePicture) {
    LoadUsual();
    wrapper->trackDuration = 6300;
    EXPECT_EQ(other->SetEditRate(Settings()), NCF_OK);
    bool enough = false;
    EXPECT_EQ(other->ObtainAudioTrackLength(2, &length, &enough), NCF_OK);
    EXPECT_EQ(length, 480000u);
    EXPECT_TRUE(enough);
}
