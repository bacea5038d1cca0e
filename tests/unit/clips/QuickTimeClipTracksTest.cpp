// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Tracks, sound and timecode metadata, sample questions, names.

#include <cmath>

#include "tests/unit/clips/ClipFixture.h"

namespace {

class QuickTimeClipTracks : public ClipTest {
protected:
    // Ids that stand in no order.
    void LoadMany() {
        parser->AddVideoTrack(10);
        parser->AddVideoTrack(3);
        parser->AddAudioTrack(8);
        parser->AddAudioTrack(2);
        parser->AddTimecodeTrack(5);
        parser->AddOtherTrack(4);
        Load();
        ASSERT_TRUE(clip->IsLoaded());
    }
};

class FakeProperty : public FakeObject<QuickTime::IQuickTimeProperty> {
public:
    explicit FakeProperty(Journal* journal) : journal_(journal) {}
    NCFRESULT CreateMovie(INCFString*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCodecPixelFormats(INCFBuffer**, ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCodecName(ncfUInt32 codec, INCFString* name) override {
        journal_->add("property.GetCodecName");
        if (codec == 0) {
            return NCF_E_INVALIDARG;
        }
        return name->AssignUTF8(kNCFUTF8, "A Codec", kNCFZeroTerminated);
    }
    NCFRESULT GetCodecStorageType(ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT DoesCodecSupportRGB_CCIR(ncfUInt32*) override { return NCF_E_NOTIMPL; }

private:
    Journal* journal_;
};

}  // namespace

TEST_F(QuickTimeClipTracks, FindsIdsByPlaceWithinAKind) {
    LoadMany();
    ncfUInt32 id = 0;
    EXPECT_EQ(clip->GetVideoTrackQTId(0, id), NCF_OK);
    EXPECT_EQ(id, 10u);
    EXPECT_EQ(clip->GetVideoTrackQTId(1, id), NCF_OK);
    EXPECT_EQ(id, 3u);
    EXPECT_EQ(clip->GetAudioTrackQTId(0, id), NCF_OK);
    EXPECT_EQ(id, 8u);
    EXPECT_EQ(clip->GetAudioTrackQTId(1, id), NCF_OK);
    EXPECT_EQ(id, 2u);
    EXPECT_EQ(clip->GetTimecodeTrackQTId(0, id), NCF_OK);
    EXPECT_EQ(id, 5u);
}

TEST_F(QuickTimeClipTracks, LosesATrackWhoseIdIsTaken) {
    parser->AddVideoTrack(7);
    parser->AddAudioTrack(7);
    parser->AddAudioTrack(9);
    Load();
    ncfUInt32 id = 0;
    EXPECT_EQ(clip->GetVideoTrackQTId(0, id), NCF_OK);
    EXPECT_EQ(id, 7u);
    EXPECT_EQ(clip->GetAudioTrackQTId(0, id), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetAudioTrackQTId(1, id), NCF_OK);
    EXPECT_EQ(id, 9u);
}

TEST_F(QuickTimeClipTracks, DoesNotFindWhatIsNotThere) {
    LoadMany();
    ncfUInt32 id = 77;
    EXPECT_EQ(clip->GetVideoTrackQTId(2, id), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetAudioTrackQTId(2, id), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetTimecodeTrackQTId(1, id), NCF_E_NOTFOUND);
    EXPECT_EQ(id, 77u);
}

// The ids are 2, 3, 4, 5, 8 and 10; the next one above stands for none of them.
TEST_F(QuickTimeClipTracks, DoesNotTakeANeighbourForAnIdThatItLacks) {
    LoadMany();
    for (const ncfUInt32 id : {0u, 1u, 6u, 7u, 9u, 11u}) {
        ncfUInt32 type = 77;
        NCFSmartPtr<ITrackInfo> any;
        NCFSmartPtr<IAudioTrackInfo> audio;
        NCFSmartPtr<IVideoTrackInfo> video;
        NCFSmartPtr<IQTSampleTable> table;
        EXPECT_EQ(clip->GetTrackType(id, &type), NCF_E_NOTFOUND) << id;
        EXPECT_EQ(type, 77u);
        EXPECT_EQ(clip->GetTrackInfo(id, any.outArg()), NCF_E_NOTFOUND) << id;
        EXPECT_EQ(clip->GetAudioTrack(id, audio.outArg()), NCF_E_NOTFOUND) << id;
        EXPECT_EQ(clip->GetVideoTrack(id, video.outArg()), NCF_E_NOTFOUND) << id;
        EXPECT_EQ(clip->GetSampleTable(id, table.outArg()), NCF_E_NOTFOUND) << id;
    }
}

TEST_F(QuickTimeClipTracks, TellsTheKindOfATrack) {
    LoadMany();
    ncfUInt32 type = 99;
    EXPECT_EQ(clip->GetTrackType(3, &type), NCF_OK);
    EXPECT_EQ(type, 0u);
    EXPECT_EQ(clip->GetTrackType(8, &type), NCF_OK);
    EXPECT_EQ(type, 1u);
    EXPECT_EQ(clip->GetTrackType(5, &type), NCF_OK);
    EXPECT_EQ(type, 2u);
    EXPECT_EQ(clip->GetTrackType(4, &type), NCF_OK);
    EXPECT_EQ(type, 3u);
    EXPECT_EQ(clip->GetTrackType(77, &type), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetTrackType(3, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once("CHK_INARG(trackType)QuickTimeClip::GetTrackType"));
}

TEST_F(QuickTimeClipTracks, CountsItsTracks) {
    LoadMany();
    ncfUInt32 count = 0;
    EXPECT_EQ(clip->GetTrackCount(&count), NCF_OK);
    EXPECT_EQ(count, 6u);
    EXPECT_EQ(clip->GetVideoTrackCount(&count), NCF_OK);
    EXPECT_EQ(count, 2u);
    EXPECT_EQ(clip->GetAudioTrackCount(&count), NCF_OK);
    EXPECT_EQ(count, 2u);
    EXPECT_EQ(clip->GetTimeCodeTrackCount(&count), NCF_OK);
    EXPECT_EQ(count, 1u);
    EXPECT_EQ(clip->GetTrackCount(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetVideoTrackCount(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetAudioTrackCount(nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetTimeCodeTrackCount(nullptr), NCF_E_POINTER);
}

TEST_F(QuickTimeClipTracks, HasNoTracksWhenTheLoadFailed) {
    parser->script = {{NCF_E_FAIL, 0, 0}};
    Load();
    ncfUInt32 count = 5;
    EXPECT_EQ(clip->GetTrackCount(&count), NCF_E_NOTFOUND);
    EXPECT_EQ(count, 5u);
    EXPECT_EQ(clip->GetTrackCount(nullptr), NCF_E_NOTFOUND) << "tracks come before the output";
}

TEST_F(QuickTimeClipTracks, HandsTheParsersCountFailureOnUnlogged) {
    LoadMany();
    log->clear();
    parser->results["GetVideoTrackCount"] = NCF_E_FAIL;
    ncfUInt32 count = 5;
    EXPECT_EQ(clip->GetVideoTrackCount(&count), NCF_E_FAIL);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(QuickTimeClipTracks, HandsOutTracksByTheirKind) {
    LoadMany();
    NCFSmartPtr<ITrackInfo> any;
    NCFSmartPtr<IAudioTrackInfo> audio;
    NCFSmartPtr<IVideoTrackInfo> video;
    EXPECT_EQ(clip->GetTrackInfo(4, any.outArg()), NCF_OK);
    EXPECT_EQ(any.inArg(), parser->otherTracks[0]);
    EXPECT_EQ(clip->GetAudioTrack(8, audio.outArg()), NCF_OK);
    EXPECT_EQ(audio.inArg(), parser->audioTracks[0]);
    EXPECT_EQ(clip->GetVideoTrack(3, video.outArg()), NCF_OK);
    EXPECT_EQ(video.inArg(), parser->videoTracks[1]);

    EXPECT_EQ(clip->GetAudioTrack(3, audio.outArg()), NCF_E_NOINTERFACE);
    EXPECT_TRUE(log->returned(
        "80000004", "trackInfo->QueryInterface(IID_IAudioTrackInfo, (void**)audioTrackInfo)",
        "QuickTimeClip::GetAudioTrack"));
    EXPECT_EQ(clip->GetVideoTrack(8, video.outArg()), NCF_E_NOINTERFACE);
    EXPECT_EQ(clip->GetTrackInfo(99, any.outArg()), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetAudioTrack(99, audio.outArg()), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetTrackInfo(4, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(clip->GetAudioTrack(8, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(clip->GetVideoTrack(3, nullptr), NCF_E_INVALIDARG);
}

TEST_F(QuickTimeClipTracks, NullsTheTrackThatItDoesNotHandOut) {
    LoadMany();
    ITrackInfo* any = parser->otherTracks[0];
    IAudioTrackInfo* audio = parser->audioTracks[0];
    IVideoTrackInfo* video = parser->videoTracks[0];
    IQTSampleTable* table = parser->otherTracks[0]->table;
    EXPECT_EQ(clip->GetTrackInfo(99, &any), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetAudioTrack(99, &audio), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetVideoTrack(99, &video), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->GetSampleTable(99, &table), NCF_E_NOTFOUND);
    EXPECT_EQ(any, nullptr);
    EXPECT_EQ(audio, nullptr);
    EXPECT_EQ(video, nullptr);
    EXPECT_EQ(table, nullptr);
}

TEST_F(QuickTimeClipTracks, KeepsTheFirstTracksOnceAsked) {
    LoadMany();
    journal.clear();
    EXPECT_EQ(clip->GetFirstVideoTrackInfo().inArg(), parser->videoTracks[0]);
    EXPECT_TRUE(journal.lines().empty()) << "found while loading";
    EXPECT_EQ(clip->GetFirstAudioTrackInfo().inArg(), parser->audioTracks[0]);
    EXPECT_EQ(clip->GetFirstAudioTrackInfo().inArg(), parser->audioTracks[0]);
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"parser.GetAudioTrackCount", "parser.GetAudioTrackInfo"}));
}

TEST_F(QuickTimeClipTracks, HasNoFirstTrackWhereThereIsNone) {
    LoadVideo();
    EXPECT_TRUE(clip->GetFirstAudioTrackInfo().isNull());
}

// --- sound ------------------------------------------------------------------------------

TEST_F(QuickTimeClipTracks, ReadsSoundMetadataInOrder) {
    LoadMany();
    FakeAudioDescription& sound = *parser->audioTracks[0]->description;
    sound.channels = 6;
    sound.bits = 24;
    sound.rate = 44100.0;
    sound.bytesPerPacket = 18;
    sound.littleEndian = 0;
    sound.constantBitRate = 7;
    journal.clear();
    AudioTrackMetadata info;
    EXPECT_EQ(clip->GetAudioTrackMetadata(8, &info), NCF_OK);
    EXPECT_EQ(info.channelsPerFrame, 6u);
    EXPECT_EQ(info.sampleRate, 44100.0);
    EXPECT_EQ(info.formatID, 0x6C70636Du);
    EXPECT_EQ(info.bytesPerPacket, 18u);
    EXPECT_EQ(info.bitsPerChannel, 24u);
    EXPECT_EQ(info.isBigEndian, 1);
    EXPECT_EQ(info.isConstantBitRate, 1);
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{
                                   "audio 8.GetSampleDescriptionCount",
                                   "audio 8.GetAudioSampleDescription",
                                   "audio description.GetChannelsPerFrame",
                                   "audio description.GetSampleRate",
                                   "audio description.IsLPCM",
                                   "audio description.GetBytesPerPacket",
                                   "audio description.IsLittleEndian",
                                   "audio description.GetBitsPerChannel",
                                   "audio description.IsConstantBitRate",
                               }));
}

TEST_F(QuickTimeClipTracks, GivesNoFormatForCompressedSound) {
    LoadMany();
    parser->audioTracks[0]->description->lpcm = 0;
    AudioTrackMetadata info;
    EXPECT_EQ(clip->GetAudioTrackMetadata(8, &info), NCF_OK);
    EXPECT_EQ(info.formatID, 0u);
    EXPECT_EQ(info.isBigEndian, 0);
}

TEST_F(QuickTimeClipTracks, ReadsTheOtherSoundValuesWhenOneFails) {
    LoadMany();
    FakeAudioDescription& sound = *parser->audioTracks[0]->description;
    sound.results["GetSampleRate"] = NCF_E_FAIL;
    sound.results["IsLittleEndian"] = NCF_E_NOTSUPPORTED;
    log->clear();
    AudioTrackMetadata info;
    info.channelsPerFrame = 99;
    info.sampleRate = 1.0;
    EXPECT_EQ(clip->GetAudioTrackMetadata(8, &info), NCF_E_NOTSUPPORTED) << "the last failure";
    EXPECT_EQ(info.channelsPerFrame, 2u);
    EXPECT_EQ(info.sampleRate, 0.0) << "cleared first";
    EXPECT_EQ(info.isBigEndian, 1) << "not known to be little-endian";
    EXPECT_EQ(info.bitsPerChannel, 16u);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(QuickTimeClipTracks, AsksForTheDescriptionEvenWhereNoneIsCounted) {
    LoadMany();
    parser->audioTracks[0]->descriptionCount = 0;
    parser->audioTracks[0]->description->littleEndian = 2;  // any flag but 0
    AudioTrackMetadata info;
    EXPECT_EQ(clip->GetAudioTrackMetadata(8, &info), NCF_OK);
    EXPECT_EQ(info.channelsPerFrame, 2u);
    EXPECT_EQ(info.isBigEndian, 0);
}

TEST_F(QuickTimeClipTracks, RefusesSoundOfSeveralDescriptions) {
    LoadMany();
    parser->audioTracks[0]->descriptionCount = 2;
    AudioTrackMetadata info;
    info.channelsPerFrame = 99;
    ncfBool isLPCM = 5;
    EXPECT_EQ(clip->GetAudioTrackMetadata(8, &info), NCF_E_NOTFOUND);
    EXPECT_EQ(info.channelsPerFrame, 0u);
    EXPECT_EQ(clip->IsAudioLPCM(8, &isLPCM), NCF_E_NOTFOUND);
    EXPECT_EQ(isLPCM, 5);
}

TEST_F(QuickTimeClipTracks, HandsFailuresOfTheSoundTrackOn) {
    LoadMany();
    AudioTrackMetadata info;
    ncfBool isLPCM = 0;
    FakeAudioTrack& track = *parser->audioTracks[0];
    EXPECT_EQ(clip->GetAudioTrackMetadata(8, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->IsAudioLPCM(8, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetAudioTrackMetadata(99, &info), NCF_E_NOTFOUND);
    EXPECT_TRUE(log->returned("8000000c", "GetAudioTrack(qtTrack, ati.outArg())",
                              "QuickTimeClip::GetAudioTrackMetadata"));
    track.results["GetSampleDescriptionCount"] = NCF_E_FAIL;
    EXPECT_EQ(clip->GetAudioTrackMetadata(8, &info), NCF_E_FAIL);
    EXPECT_TRUE(log->returned("80000008", "ati->GetSampleDescriptionCount(&count)",
                              "QuickTimeClip::GetAudioTrackMetadata"));
    track.results = {{"GetAudioSampleDescription", NCF_E_ABORT}};
    EXPECT_EQ(clip->IsAudioLPCM(8, &isLPCM), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007", "ati->GetAudioSampleDescription(0, adscr.outArg())",
                              "QuickTimeClip::IsAudioLPCM"));
    track.results.clear();
    track.description->results["IsLPCM"] = NCF_E_ABORT;
    EXPECT_EQ(clip->IsAudioLPCM(8, &isLPCM), NCF_E_ABORT);
    EXPECT_TRUE(log->returned("80000007", "adscr->IsLPCM(isLPCM)", "QuickTimeClip::IsAudioLPCM"));
}

TEST_F(QuickTimeClipTracks, AsksTheDescriptionWhetherSoundIsLinear) {
    LoadMany();
    ncfBool isLPCM = 0;
    EXPECT_EQ(clip->IsAudioLPCM(8, &isLPCM), NCF_OK);
    EXPECT_EQ(isLPCM, 1);
    parser->audioTracks[0]->description->lpcm = 0;
    EXPECT_EQ(clip->IsAudioLPCM(8, &isLPCM), NCF_OK);
    EXPECT_EQ(isLPCM, 0);
}

// --- timecode ------------------------------------------------------------------------------

TEST_F(QuickTimeClipTracks, GivesTheOneTimecodeWhateverTheTrack) {
    LoadMany();
    TimeCodeTrackMetadata tc;
    EXPECT_EQ(clip->GetTimeCodeTrackMetadata(4711, &tc), NCF_OK);
    EXPECT_EQ(tc.hours, 1);
    EXPECT_EQ(tc.minutes, 2);
    EXPECT_EQ(tc.seconds, 3);
    EXPECT_EQ(tc.frames, 4);
    EXPECT_EQ(tc.timeScale, 25u);
    EXPECT_EQ(tc.frameDuration, 1u);
    EXPECT_EQ(tc.drop, 0u);
    EXPECT_EQ(tc.numFrames, 25u);
    EXPECT_EQ(clip->GetTimeCodeTrackMetadata(5, nullptr), NCF_E_POINTER);
    parser->results["GetTimeCodeInfo"] = NCF_E_PARAMETERNOTAVAILABLE;
    EXPECT_EQ(clip->GetTimeCodeTrackMetadata(5, &tc), NCF_E_PARAMETERNOTAVAILABLE);
}

// --- the movie --------------------------------------------------------------------------------

TEST_F(QuickTimeClipTracks, ForwardsTheCreationTime) {
    LoadVideo();
    ncfUInt64 time = 0;
    EXPECT_EQ(clip->GetCreationTime(&time), NCF_OK);
    EXPECT_EQ(time, 3786825600u);
    EXPECT_EQ(clip->GetCreationTime(nullptr), NCF_E_POINTER);
    parser->results["GetCreationTime"] = NCF_E_FAIL;
    EXPECT_EQ(clip->GetCreationTime(&time), NCF_E_FAIL);
    EXPECT_TRUE(log->returned("80000008", "qtParser_->GetCreationTime(creationTime)",
                              "QuickTimeClip::GetCreationTime"));
}

TEST_F(QuickTimeClipTracks, ReturnsTheSelfContainedFlagItself) {
    LoadVideo();
    EXPECT_EQ(clip->IsSelfContained(), 1);
    parser->selfContained = 0;
    EXPECT_EQ(clip->IsSelfContained(), 0);
    parser->results["IsMovieSelfContained"] = NCF_E_FAIL;
    EXPECT_EQ(clip->IsSelfContained(), NCF_E_FAIL);
}

TEST_F(QuickTimeClipTracks, TellsAMovieOfOneFrame) {
    LoadVideo();
    ncfBool one = 9;
    EXPECT_EQ(clip->HasOneFrame(&one), NCF_OK);
    EXPECT_EQ(one, 0);
    for (const ncfUInt64 samples : {0u, 1u}) {
        Video().table->numSamples = samples;
        EXPECT_EQ(clip->HasOneFrame(&one), NCF_OK);
        EXPECT_EQ(one, 1) << samples;
    }
    Video().table->numSamples = 2;
    EXPECT_EQ(clip->HasOneFrame(&one), NCF_OK);
    EXPECT_EQ(one, 0);
    EXPECT_EQ(clip->HasOneFrame(nullptr), NCF_E_POINTER);
    Video().results["GetSampleTable"] = NCF_E_FAIL;
    EXPECT_EQ(clip->HasOneFrame(&one), NCF_E_FAIL);
    Video().results.clear();
    Video().table->results["GetNumSamples"] = NCF_E_ABORT;
    EXPECT_EQ(clip->HasOneFrame(&one), NCF_E_ABORT);
}

TEST_F(QuickTimeClipTracks, TellsAMovieOfSeveralFormats) {
    LoadVideo();
    ncfBool several = 9;
    EXPECT_EQ(clip->IsMultiFormatMovie(&several), NCF_OK);
    EXPECT_EQ(several, 0);
    Video().descriptionCount = 2;
    EXPECT_EQ(clip->IsMultiFormatMovie(&several), NCF_OK);
    EXPECT_EQ(several, 1);
    Video().descriptionCount = 0;
    EXPECT_EQ(clip->IsMultiFormatMovie(&several), NCF_E_NOTFOUND);
    EXPECT_EQ(clip->IsMultiFormatMovie(nullptr), NCF_E_POINTER);
}

TEST_F(QuickTimeClipTracks, KnowsNothingOfThePictureOfASoundOnlyMovie) {
    parser->AddAudioTrack(1);
    Load();
    ncfBool flag = 0;
    ncfUInt32 number = 0;
    EXPECT_EQ(clip->HasOneFrame(&flag), NCF_E_POINTER);
    EXPECT_EQ(clip->IsMultiFormatMovie(&flag), NCF_E_POINTER);
    EXPECT_EQ(clip->GetDataFormat(&number), NCF_E_POINTER);
    EXPECT_EQ(clip->GetVendor(&number), NCF_E_POINTER);
    EXPECT_EQ(clip->GetNivoResolution(&number), NCF_E_POINTER);
    EXPECT_EQ(clip->GetNMAFrameLayout(&number), NCF_E_POINTER);
    EXPECT_EQ(clip->SetFieldLayoutDetails(), NCF_E_POINTER);
    EXPECT_TRUE(log->once("CHK_PTR(vti.inArg())QuickTimeClip::GetDataFormat"));
    EXPECT_EQ(clip->GetImageAspectRatio(&number, &number), NCF_E_POINTER);
    EXPECT_TRUE(log->once("CHK_PTR(vti)QuickTimeClip::GetImageAspectRatioImpl"));
}

// --- samples
// --------------------------------------------------------------------------------------

TEST_F(QuickTimeClipTracks, ForwardsSampleQuestionsToTheTracksTable) {
    LoadMany();
    FakeSampleTable& table = *parser->audioTracks[1]->table;
    ncfUInt64 wide = 0;
    ncfUInt32 narrow = 0;
    ncfSInt64 signedWide = 0;
    ncfBool flag = 0;
    EXPECT_EQ(clip->GetNumSamples(2, &wide), NCF_OK);
    EXPECT_EQ(wide, 300u);
    EXPECT_EQ(clip->GetDataOffset(2, 11, &wide), NCF_OK);
    EXPECT_EQ(wide, 4000u);
    EXPECT_EQ(table.lastArgument, 11u);
    EXPECT_EQ(clip->GetSampleFlags(2, 12, &narrow), NCF_OK);
    EXPECT_EQ(narrow, ncfUInt32{kQTSampleSync});
    EXPECT_EQ(table.lastArgument, 12u);
    EXPECT_EQ(clip->GetNextDiscontiguousDataAttributeChange(2, 13, &wide), NCF_OK);
    EXPECT_EQ(wide, 31u);
    EXPECT_EQ(table.lastArgument, 13u);
    EXPECT_EQ(clip->GetDataSizePerSample(2, 14, &narrow), NCF_OK);
    EXPECT_EQ(narrow, 1234u);
    EXPECT_EQ(table.lastArgument, 14u);
    EXPECT_EQ(clip->GetDisplayOffset(2, 15, &signedWide), NCF_OK);
    EXPECT_EQ(signedWide, -1000);
    EXPECT_EQ(table.lastArgument, 15u);
    EXPECT_EQ(clip->GetDecodeDuration(2, 16, &signedWide), NCF_OK);
    EXPECT_EQ(signedWide, 100);
    EXPECT_EQ(table.lastArgument, 16u);
    EXPECT_EQ(clip->GetMaxDataSizeInBytes(2, &narrow), NCF_OK);
    EXPECT_EQ(narrow, 5678u);
    EXPECT_EQ(clip->GetHasOutOfOrderFrameDependencies(2, &flag), NCF_OK);
    EXPECT_EQ(flag, 1);
    EXPECT_EQ(clip->DisplayTimeToFrameNum(2, 17, &wide), NCF_OK);
    EXPECT_EQ(wide, 7u);
    EXPECT_EQ(table.lastArgument, 17u);
}

TEST_F(QuickTimeClipTracks, ChecksTheOutputOfSampleQuestionsFirst) {
    LoadMany();
    EXPECT_EQ(clip->GetNumSamples(99, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetDataOffset(99, 1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetSampleFlags(99, 1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetNextDiscontiguousDataAttributeChange(99, 1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetDataSizePerSample(99, 1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetDisplayOffset(99, 1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetDecodeDuration(99, 1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetMaxDataSizeInBytes(99, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetHasOutOfOrderFrameDependencies(99, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->DisplayTimeToFrameNum(99, 1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(clip->GetSampleTable(10, nullptr), NCF_E_INVALIDARG);
}

TEST_F(QuickTimeClipTracks, HandsTheTablesAnswerOnUnlogged) {
    LoadMany();
    log->clear();
    parser->audioTracks[1]->table->results["GetDataOffset"] = NCF_E_INVALIDARG;
    ncfUInt64 wide = 5;
    EXPECT_EQ(clip->GetDataOffset(2, 0, &wide), NCF_E_INVALIDARG);
    EXPECT_EQ(wide, 5u);
    auto& results = parser->audioTracks[1]->table->results;
    for (const char* operation :
         {"GetNumSamples", "GetSampleFlags", "GetNextDiscontiguousDataAttributeChange",
          "GetDataSizePerSample", "GetDisplayOffset", "GetDecodeDuration", "GetMaxDataSizeInBytes",
          "GetHasOutOfOrderFrameDependencies", "DisplayTimeToFrameNum"}) {
        results[operation] = NCF_E_ABORT;
    }
    ncfUInt32 narrow = 0;
    ncfSInt64 signedWide = 0;
    ncfBool flag = 0;
    EXPECT_EQ(clip->GetNumSamples(2, &wide), NCF_E_ABORT);
    EXPECT_EQ(clip->GetSampleFlags(2, 1, &narrow), NCF_E_ABORT);
    EXPECT_EQ(clip->GetNextDiscontiguousDataAttributeChange(2, 1, &wide), NCF_E_ABORT);
    EXPECT_EQ(clip->GetDataSizePerSample(2, 1, &narrow), NCF_E_ABORT);
    EXPECT_EQ(clip->GetDisplayOffset(2, 1, &signedWide), NCF_E_ABORT);
    EXPECT_EQ(clip->GetDecodeDuration(2, 1, &signedWide), NCF_E_ABORT);
    EXPECT_EQ(clip->GetMaxDataSizeInBytes(2, &narrow), NCF_E_ABORT);
    EXPECT_EQ(clip->GetHasOutOfOrderFrameDependencies(2, &flag), NCF_E_ABORT);
    EXPECT_EQ(clip->DisplayTimeToFrameNum(2, 1, &wide), NCF_E_ABORT);
    EXPECT_TRUE(log->records().empty());
    EXPECT_EQ(clip->GetDataOffset(99, 1, &wide), NCF_E_NOTFOUND);
    EXPECT_TRUE(log->returned("8000000c", "GetSampleTable(qtTrack, sampleTable.outArg())",
                              "QuickTimeClip::GetDataOffset"));
}

// --- names
// ------------------------------------------------------------------------------------------

TEST_F(QuickTimeClipTracks, NamesRawCodecsByItself) {
    LoadVideo();
    NCFSmartPtr<INCFString> name;
    EXPECT_EQ(clip->GetCodecName(0x57524157, name), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "Windows RAW Codec");
    EXPECT_EQ(clip->GetCodecName(0x72617720, name), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "Apple RAW Codec");
    EXPECT_EQ(name->GetEncoding(), ncfUInt32{kNCFUTF8});
    EXPECT_EQ(host->creations(QuickTime::CompID_QuickTimeProperty), 0);
}

TEST_F(QuickTimeClipTracks, AsksThePropertyComponentForOtherNames) {
    host->maker(QuickTime::CompID_QuickTimeProperty, [this](const GUID& iid, void** out) {
        auto* const property = new FakeProperty(&journal);
        const NCFRESULT result = property->QueryInterface(iid, out);
        property->Release();
        return result;
    });
    LoadVideo();
    NCFSmartPtr<INCFString> name;
    EXPECT_EQ(clip->GetCodecName(0x61766331, name), NCF_OK);
    EXPECT_EQ(TextOf(name.inArg()), "A Codec");
    EXPECT_EQ(clip->GetCodecName(0x61766331, name), NCF_OK);
    EXPECT_EQ(host->creations(QuickTime::CompID_QuickTimeProperty), 1) << "made once";
    EXPECT_EQ(clip->GetCodecName(0, name), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->returned("80000003", "quickTimeProperty->GetCodecName(codecType, codecName)",
                              "QuickTimeClip::GetCodecName"));
}

TEST_F(QuickTimeClipTracks, HandsRefusedServicesOnWithTheirText) {
    LoadVideo();
    NCFSmartPtr<INCFString> name;
    EXPECT_EQ(clip->GetCodecName(0x61766331, name), NCF_CLASS_E_CLASSNOTAVAILABLE);
    EXPECT_TRUE(log->returned("80040111",
                              "(componentFactory_.inArg())->CreateComponent("
                              "QuickTime::CompID_QuickTimeProperty, NULL, "
                              "QuickTime::IID_IQuickTimeProperty, (void**)&qtProperty_)",
                              "BaseClip::GetQuickTimePropertyComponent"));
    host->refuseCreation(NCFCompID_NCFString, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(clip->GetCodecName(0x61766331, name), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(name.isNull());
    EXPECT_TRUE(log->returned("80000002",
                              "(componentFactory_.inArg())->CreateComponent("
                              "NCFCompID_NCFString, 0, IID_PPV_ARG(INCFString, &codecName))",
                              "QuickTimeClip::GetCodecName"));
}
