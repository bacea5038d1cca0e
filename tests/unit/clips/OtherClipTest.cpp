// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Loading through the wrapper, and the questions about the whole movie.

#include "tests/unit/clips/OtherClipFixture.h"

namespace {

class LoadOtherClip : public OtherClipTest {};
class OtherClipMovie : public OtherClipTest {};

}  // namespace

// --- loading -------------------------------------------------------------------------

TEST_F(LoadOtherClip, AsksForSizeColourFieldsAndIdentityInThisOrder) {
    wrapper->AddPicture(3);
    EXPECT_TRUE(LoadOther().IsLoaded());
    EXPECT_EQ(wrapper->openedPath, file.path());
    EXPECT_EQ(
        journal.lines(),
        (std::vector<std::string>{
            "create wrapper", "wrapper.NewMovieFromFilePath", "wrapper.GetSampleTable",
            "wrapper.GetFirstVideoTrack", "wrapper.MovieContainsAlpha import",
            "wrapper.MovieContainsAlpha picture", "wrapper.GetMovieBox", "wrapper.QTWSetMovieBox",
            "wrapper.GetCodecColorSpaceInfo",
            "console 4: GetVideoColorSpaceDetails defaulting to RGB.\n",
            "wrapper.QueryVideoDescBufferDetails",
            "console 4: QueryVideoDescBufferDetails says we are full progressive and merged \n",
            "wrapper.GetFirstVideoTrack", "wrapper.GetFourCCFromImageDescrptor",
            "create settings"}));
}

TEST_F(LoadOtherClip, LoadsSoundAloneWithoutAskingForAPicture) {
    wrapper->AddSound(1);
    EXPECT_TRUE(LoadOther().IsLoaded());
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"create wrapper", "wrapper.NewMovieFromFilePath",
                                        "wrapper.GetSampleTable", "wrapper.GetFirstVideoTrack",
                                        "wrapper.MovieHasAudio"}));
    ncfUInt32 colorSpace = 5;
    EXPECT_EQ(other->GetColorSpace(&colorSpace), NMA_E_NOTSET);
    EXPECT_TRUE(host->console().lines().empty());
    EXPECT_TRUE(wrapper->testedTracks.empty());
    EXPECT_TRUE(log->records().empty()) << "nothing of a picture was missed";
}

TEST_F(LoadOtherClip, RefusesAMovieWithoutTracks) {
    EXPECT_FALSE(LoadOther().IsLoaded());
    EXPECT_EQ(Console(1, "Movie doesn't contain any video/audio tracks!\n"), 1);
    EXPECT_EQ(other->LoadClipImpl(), NMA_E_NODATA);
}

TEST_F(LoadOtherClip, FindsAlphaByEitherCheck) {
    wrapper->AddPicture(1);
    GiveSettings(NCF_OK, 0);
    for (const int checks : {0, 1, 2, 3}) {
        wrapper->alphaByContainer = checks & 1;
        wrapper->alphaByPicture = checks >> 1;
        log->clear();
        journal.clear();
        LoadOther();
        EXPECT_EQ(journal.startingWith("wrapper.MovieContainsAlpha"),
                  (std::vector<std::string>{"wrapper.MovieContainsAlpha import",
                                            "wrapper.MovieContainsAlpha picture"}))
            << "both are asked whatever the first one says";
        EXPECT_EQ(other->ShowsAlpha(), checks != 0) << checks;
        EXPECT_EQ(log->count("OtherClip::LoadClipImplMovie has alpha!"), checks != 0) << checks;
    }
}

TEST_F(LoadOtherClip, HidesAlphaUnlessTheHostWantsIt) {
    wrapper->AddPicture(1);
    wrapper->alphaByContainer = 1;
    EXPECT_FALSE(LoadOther().ShowsAlpha());
}

