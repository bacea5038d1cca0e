// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The rule for clips that the wrapper opened, with the retriever's answer
// given by the test.

#include "source/clips/SampleProviderPolicy.h"
#include "tests/unit/clips/OtherClipFixture.h"
#include "tests/unit/clips/retriever_double/RetrieverDouble.h"

namespace {

class OtherClipPolicy : public OtherClipTest {
protected:
    OtherClipPolicy() {
        retriever = RetrieverDouble();
        GiveSettings(NCF_OK, 0);
        LoadUsual();
        other->SetEditRate(EditorSettings());
        Forget();
    }
    // A refusal tells its reason to the log, and a line of its own to the user.
    void ExpectRefusal(const std::string& reason, const std::string& line) {
        EXPECT_TRUE(log->once("OtherClip::IsVideoSampleProviderMedia" + reason)) << reason;
        EXPECT_EQ(Console(2, line), 1) << line;
        EXPECT_EQ(host->console().lines().size(), 1u) << reason;
        EXPECT_FALSE(retriever.asked) << reason;
    }

    AAFInfo info;
    ncfUInt64 samples = 5;
};

const char kIssues[] =
    "qtWrapper_->MovieTrackDurationIssues(editRate_.numerator, editRate_.denominator, length_, "
    "&sound, &picture)";

}  // namespace

// --- picture ----------------------------------------------------------------------------

TEST_F(OtherClipPolicy, IsNativeWhenTheRetrieverKnowsThePicture) {
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 1);
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    ASSERT_EQ(other->GetEncodedWidthAndHeight(&width, &height), NCF_OK);
    EXPECT_TRUE(retriever.asked);
    EXPECT_EQ(retriever.width, width);
    EXPECT_EQ(retriever.record, &info);
    EXPECT_EQ(wrapper->issueArguments, "25/1 250");
    EXPECT_TRUE(host->console().lines().empty());
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{
                  "wrapper.MovieIsSelfContained", "wrapper.MovieHasMultipleVideoTracks",
                  "wrapper.MovieTrackDurationIssues", "wrapper.GetFirstVideoTrack",
                  "wrapper.GetImageDescriptionCount"}));
}

TEST_F(OtherClipPolicy, ProvidesSilentlyWhatTheRetrieverDoesNotKnow) {
    for (const NCFRESULT result :
         {NCF_E_NOTSUPPORTED, NCF_E_PARAMETERNOTAVAILABLE, NCF_E_FAIL, 1}) {
        retriever.result = result;
        EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    }
    retriever.exists = false;
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(OtherClipPolicy, ProvidesMoviesWithExternalMediaAtTheFirstCheck) {
    wrapper->selfContained = 0;
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    EXPECT_TRUE(log->once("BaseClip::CommonSampleProviderCheckThe movie is not self contained."));
    EXPECT_EQ(Console(2, "The movie is not self contained."), 1);
    EXPECT_EQ(journal.count("wrapper.MovieHasMultipleVideoTracks"), 0);
}

TEST_F(OtherClipPolicy, ProvidesMoviesOfSeveralPictureTracks) {
    wrapper->multipleVideo = 1;
    wrapper->pictureIssue = 1;
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    ExpectRefusal("The movie contains more than one video track.",
                  "The movie contains more than 1 video track.\n");
}

TEST_F(OtherClipPolicy, ProvidesPicturesOfAnotherLengthThanTheMovie) {
    wrapper->pictureIssue = 1;
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    ExpectRefusal("MovieTrackDurationIssues found.", "MovieTrackDurationIssues found.\n");
    EXPECT_EQ(journal.count("wrapper.GetFirstVideoTrack"), 0);
}

// The first reason that applies is the one that is told.
TEST_F(OtherClipPolicy, LooksAtLengthThenAlphaThenDescriptions) {
    wrapper->alphaByContainer = 1;
    wrapper->descriptionCount = 2;
    wrapper->pictureIssue = 1;
    LoadOther();
    Forget();
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    ExpectRefusal("MovieTrackDurationIssues found.", "MovieTrackDurationIssues found.\n");
    wrapper->pictureIssue = 0;
    Forget();
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    ExpectRefusal("The movie contains alpha.", "The movie contains alpha.\n");
    EXPECT_EQ(journal.count("wrapper.GetFirstVideoTrack"), 0);
}

TEST_F(OtherClipPolicy, TakesNoOffenceAtTheLengthOfTheSound) {
    wrapper->soundIssue = 1;
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 1);
}

TEST_F(OtherClipPolicy, ProvidesPicturesThatShowAlpha) {
    wrapper->alphaByPicture = 1;
    LoadOther();
    Forget();
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    ExpectRefusal("The movie contains alpha.", "The movie contains alpha.\n");
    GiveSettings(NCF_OK, 1);
    LoadOther();
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 1) << "alpha is ignored";
}

TEST_F(OtherClipPolicy, ProvidesPicturesOfSeveralDescriptions) {
    for (const ncfUInt32 count : {2u, 5u}) {
        wrapper->descriptionCount = count;
        Forget();
        EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
        ExpectRefusal("More than one video ImageDescriptionHandle found",
                      "More than one video ImageDescriptionHandle found.\n");
    }
}

