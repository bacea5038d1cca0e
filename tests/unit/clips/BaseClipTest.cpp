// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What is common to both kinds of clip, seen through the one that reads headers:
// services made on first use, sound beside picture, names.

#include "source/clips/NativeCodecs.h"
#include "tests/support/fakes/StubClip.h"
#include "tests/unit/clips/ClipFixture.h"
#include "tests/unit/clips/FakeWrapper.h"

namespace {

class BaseClipServices : public ClipTest {
protected:
    BaseClipServices() {
        wrapper = new FakeWrapper(&journal);
        host->maker(QTWrapper::CompID_QuickTimeWrapper, [this](const GUID& iid, void** out) {
            return wrapper->QueryInterface(iid, out);
        });
        LoadVideo();
        journal.clear();
    }
    ~BaseClipServices() override { wrapper->Release(); }

    FakeWrapper* wrapper;
};

// A picture of 10 seconds at 25 frames a second beside sound of 48 kHz.
class BaseClipSound : public ClipTest {
protected:
    BaseClipSound() {
        parser->AddVideoTrack(1);
        parser->AddAudioTrack(2);
        Video().table->numSamples = 250;
        Video().mediaTimescale = 25;
        Video().mediaDuration = 250;
        Video().trackTimescale = 1000;
        Video().trackDuration = 10000;
        LoadWithTiming();
    }
    FakeAudioTrack& Sound() { return *parser->audioTracks[0]; }
    void LoadWithTiming() {
        Load();
        clip->SetEditRate(EditorSettings());
        clip->SetMovieLength(EditorSettings());
    }
    ncfUInt64 Length(bool* enough = nullptr) {
        ncfUInt64 samples = 0;
        EXPECT_EQ(clip->ObtainAudioTrackLength(2, &samples, enough), NCF_OK);
        return samples;
    }
};

}  // namespace

// --- services ---------------------------------------------------------------------------

TEST_F(BaseClipServices, OpensTheWrapperOnFirstUse) {
    EXPECT_EQ(host->creations(QTWrapper::CompID_QuickTimeWrapper), 0);
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> first;
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> second;
    EXPECT_EQ(clip->GetQuickTimeInterface(first), NCF_OK);
    EXPECT_EQ(clip->GetQuickTimeInterface(second), NCF_OK);
    EXPECT_EQ(first, second);
    EXPECT_EQ(wrapper->openedPath, file.path());
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"create wrapper", "wrapper.NewMovieFromFilePath"}));
}

TEST_F(BaseClipServices, KeepsAWrapperWhoseMovieFailedToOpen) {
    wrapper->results["NewMovieFromFilePath"] = NCF_E_FAIL;
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> out;
    EXPECT_EQ(clip->GetQuickTimeInterface(out), NCF_E_FAIL);
    EXPECT_TRUE(out.isNull());
    EXPECT_TRUE(log->returned("80000008", "qtWrapper_->NewMovieFromFilePath(fileName_)",
                              "BaseClip::GetQuickTimeInterface"));
    EXPECT_EQ(clip->GetQuickTimeInterface(out), NCF_OK);
    EXPECT_FALSE(out.isNull());
    EXPECT_EQ(journal.count("wrapper.NewMovieFromFilePath"), 1);
}