TEST_F(LoadOtherClip, HandsEveryFailureOn) {
    wrapper->AddPicture(1);
    struct {
        const char* operation;
        const char* record;
    } const kSteps[] = {
        {"NewMovieFromFilePath", "GetQuickTimeInterface(qtWrapper)"},
        {"GetSampleTable", "qtWrapper->GetSampleTable(sampleTable_.outArg())"},
        {"MovieContainsAlpha import",
         "qtWrapper->MovieContainsAlpha(QTWrapper::kAlphaCheckForImport, &has_alpha_import)"},
        {"MovieContainsAlpha picture",
         "qtWrapper->MovieContainsAlpha(QTWrapper::kAlphaCheckForQTNMA, &has_alpha_nma)"},
        {"GetMovieBox", "BaseClip::LoadClipBase()"},
        {"QTWSetMovieBox", "BaseClip::LoadClipBase()"},
        {"GetCodecColorSpaceInfo", "BaseClip::LoadClipBase()"},
        {"QueryVideoDescBufferDetails", "BaseClip::LoadClipBase()"},
        {"GetFourCCFromImageDescrptor", "BaseClip::LoadClipBase()"},
    };
    for (const auto& step : kSteps) {
        wrapper->results = {{step.operation, NCF_E_ABORT}};
        log->clear();
        EXPECT_FALSE(LoadOther().IsLoaded()) << step.operation;
        EXPECT_TRUE(log->returned("80000007", step.record, "OtherClip::LoadClipImpl"))
            << step.operation;
    }
    wrapper->results.clear();
    host->refuseCreation(QTWrapper::CompID_QuickTimeWrapper, NCF_E_OUTOFMEMORY);
    EXPECT_FALSE(LoadOther().IsLoaded());
}

TEST_F(LoadOtherClip, ChecksWhatItWasGiven) {
    const NCFSmartPtr<INCFConsole> console(&host->console());
    const NCFSmartPtr<INCFComponentFactory> factory(host->factory());
    other.reset(new OtherClip(HostText(file.path()), nullptr, factory));
    EXPECT_EQ(LastRecord(), "CHK_PTR(console_)OtherClip::LoadClipImpl");
    EXPECT_EQ(other->LoadClipImpl(), NCF_E_POINTER);
    EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(console_)OtherClip::SetFieldLayoutDetails");
    other.reset(new OtherClip(nullptr, console, factory));
    EXPECT_EQ(LastRecord(), "CHK_PTR(fileName_)OtherClip::LoadClipImpl");
    EXPECT_EQ(other->LoadClipImpl(), NCF_E_POINTER);
    other.reset(new OtherClip(HostText(file.path()), console, nullptr));
    EXPECT_FALSE(other->IsLoaded());
    EXPECT_EQ(other->LoadClipImpl(), NCF_E_POINTER);
}

// --- the movie ------------------------------------------------------------------------

TEST_F(OtherClipMovie, StoresWhatTheWrapperSays) {
    LoadUsual();
    wrapper->creationTime = ncfUInt64{3} << 32;
    wrapper->oneFrame = 1;
    ncfUInt64 time = 0;
    ncfBool flag = 0;
    EXPECT_EQ(other->GetCreationTime(&time), NCF_OK);
    EXPECT_EQ(time, ncfUInt64{3} << 32);
    EXPECT_EQ(other->HasOneFrame(&flag), NCF_OK);
    EXPECT_EQ(flag, 1);
    wrapper->oneFrame = 0;
    EXPECT_EQ(other->HasOneFrame(&flag), NCF_OK);
    EXPECT_EQ(flag, 0);
}

TEST_F(OtherClipMovie, LooksAtTheLowByteOfSelfContainment) {
    LoadUsual();
    for (const ncfUInt32 answer : {0u, 0x100u, 0xFFFFFF00u}) {
        wrapper->selfContained = answer;
        EXPECT_EQ(other->IsSelfContained(), 0) << answer;
    }
    for (const ncfUInt32 answer : {1u, 0x80u, 0xFFFFFFFFu}) {
        wrapper->selfContained = answer;
        EXPECT_EQ(other->IsSelfContained(), 1) << answer;
    }
}