TEST_F(OtherClipPolicy, ProvidesPicturesWithoutADescription) {
    wrapper->descriptionCount = 0;
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), 0);
    ExpectRefusal("Video is missing a ImageDescriptionHandle.",
                  "Video is missing a ImageDescriptionHandle.\n");
}

TEST_F(OtherClipPolicy, HandsFailuresAboutThePictureOn) {
    EXPECT_EQ(other->IsVideoSampleProviderMedia(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(outAAFInfo)OtherClip::IsVideoSampleProviderMedia");
    EXPECT_TRUE(journal.lines().empty());
    wrapper->results["MovieTrackDurationIssues"] = NCF_E_ABORT;
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), NCF_E_ABORT);
    EXPECT_EQ(LastRecord(),
              ReturnRecord("80000007", kIssues, "OtherClip::IsVideoSampleProviderMedia"));
    wrapper->results.clear();
    wrapper->videoTracks.clear();
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), NCF_E_NOTFOUND);
    EXPECT_EQ(LastRecord(), ReturnRecord("8000000c", "GetFirstVideoTrack(track)",
                                         "OtherClip::IsVideoSampleProviderMedia"));
    LoadWithoutWrapper();
    EXPECT_EQ(other->IsVideoSampleProviderMedia(&info), NCF_E_POINTER);
}

// --- sound ---------------------------------------------------------------------------------

TEST_F(OtherClipPolicy, IsNativeForPlainLinearSound) {
    EXPECT_EQ(other->IsAudioSampleProviderMedia(2, &samples), 1);
    EXPECT_EQ(wrapper->issueArguments, "25/1 250");
    wrapper->pictureIssue = 1;
    EXPECT_EQ(other->IsAudioSampleProviderMedia(2, &samples), 1);
    EXPECT_EQ(samples, 5u) << "the number of samples is not written";
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(OtherClipPolicy, ProvidesSoundOfAnotherLengthThanTheMovie) {
    wrapper->soundIssue = 1;
    EXPECT_EQ(other->IsAudioSampleProviderMedia(2, &samples), 0);
    EXPECT_TRUE(log->once("OtherClip::IsAudioSampleProviderMediaMovieTrackDurationIssues found."));
    EXPECT_EQ(Console(2, "MovieTrackDurationIssues found.\n"), 1);
}

TEST_F(OtherClipPolicy, ProvidesSoundThatTheBaseRuleRefuses) {
    wrapper->soundBits = 32;
    EXPECT_EQ(other->IsAudioSampleProviderMedia(2, &samples), 0);
    wrapper->soundBits = 16;
    wrapper->formatID = 0x61616320;
    EXPECT_EQ(other->IsAudioSampleProviderMedia(2, &samples), 0);
    wrapper->formatID = kFormatLPCM;
    wrapper->selfContained = 0;
    EXPECT_EQ(other->IsAudioSampleProviderMedia(2, &samples), 0);
    EXPECT_EQ(journal.count("wrapper.MovieTrackDurationIssues"), 0);
}

TEST_F(OtherClipPolicy, LooksAtSoundInOneOrder) {
    wrapper->selfContained = 0;
    wrapper->formatID = 0x61616320;
    wrapper->soundBits = 32;
    wrapper->soundIssue = 1;
    const auto refusal = [this] {
        Forget();
        EXPECT_EQ(other->IsAudioSampleProviderMedia(2, &samples), 0);
        EXPECT_EQ(host->console().lines().size(), 1u);
        return host->console().lines().at(0).text;
    };
    EXPECT_EQ(refusal(), "The movie is not self contained.");
    wrapper->selfContained = 1;
    EXPECT_EQ(refusal(), "The FOURCC audio code of aac  is not natively supported.");
    wrapper->formatID = kFormatLPCM;
    EXPECT_EQ(refusal(),
              "An audio bit rate of 32 was found but only bit rates of 16 and 24 are natively "
              "supported.");
    wrapper->soundBits = 16;
    EXPECT_EQ(refusal(), "MovieTrackDurationIssues found.\n");
}

TEST_F(OtherClipPolicy, HandsFailuresAboutSoundOn) {
    EXPECT_EQ(other->IsAudioSampleProviderMedia(1, &samples), NCF_E_NOTFOUND);
    EXPECT_EQ(
        LastRecord(),
        ReturnRecord("8000000c", "BaseClip::IsAudioSampleProviderMedia(qtTrack, numAudioSamples)",
                     "OtherClip::IsAudioSampleProviderMedia"));
    wrapper->results["MovieTrackDurationIssues"] = NCF_E_FAIL;
    EXPECT_EQ(other->IsAudioSampleProviderMedia(2, &samples), NCF_E_FAIL);
    EXPECT_EQ(LastRecord(),
              ReturnRecord("80000008", kIssues, "OtherClip::IsAudioSampleProviderMedia"));
}

// --- what the description asks ------------------------------------------------------------------

TEST_F(OtherClipPolicy, TellsTheUserOfAForcedPicture) {
    wrapper->descriptionCount = 2;
    const std::tr1::shared_ptr<BaseClip> media = other;
    EXPECT_EQ(MovieRequiresSampleProviderForVideo(NCFSmartPtr<INCFConsole>(&host->console()), media,
                                                  &info),
              0);
    ASSERT_EQ(host->console().lines().size(), 2u);
    EXPECT_EQ(host->console().lines().back().text, "Forcing sample provider mode for video.\n");
}