TEST_F(BaseClipServices, HandsARefusedWrapperOn) {
    host->refuseCreation(QTWrapper::CompID_QuickTimeWrapper, NCF_E_OUTOFMEMORY, 1);
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> out;
    EXPECT_EQ(clip->GetQuickTimeInterface(out), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(log->returned("80000002",
                              "componentFactory_->CreateComponent("
                              "QTWrapper::CompID_QuickTimeWrapper, NULL, "
                              "QTWrapper::IID_IQuickTimeWrapper, (void **)&qtWrapper_)",
                              "BaseClip::GetQuickTimeInterface"));
    EXPECT_EQ(clip->GetQuickTimeInterface(out), NCF_OK) << "asked again";
}

TEST_F(BaseClipServices, MakesEachReaderOnce) {
    NCFSmartPtr<QTWrapper::IQTVideoReader> video;
    NCFSmartPtr<QTWrapper::IQTVideoReader> sameVideo;
    NCFSmartPtr<QTWrapper::IQTAudioReader> audio;
    NCFSmartPtr<QTWrapper::IQTAudioReader> sameAudio;
    EXPECT_EQ(clip->GetQuickTimeVideoReader(video), NCF_OK);
    EXPECT_EQ(clip->GetQuickTimeVideoReader(sameVideo), NCF_OK);
    EXPECT_EQ(clip->GetQuickTimeAudioReader(audio), NCF_OK);
    EXPECT_EQ(clip->GetQuickTimeAudioReader(sameAudio), NCF_OK);
    EXPECT_EQ(video, sameVideo);
    EXPECT_EQ(audio, sameAudio);
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"create wrapper", "wrapper.NewMovieFromFilePath",
                                        "wrapper.GetQTVideoReader", "wrapper.GetQTAudioReader"}));
}

TEST_F(BaseClipServices, HandsRefusedReadersOn) {
    wrapper->results["GetQTVideoReader"] = NCF_E_ABORT;
    wrapper->results["GetQTAudioReader"] = NCF_E_FAIL;
    NCFSmartPtr<QTWrapper::IQTVideoReader> video;
    NCFSmartPtr<QTWrapper::IQTAudioReader> audio;
    EXPECT_EQ(clip->GetQuickTimeVideoReader(video), NCF_E_ABORT);
    EXPECT_EQ(clip->GetQuickTimeAudioReader(audio), NCF_E_FAIL);
    EXPECT_TRUE(log->returned("80000007", "qtWrapper->GetQTVideoReader(qtAPIVideoReader_)",
                              "BaseClip::GetQuickTimeVideoReader"));
    EXPECT_TRUE(log->returned("80000008", "qtWrapper->GetQTAudioReader(qtAPIAudioReader_)",
                              "BaseClip::GetQuickTimeAudioReader"));
    host->refuseCreation(QTWrapper::CompID_QuickTimeWrapper, NCF_E_OUTOFMEMORY);
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> out;
    EXPECT_EQ(clip->GetQuickTimeInterface(out), NCF_OK) << "made already";
}

TEST_F(BaseClipServices, HandsOutItsPath) {
    EXPECT_EQ(TextOf(clip->GetFileName().inArg()), file.path());
}

TEST(BaseClip, KnowsTwoRawCodecsByTheirExactCode) {
    EXPECT_TRUE(IsNativeQuickTimeCodec(0x57524157));   // 'WRAW'
    EXPECT_TRUE(IsNativeQuickTimeCodec(0x72617720));   // 'raw '
    EXPECT_FALSE(IsNativeQuickTimeCodec(0x52415720));  // 'RAW '
    EXPECT_FALSE(IsNativeQuickTimeCodec(0));
}

TEST(BaseClip, NamesOtherCodecsUnknown) {
    NCFSmartPtr<INCFString> name = HostText("");
    EXPECT_EQ(GetNativeQuickTimeCodecName(0x61766331, name), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "Unknown Codec");
}

// --- sound beside the picture ----------------------------------------------------------------

TEST_F(BaseClipSound, GivesThePicturesFigureWhenBothAreEquallyLong) {
    bool enough = false;
    EXPECT_EQ(Length(&enough), 480000u);
    EXPECT_TRUE(enough);
    EXPECT_TRUE(
        log->once("BaseClip::ObtainAudioTrackLengthaudioSamplesInVideoTS: 480000; "
                  "audioSamplesInAudioTrackTS: 480000"));
}

TEST_F(BaseClipSound, CutsSoundToThePicture) {
    Sound().trackDuration = 10500;
    bool enough = false;
    EXPECT_EQ(Length(&enough), 480000u);
    EXPECT_TRUE(enough);
}

TEST_F(BaseClipSound, RoundsThePicturesFigure) {
    Video().table->numSamples = 2;
    Video().mediaTimescale = 30000;
    Video().mediaDuration = 2002;
    Video().trackDuration = 67;
    Sound().description->rate = 44100.0;
    LoadWithTiming();
    EXPECT_EQ(Length(), 2943u);  // 2942.94
}

