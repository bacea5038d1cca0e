// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The rule that decides whether the host reads essence by itself, with the
// retriever's answer given by the test.

#include "source/clips/SampleProviderPolicy.h"

#include "tests/unit/clips/ClipFixture.h"
#include "tests/unit/clips/retriever_double/RetrieverDouble.h"

namespace {

class SampleProviderPolicy : public ClipTest {
protected:
    SampleProviderPolicy() {
        retriever = RetrieverDouble();
        parser->AddVideoTrack(1);
        parser->AddAudioTrack(2);
        Load();
        log->clear();
        host->console().clear();
    }
    FakeAudioTrack& Sound() { return *parser->audioTracks[0]; }
    // A refusal tells its reason twice.
    void ExpectReason(const std::string& function, const std::string& reason) {
        EXPECT_EQ(Console(2, reason), 1) << reason;
        EXPECT_TRUE(log->once(function + reason)) << reason;
    }
    SampleProviderRule Rule() { return SampleProviderRule(TheConsole()); }
    NCFSmartPtr<INCFConsole> TheConsole() { return NCFSmartPtr<INCFConsole>(&host->console()); }

    AAFInfo info;
    ncfUInt64 samples = 5;
};

}  // namespace

// --- picture ----------------------------------------------------------------------------

TEST_F(SampleProviderPolicy, IsNativeWhenTheRetrieverKnowsThePicture) {
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 1);
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    ASSERT_EQ(clip->GetEncodedWidthAndHeight(&width, &height), NCF_OK);
    EXPECT_TRUE(retriever.asked);
    EXPECT_EQ(retriever.width, width);
    EXPECT_EQ(retriever.record, &info);
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(SampleProviderPolicy, ProvidesSilentlyWhatTheRetrieverDoesNotKnow) {
    for (const NCFRESULT result :
         {NCF_E_NOTSUPPORTED, NCF_E_PARAMETERNOTAVAILABLE, NCF_E_FAIL, 1}) {
        retriever.result = result;
        EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 0);
    }
    retriever.exists = false;
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 0);
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(SampleProviderPolicy, ProvidesMoviesWithExternalMediaAtTheFirstCheck) {
    parser->selfContained = 0;
    journal.clear();
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 0);
    ExpectReason("BaseClip::CommonSampleProviderCheck", "The movie is not self contained.");
    EXPECT_EQ(journal.lines().front(), "parser.IsMovieSelfContained");
    EXPECT_FALSE(retriever.asked);
    host->console().clear();
    log->clear();
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 0);
    ExpectReason("BaseClip::CommonSampleProviderCheck", "The movie is not self contained.");
}

TEST_F(SampleProviderPolicy, GoesOnWhenSelfContainmentCannotBeAsked) {
    parser->results["IsMovieSelfContained"] = NCF_E_FAIL;
    EXPECT_EQ(Rule().CommonSampleProviderCheck(clip->IsSelfContained()), 1);
}

TEST_F(SampleProviderPolicy, ProvidesPicturesOfSeveralDescriptions) {
    Video().descriptionCount = 2;
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 0);
    ExpectReason("QuickTimeClip::IsVideoSampleProviderMedia",
                 "The movie contains video track with more than one video image description.");
}

TEST_F(SampleProviderPolicy, ProvidesMoviesOfSeveralPictureTracks) {
    parser->AddVideoTrack(9);
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 0);
    ExpectReason("QuickTimeClip::IsVideoSampleProviderMedia",
                 "The movie contains more than 1 video track.");
}

TEST_F(SampleProviderPolicy, ProvidesPicturesThatShowAlpha) {
    Picture().hasAlpha = 1;
    Load();
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 1) << "alpha is ignored";
    GiveSettings(NCF_OK, 0);
    Load();
    log->clear();
    host->console().clear();
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 0);
    ExpectReason("QuickTimeClip::IsVideoSampleProviderMedia", "The movie contains alpha.");
}

// The first reason that applies is the one that is told, and nothing behind it
// is asked.
TEST_F(SampleProviderPolicy, LooksAtThePictureInOneOrder) {
    GiveSettings(NCF_OK, 0);
    Picture().hasAlpha = 1;
    Load();
    parser->selfContained = 0;
    Video().descriptionCount = 2;
    parser->AddVideoTrack(9);
    const auto refusal = [this] {
        host->console().clear();
        EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), 0);
        EXPECT_EQ(host->console().lines().size(), 1u);
        EXPECT_FALSE(retriever.asked);
        return host->console().lines().at(0).text;
    };
    EXPECT_EQ(refusal(), "The movie is not self contained.");
    parser->selfContained = 1;
    EXPECT_EQ(refusal(),
              "The movie contains video track with more than one video image description.");
    Video().descriptionCount = 1;
    EXPECT_EQ(refusal(), "The movie contains more than 1 video track.");
    parser->videoTracks.back()->Release();
    parser->videoTracks.pop_back();
    EXPECT_EQ(refusal(), "The movie contains alpha.");
}