TEST_F(OtherClipMovie, IsMultiFormatFromTwoDescriptionsOn) {
    wrapper->AddPicture(4);
    LoadOther();
    for (const ncfUInt32 count : {0u, 1u, 2u, 9u}) {
        wrapper->descriptionCount = count;
        ncfBool flag = 7;
        EXPECT_EQ(other->IsMultiFormatMovie(&flag), NCF_OK);
        EXPECT_EQ(flag, count >= 2) << count;
        EXPECT_EQ(wrapper->lastTrack, 4u);
    }
}

TEST_F(OtherClipMovie, HasNoFormatsWithoutAPicture) {
    wrapper->AddSound(1);
    LoadOther();
    ncfBool flag = 7;
    EXPECT_EQ(other->IsMultiFormatMovie(&flag), NCF_E_NOTFOUND);
    EXPECT_EQ(flag, 7);
    EXPECT_EQ(LastRecord(), ReturnRecord("8000000c", "GetVideoTrackQTId(0, qtTrack)",
                                         "OtherClip::IsMultiFormatMovie"));
}

TEST_F(OtherClipMovie, NamesItsCodec) {
    LoadUsual();
    NCFSmartPtr<INCFString> name;
    EXPECT_EQ(other->GetCodecName(0x61766331, name), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "A Codec");
    EXPECT_EQ(wrapper->lastTrack, 1u);
    EXPECT_EQ(LastRecord(), "OtherClip::GetCodecNamecodecTypeName: A Codec");
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"wrapper.GetFirstVideoTrack", "create string",
                                        "wrapper.GetCodecTypeName"}));
}

TEST_F(OtherClipMovie, NamesRawCodecsByItself) {
    LoadUsual();
    NCFSmartPtr<INCFString> name;
    EXPECT_EQ(other->GetCodecName(0x72617720, name), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "Apple RAW Codec");
    EXPECT_EQ(other->GetCodecName(0x57524157, name), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "Windows RAW Codec");
    EXPECT_EQ(journal.count("wrapper.GetCodecTypeName"), 0);
}

