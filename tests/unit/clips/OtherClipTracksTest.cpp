// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/clips/OtherClipFixture.h"

namespace {

// Pictures 2 and 7, sound 1, 4 and 9, timecode 5; 3, 6 and 8 are of no kind.
class OtherClipTracks : public OtherClipTest {
protected:
    OtherClipTracks() {
        for (const ncfUInt32 track : {2u, 7u}) {
            wrapper->AddPicture(track);
        }
        for (const ncfUInt32 track : {1u, 4u, 9u}) {
            wrapper->AddSound(track);
        }
        wrapper->AddTimecode(5);
        LoadOther();
        Forget();
    }

    ncfUInt32 number = 77;
};

}  // namespace

// --- counting ------------------------------------------------------------------------

TEST_F(OtherClipTracks, CountsEachKindOverAllNumbers) {
    EXPECT_EQ(other->GetVideoTrackCount(&number), NCF_OK);
    EXPECT_EQ(number, 2u);
    EXPECT_EQ(other->GetAudioTrackCount(&number), NCF_OK);
    EXPECT_EQ(number, 3u);
    wrapper->testedTracks.clear();
    EXPECT_EQ(other->GetTimeCodeTrackCount(&number), NCF_OK);
    EXPECT_EQ(number, 1u);
    EXPECT_EQ(wrapper->testedTracks, (std::vector<ncfUInt32>{0, 1, 2, 3, 4, 5, 6, 7, 8, 9}))
        << "the highest number too";
}

TEST_F(OtherClipTracks, CountsTracksByTheHighestNumber) {
    EXPECT_EQ(other->GetTrackCount(&number), NCF_OK);
    EXPECT_EQ(number, 9u);
    EXPECT_EQ(other->GetTrackCount(nullptr), NCF_E_POINTER);
    wrapper->highestTrack = 0;
    number = 77;
    EXPECT_EQ(other->GetTrackCount(&number), NCF_E_NOTFOUND);
    EXPECT_EQ(number, 77u);
    EXPECT_EQ(other->GetTrackCount(nullptr), NCF_E_NOTFOUND) << "tracks are looked for first";
}

// Each walk up to such a number would take for ever.
TEST_F(OtherClipTracks, AsksAboutNoNumberAboveSixteenBits) {
    wrapper->AddSound(65535);
    wrapper->AddSound(65536);
    for (const ncfUInt32 highest : {65536u, 1000000u, 0xFFFFFFFFu}) {
        wrapper->highestTrack = highest;
        wrapper->testedTracks.clear();
        EXPECT_EQ(other->GetAudioTrackCount(&number), NCF_OK);
        ASSERT_EQ(number, 4u) << highest;
        ASSERT_EQ(wrapper->testedTracks.size(), 65536u) << highest;
        EXPECT_EQ(wrapper->testedTracks.back(), 65535u);
        EXPECT_EQ(other->GetVideoTrackCount(&number), NCF_OK);
        EXPECT_EQ(number, 2u);
        EXPECT_EQ(other->GetTimeCodeTrackCount(&number), NCF_OK);
        EXPECT_EQ(number, 1u);
        EXPECT_EQ(other->GetAudioTrackQTId(3, number), NCF_OK);
        EXPECT_EQ(number, 65535u);
        EXPECT_EQ(other->GetAudioTrackQTId(4, number), NCF_E_NOTFOUND);
        EXPECT_EQ(other->GetVideoTrackQTId(2, number), NCF_E_NOTFOUND);
        EXPECT_EQ(other->GetTimecodeTrackQTId(1, number), NCF_E_INVALIDARG);
        EXPECT_EQ(other->GetTrackCount(&number), NCF_OK);
        EXPECT_EQ(number, highest) << "told as it is";
        EXPECT_EQ(other->GetTrackType(highest, &number), NCF_OK);
    }
}