TEST_F(SampleProviderPolicy, HandsFailuresAboutThePictureOn) {
    Video().results["GetSampleDescriptionCount"] = NCF_E_ABORT;
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007", "vti->GetSampleDescriptionCount(&descCount)",
                              "QuickTimeClip::IsVideoSampleProviderMedia"));
    Video().results.clear();
    parser->results["GetVideoTrackCount"] = NCF_E_FAIL;
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), NCF_E_FAIL);
    EXPECT_TRUE(log->returned("80000008", "qtParser_->GetVideoTrackCount(&trackCount)",
                              "QuickTimeClip::IsVideoSampleProviderMedia"));
}

TEST_F(SampleProviderPolicy, HasNoAnswerAboutThePictureOfASoundOnlyMovie) {
    parser->videoTracks[0]->Release();
    parser->videoTracks.clear();
    Load();
    EXPECT_EQ(clip->IsVideoSampleProviderMedia(&info), NCF_E_POINTER);
    EXPECT_TRUE(log->once("CHK_PTR(vti.inArg())QuickTimeClip::IsVideoSampleProviderMedia"));
}

// --- sound ---------------------------------------------------------------------------------

TEST_F(SampleProviderPolicy, IsNativeForPlainLinearSound) {
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 1);
    Sound().description->bits = 24;
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 1);
    EXPECT_EQ(samples, 5u) << "the number of samples is not written";
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(SampleProviderPolicy, ProvidesCompressedSoundWithoutAReason) {
    Sound().description->lpcm = 0;
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 0);
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(SampleProviderPolicy, ProvidesOtherDepthsOfSound) {
    for (const ncfUInt32 bits : {0u, 8u, 20u, 32u}) {
        Sound().description->bits = bits;
        log->clear();
        host->console().clear();
        EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 0);
        ExpectReason("BaseClip::IsSupportedBitPerChannel",
                     "An audio bit rate of " + std::to_string(bits) +
                         " was found but only bit rates of 16 and 24 are natively supported.");
    }
}

TEST_F(SampleProviderPolicy, ProvidesSoundWithNonTrivialEdits) {
    Sound().proportional = 0;
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 0);
    ExpectReason("QuickTimeClip::IsAudioSampleProviderMedia",
                 "The audio track contains non-trivial edit list(s).");
}

TEST_F(SampleProviderPolicy, AcceptsEditsThatStayInProportion) {
    Sound().linear = 0;
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 1);
}

TEST_F(SampleProviderPolicy, ProvidesSoundOfVaryingSampleSize) {
    Sound().results["HasConstantSampleRate"] = 1;
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 0);
    ExpectReason("QuickTimeClip::IsAudioSampleProviderMedia",
                 "The audio track contains variable sample size.");
}

TEST_F(SampleProviderPolicy, ProvidesSoundThatPlaysAPartOfItsMedia) {
    Sound().trackDuration = 9999;
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 0);
    ExpectReason("QuickTimeClip::IsAudioSampleProviderMedia",
                 "The audio track length doesn't match corresponding media length.");
}

TEST_F(SampleProviderPolicy, LooksAtSoundInOneOrder) {
    parser->selfContained = 0;
    Sound().description->lpcm = 0;
    Sound().description->bits = 32;
    Sound().proportional = 0;
    Sound().results["HasConstantSampleRate"] = 1;
    Sound().trackDuration = 9999;
    const auto refusal = [this] {
        host->console().clear();
        EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), 0);
        EXPECT_LE(host->console().lines().size(), 1u);
        return host->console().lines().empty() ? std::string() : host->console().lines().at(0).text;
    };
    EXPECT_EQ(refusal(), "The movie is not self contained.");
    parser->selfContained = 1;
    EXPECT_EQ(refusal(), "") << "compressed sound has no reason";
    Sound().description->lpcm = 1;
    EXPECT_EQ(refusal(),
              "An audio bit rate of 32 was found but only bit rates of 16 and 24 are natively "
              "supported.");
    Sound().description->bits = 24;
    EXPECT_EQ(refusal(), "The audio track contains non-trivial edit list(s).");
    Sound().proportional = 1;
    EXPECT_EQ(refusal(), "The audio track contains variable sample size.");
    Sound().results.clear();
    EXPECT_EQ(refusal(), "The audio track length doesn't match corresponding media length.");
}