TEST_F(OtherClipMovie, HasNoNameForACodecThatTheWrapperDoesNotName) {
    LoadUsual();
    wrapper->codecName.clear();
    NCFSmartPtr<INCFString> name;
    EXPECT_EQ(other->GetCodecName(0x61766331, name), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(OtherClipMovie, HandsFailuresAboutTheCodecOn) {
    LoadUsual();
    NCFSmartPtr<INCFString> name;
    wrapper->results["GetCodecTypeName"] = NCF_E_ABORT;
    EXPECT_EQ(other->GetCodecName(0x61766331, name), NCF_E_ABORT);
    EXPECT_EQ(LastRecord(),
              ReturnRecord("80000007", "qtWrapper_->GetCodecTypeName( track, codecName)",
                           "OtherClip::GetCodecName"));
    host->refuseCreation(NCFCompID_NCFString, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(other->GetCodecName(0x61766331, name), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(LastRecord(),
              ReturnRecord("80000002",
                           "(componentFactory_.inArg())->CreateComponent(NCFCompID_NCFString, 0, "
                           "IID_PPV_ARG(INCFString, &codecName))",
                           "OtherClip::GetCodecName"));
    wrapper->videoTracks.clear();
    EXPECT_EQ(other->GetCodecName(0x72617720, name), NCF_E_NOTFOUND);
    EXPECT_EQ(LastRecord(),
              ReturnRecord("8000000c", "GetFirstVideoTrack(track)", "OtherClip::GetCodecName"));
}

TEST_F(OtherClipMovie, ChecksItsOutputs) {
    LoadUsual();
    EXPECT_EQ(other->GetCreationTime(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(creationTime)OtherClip::GetCreationTime");
    EXPECT_EQ(other->HasOneFrame(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(isOneFrame)OtherClip::HasOneFrame");
    EXPECT_EQ(other->IsMultiFormatMovie(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(isMultiformat)OtherClip::IsMultiFormatMovie");
}

// A container keeps a clip that failed to load and may still ask it.
TEST_F(OtherClipMovie, AnswersWithoutAWrapper) {
    LoadWithoutWrapper();
    ncfUInt32 number = 7;
    ncfUInt64 large = 7;
    ncfBool flag = 7;
    Rational rate;
    TimeCodeTrackMetadata timecode;
    AudioTrackMetadata sound;
    NCFSmartPtr<INCFString> name;
    EXPECT_EQ(other->GetCreationTime(&large), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(qtWrapper_)OtherClip::GetCreationTime");
    EXPECT_EQ(other->IsSelfContained(), NCF_E_POINTER);
    EXPECT_EQ(other->HasOneFrame(&flag), NCF_E_POINTER);
    EXPECT_EQ(other->IsMultiFormatMovie(&flag), NCF_E_POINTER);
    EXPECT_EQ(other->GetCodecName(1, name), NCF_E_POINTER);
    EXPECT_EQ(other->SetFieldLayoutDetails(), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(qtWrapper_)OtherClip::SetFieldLayoutDetails");
    EXPECT_EQ(other->GetNMAFrameLayout(&number), NCF_E_POINTER);
    EXPECT_EQ(other->GetDataFormat(&number), NCF_E_POINTER);
    EXPECT_EQ(other->GetVendor(&number), NCF_E_POINTER);
    EXPECT_EQ(other->GetNivoResolution(&number), NCF_E_POINTER);
    EXPECT_EQ(other->GetTrackCount(&number), NCF_E_POINTER);
    EXPECT_EQ(other->GetVideoTrackQTId(0, number), NCF_E_POINTER);
    EXPECT_EQ(other->GetAudioTrackQTId(0, number), NCF_E_POINTER);
    EXPECT_EQ(other->GetTimecodeTrackQTId(0, number), NCF_E_POINTER);
    EXPECT_EQ(other->GetTrackType(0, &number), NCF_E_POINTER);
    EXPECT_EQ(other->GetTimeCodeTrackMetadata(1, &timecode), NCF_E_POINTER);
    EXPECT_EQ(other->GetAudioTrackMetadata(1, &sound), NCF_E_POINTER);
    EXPECT_EQ(other->IsAudioLPCM(1, &flag), NCF_E_POINTER);
    EXPECT_EQ(other->GetVideoTrackCount(&number), NCF_E_POINTER);
    EXPECT_EQ(other->GetAudioTrackCount(&number), NCF_E_POINTER);
    EXPECT_EQ(other->GetTimeCodeTrackCount(&number), NCF_E_POINTER);
    EXPECT_EQ(other->GetEncodedWidthAndHeight(&number, &number), NCF_E_POINTER);
    EXPECT_EQ(other->GetImageAspectRatio(&number, &number), NCF_E_POINTER);
    EXPECT_EQ(other->SetColorSpaceImpl(), NCF_E_POINTER);
    EXPECT_EQ(other->SetEditRate(EditorSettings()), NCF_E_POINTER);
    EXPECT_EQ(other->SetMovieLength(EditorSettings()), NCF_E_POINTER);
    EXPECT_EQ(other->GetEditRate(&rate), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(other->GetMovieLength(&large), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(other->GetNumSamples(1, &large), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(sampleTable_)OtherClip::GetNumSamples");
    EXPECT_EQ(other->CalculateAudioTrackLengthInSamples(1, &large), NCF_E_POINTER);
    ByteVector content;
    EXPECT_EQ(other->GetContentForHash(content), NCF_E_OUTOFMEMORY);
}