// 440 pictures last 809308.5 samples, but the samples of one picture are
// rounded first.
TEST_F(BaseClipSound, TakesTheSamplesOfOnePictureFirst) {
    Video().table->numSamples = 440;
    Video().mediaTimescale = 24000;
    Video().mediaDuration = 440 * 1001;
    Video().trackTimescale = 24000;
    Video().trackDuration = 440 * 1001;
    Sound().description->rate = 44100.0;
    Sound().trackDuration = 20000;
    LoadWithTiming();
    EXPECT_EQ(Length(), 809308u);
}

TEST_F(BaseClipSound, KeepsShortSoundAsItIs) {
    Sound().trackDuration = 9000;
    bool enough = true;
    EXPECT_EQ(Length(&enough), 432000u);
    EXPECT_FALSE(enough);
    EXPECT_TRUE(
        log->once("BaseClip::ObtainAudioTrackLengthNot enough audio, "
                  "audioSamplesInVideoTS(480000) > audioSamplesInAudioTrackTS(432000)"));
    EXPECT_EQ(Length(), 432000u) << "without the flag";
}

TEST_F(BaseClipSound, HandsItsFailuresOn) {
    ncfUInt64 samples = 5;
    EXPECT_EQ(clip->ObtainAudioTrackLength(2, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(clip->ObtainAudioTrackLength(9, &samples), NCF_E_NOTFOUND);
    EXPECT_EQ(samples, 0u);
    EXPECT_TRUE(log->returned("8000000c", "GetAudioTrackMetadata(qtTrack, &audioInfo)",
                              "BaseClip::ObtainAudioTrackLength"));
    Sound().results["GetTrackDuration"] = NCF_E_ABORT;
    EXPECT_EQ(clip->ObtainAudioTrackLength(2, &samples), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007",
                              "CalculateAudioTrackLengthInSamples(qtTrack, "
                              "&audioSamplesInAudioTrackTS)",
                              "BaseClip::ObtainAudioTrackLength"));
    Sound().results.clear();
    Load();  // a clip that was not asked for rate and length
    EXPECT_EQ(clip->ObtainAudioTrackLength(2, &samples), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(log->returned("a0000068", "GetEditRate(&avgMovieEditRate)",
                              "BaseClip::ObtainAudioTrackLength"));
    clip->SetEditRate(EditorSettings());
    EXPECT_EQ(clip->ObtainAudioTrackLength(2, &samples), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(log->returned("a0000068", "GetMovieLength(&numVideoSamples)",
                              "BaseClip::ObtainAudioTrackLength"));
}

// --- size and ratio ---------------------------------------------------------------------

namespace {

// Finds neither size nor ratio and doesn't say so.
class SizelessClip : public StubClip {
    NCFRESULT GetEncodedWidthAndHeightImpl(ncfUInt32*, ncfUInt32*) override { return NCF_OK; }
    NCFRESULT GetImageAspectRatioImpl(ncfUInt32*, ncfUInt32*) override { return NCF_OK; }
};

}  // namespace

TEST(BaseClip, TellsAMissingSizeFromAMissingRatio) {
    FakeHost host;
    const RecordingLog log(host);
    SizelessClip clip;
    ncfUInt32 a = 7;
    ncfUInt32 b = 7;
    EXPECT_EQ(clip.GetEncodedWidthAndHeight(&a, &b), NCF_E_FAIL);
    EXPECT_TRUE(log.once("NCFASSERT( width_ && height_ )BaseClip::GetEncodedWidthAndHeight"));
    const std::size_t before = log.records().size();
    EXPECT_EQ(clip.GetImageAspectRatio(&a, &b), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(log.records().size(), before + 1) << "no more than the ratio that was found";
    EXPECT_EQ(log.records().back().text, "BaseClip::GetImageAspectRatioimage_aspect_ratio: 0/0");
    EXPECT_EQ(a, 7u);
    EXPECT_EQ(b, 7u);
}