TEST_F(SampleProviderPolicy, HandsFailuresAboutSoundOn) {
    struct {
        FakeCalls* calls;
        const char* operation;
        const char* record;
    } const kSteps[] = {
        {Sound().description, "IsLPCM",
         "IsAudioLPCM(qtTrack, &isLPCM) : BaseClip::IsAudioSampleProviderMedia"},
        {Sound().description, "GetSampleRate",
         "GetAudioTrackMetadata(qtTrack, &audioInfo) : BaseClip::IsAudioSampleProviderMedia"},
        {&Sound(), "IsTrackLinear",
         "ati->IsTrackLinear(&linear, &areMediaAndTrackTimesProportional, NULL, NULL) : "
         "QuickTimeClip::IsAudioSampleProviderMedia"},
        {&Sound(), "HasConstantSampleRate",
         "ati->HasConstantSampleRate(NULL) : QuickTimeClip::IsAudioSampleProviderMedia"},
        {&Sound(), "GetTrackDuration",
         "CalculateAudioTrackLengthInSamples(qtTrack, &trackNumSamples) : "
         "QuickTimeClip::IsAudioSampleProviderMedia"},
        {&Sound(), "GetMediaDuration",
         "CalculateMediaOnTrackLengthInSamples(qtTrack, &mediaNumSamples) : "
         "QuickTimeClip::IsAudioSampleProviderMedia"},
    };
    for (const auto& step : kSteps) {
        step.calls->results[step.operation] = NCF_E_ABORT;
        log->clear();
        EXPECT_EQ(clip->IsAudioSampleProviderMedia(2, &samples), NCF_E_ABORT) << step.operation;
        EXPECT_TRUE(log->once(std::string("NCF_RETURN(0x80000007): ") + step.record))
            << step.operation;
        step.calls->results.clear();
    }
    EXPECT_EQ(clip->IsAudioSampleProviderMedia(99, &samples), NCF_E_NOTFOUND);
    EXPECT_TRUE(log->returned("8000000c",
                              "BaseClip::IsAudioSampleProviderMedia(qtTrack, numAudioSamples)",
                              "QuickTimeClip::IsAudioSampleProviderMedia"));
}

TEST_F(SampleProviderPolicy, KnowsLinearSoundByOneCode) {
    EXPECT_EQ(Rule().IsLPCMAudioByFormatID(0x6C70636D), 1);
    EXPECT_TRUE(host->console().lines().empty());
    EXPECT_EQ(Rule().IsLPCMAudioByFormatID(0x61616320), 0);
    ExpectReason("BaseClip::IsLPCMAudioByFormatID",
                 "The FOURCC audio code of aac  is not natively supported.");
    EXPECT_EQ(Rule().IsLPCMAudioByFormatID(0x25736E25), 0);
    ExpectReason("BaseClip::IsLPCMAudioByFormatID",
                 "The FOURCC audio code of %sn% is not natively supported.");
}

// --- what the description asks ------------------------------------------------------------------

TEST_F(SampleProviderPolicy, TellsTheUserOfAForcedPicture) {
    EXPECT_EQ(MovieRequiresSampleProviderForVideo(TheConsole(), clip, &info), 1);
    EXPECT_TRUE(host->console().lines().empty());
    retriever.result = NCF_E_NOTSUPPORTED;
    EXPECT_EQ(MovieRequiresSampleProviderForVideo(TheConsole(), clip, &info), 0);
    EXPECT_EQ(Console(2, "Forcing sample provider mode for video.\n"), 1);
    EXPECT_TRUE(
        log->once("MovieRequiresSampleProviderForVideoForcing sample provider mode for video!"));
}

TEST_F(SampleProviderPolicy, TellsTheUserOfForcedSound) {
    EXPECT_EQ(MovieRequiresSampleProviderForAudio(TheConsole(), clip, 2, &samples), 1);
    EXPECT_TRUE(host->console().lines().empty());
    Sound().description->lpcm = 0;
    EXPECT_EQ(MovieRequiresSampleProviderForAudio(TheConsole(), clip, 2, &samples), 0);
    EXPECT_EQ(Console(2, "Forcing sample provider mode for audio track 2.\n"), 1);
    EXPECT_TRUE(
        log->once("MovieRequiresSampleProviderForAudioForcing sample provider mode for "
                  "audio track: 2 is enabled!"));
}

TEST_F(SampleProviderPolicy, TellsNothingOfFailures) {
    EXPECT_EQ(MovieRequiresSampleProviderForAudio(TheConsole(), clip, 99, &samples),
              NCF_E_NOTFOUND);
    Video().results["GetSampleDescriptionCount"] = NCF_E_ABORT;
    EXPECT_EQ(MovieRequiresSampleProviderForVideo(TheConsole(), clip, &info), NCF_E_ABORT);
    EXPECT_TRUE(host->console().lines().empty());
}

TEST_F(SampleProviderPolicy, ChecksTheArgumentsOfBothQuestions) {
    std::tr1::shared_ptr<BaseClip> none;
    EXPECT_EQ(MovieRequiresSampleProviderForVideo(nullptr, none, &info), NCF_E_INVALIDARG);
    EXPECT_EQ(log->records().back().text, "CHK_INARG(console)MovieRequiresSampleProviderForVideo");
    EXPECT_EQ(MovieRequiresSampleProviderForVideo(TheConsole(), none, &info), NCF_E_INVALIDARG);
    EXPECT_EQ(log->records().back().text,
              "CHK_INARG(media.get())MovieRequiresSampleProviderForVideo");
    EXPECT_EQ(MovieRequiresSampleProviderForAudio(TheConsole(), none, 2, &samples), NCF_E_POINTER);
    EXPECT_EQ(log->records().back().text,
              "CHK_PTR(media.get())MovieRequiresSampleProviderForAudio");
}