TEST_F(OtherClipTracks, ChecksTheOutputsOfCounts) {
    EXPECT_EQ(other->GetVideoTrackCount(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(trackCount)OtherClip::GetVideoTrackCountImpl");
    EXPECT_EQ(other->GetAudioTrackCount(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(trackCount)OtherClip::GetAudioTrackCountImpl");
    EXPECT_EQ(other->GetTimeCodeTrackCount(nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(trackCount)OtherClip::GetTimeCodeTrackCountImpl");
}

// --- numbers and kinds ------------------------------------------------------------------

TEST_F(OtherClipTracks, FindsTheNumberOfTheNthTrackOfAKind) {
    EXPECT_EQ(other->GetVideoTrackQTId(0, number), NCF_OK);
    EXPECT_EQ(number, 2u);
    EXPECT_EQ(other->GetVideoTrackQTId(1, number), NCF_OK);
    EXPECT_EQ(number, 7u);
    EXPECT_EQ(other->GetAudioTrackQTId(0, number), NCF_OK);
    EXPECT_EQ(number, 1u);
    EXPECT_EQ(other->GetAudioTrackQTId(2, number), NCF_OK);
    EXPECT_EQ(number, 9u) << "the highest number too";
    EXPECT_EQ(other->GetTimecodeTrackQTId(0, number), NCF_OK);
    EXPECT_EQ(number, 5u);
}

TEST_F(OtherClipTracks, FindsNothingPastTheEnd) {
    EXPECT_EQ(other->GetVideoTrackQTId(2, number), NCF_E_NOTFOUND);
    EXPECT_EQ(other->GetAudioTrackQTId(3, number), NCF_E_NOTFOUND);
    EXPECT_EQ(other->GetVideoTrackQTId(0xFFFFFFFF, number), NCF_E_NOTFOUND);
    EXPECT_TRUE(log->records().empty());
    EXPECT_EQ(other->GetTimecodeTrackQTId(1, number), NCF_E_INVALIDARG);
    EXPECT_EQ(number, 77u);
    EXPECT_EQ(LastRecord(), "OtherClip::GetTimecodeTrackQTId- trackNum: 1 , qtTrack: 77");
}

TEST_F(OtherClipTracks, TellsTheKindOfATrack) {
    const ncfUInt32 kinds[] = {3, 1, 0, 3, 1, 2, 3, 0, 3, 1};
    for (ncfUInt32 track = 0; track < 10; ++track) {
        EXPECT_EQ(other->GetTrackType(track, &number), NCF_OK);
        EXPECT_EQ(number, kinds[track]) << track;
    }
    number = 77;
    EXPECT_EQ(other->GetTrackType(10, &number), NCF_E_NOTFOUND);
    EXPECT_EQ(number, 77u);
    EXPECT_EQ(other->GetTrackType(1, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(LastRecord(), "CHK_INARG(trackType)OtherClip::GetTrackType");
}

// --- timecode and sound --------------------------------------------------------------------

TEST_F(OtherClipTracks, FillsTheRecordOfATimecodeTrack) {
    TimeCodeTrackMetadata info;
    EXPECT_EQ(other->GetTimeCodeTrackMetadata(5, &info), NCF_OK);
    EXPECT_EQ(wrapper->lastTrack, 5u);
    EXPECT_EQ(info.hours, 1);
    EXPECT_EQ(info.minutes, 2);
    EXPECT_EQ(info.seconds, 3);
    EXPECT_EQ(info.frames, 4);
    EXPECT_EQ(info.timeScale, 30000u);
    EXPECT_EQ(info.frameDuration, 1001u);
    EXPECT_EQ(info.drop, 1u);
    EXPECT_EQ(info.numFrames, 30u);
}

TEST_F(OtherClipTracks, ClearsTheRecordOfATimecodeTrackBeforehand) {
    TimeCodeTrackMetadata info{9, 9, 9, 9, 9, 9, 9, 9};
    wrapper->results["GetTimeCodeInfoForTrack"] = NCF_E_ABORT;
    EXPECT_EQ(other->GetTimeCodeTrackMetadata(5, &info), NCF_E_ABORT);
    EXPECT_EQ(info.hours + info.minutes + info.seconds + info.frames, 0);
    EXPECT_EQ(info.timeScale + info.frameDuration + info.drop + info.numFrames, 0u);
    EXPECT_EQ(LastRecord().rfind("NCF_RETURN(0x80000007): qtWrapper_->GetTimeCodeInfoForTrack(", 0),
              0u);
    EXPECT_EQ(other->GetTimeCodeTrackMetadata(5, nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(tcInfo)OtherClip::GetTimeCodeTrackMetadata");
}

TEST_F(OtherClipTracks, FillsTheRecordOfASoundTrack) {
    wrapper->soundBits = 24;
    AudioTrackMetadata info;
    EXPECT_EQ(other->GetAudioTrackMetadata(4, &info), NCF_OK);
    EXPECT_EQ(wrapper->lastTrack, 4u);
    EXPECT_EQ(info.channelsPerFrame, 2u);
    EXPECT_EQ(info.sampleRate, 48000.0);
    EXPECT_EQ(info.formatID, kFormatLPCM);
    EXPECT_EQ(info.bytesPerPacket, 4u);
    EXPECT_EQ(info.bitsPerChannel, 24u);
    EXPECT_EQ(info.isBigEndian, 1);
    EXPECT_EQ(info.isConstantBitRate, 1);
}

TEST_F(OtherClipTracks, HandsFailuresAboutSoundOn) {
    AudioTrackMetadata info;
    info.formatID = 9;
    ncfBool flag = 7;
    EXPECT_EQ(other->GetAudioTrackMetadata(2, &info), NCF_E_NOTFOUND);
    EXPECT_EQ(info.formatID, 0u) << "cleared beforehand";
    EXPECT_EQ(LastRecord().rfind("NCF_RETURN(0x8000000c): qtWrapper_->GetAudioInfoForTrack(", 0),
              0u);
    EXPECT_EQ(other->IsAudioLPCM(2, &flag), NCF_E_NOTFOUND);
    EXPECT_EQ(flag, 7);
    EXPECT_EQ(LastRecord(), ReturnRecord("8000000c", "GetAudioTrackMetadata(qtTrack, &audioInfo)",
                                         "OtherClip::IsAudioLPCM"));
    EXPECT_EQ(other->GetAudioTrackMetadata(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(audioInfo)OtherClip::GetAudioTrackMetadata");
    EXPECT_EQ(other->IsAudioLPCM(1, nullptr), NCF_E_POINTER);
    EXPECT_EQ(LastRecord(), "CHK_PTR(isLPCM)OtherClip::IsAudioLPCM");
}

TEST_F(OtherClipTracks, KnowsLinearSoundByTheCodeOfItsFormat) {
    ncfBool flag = 7;
    EXPECT_EQ(other->IsAudioLPCM(1, &flag), NCF_OK);
    EXPECT_EQ(flag, 1);
    EXPECT_TRUE(host->console().lines().empty());
    wrapper->formatID = 0x61616320;
    EXPECT_EQ(other->IsAudioLPCM(1, &flag), NCF_OK);
    EXPECT_EQ(flag, 0);
    EXPECT_EQ(Console(2, "The FOURCC audio code of aac  is not natively supported."), 1);
}
