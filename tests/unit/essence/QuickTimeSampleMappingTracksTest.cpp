// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/TrackMap.h"
#include "tests/unit/essence/support/MappingFixture.h"

namespace {

class SampleMappingTracks : public MappingFixture {
protected:
    std::vector<ncfUInt32> Types() {
        std::vector<ncfUInt32> types;
        for (const auto& track : mapping->mediaTracks_) {
            types.push_back(track->GetTrackType());
        }
        return types;
    }
    std::vector<ncfUInt32> Map() {
        ncfUInt32 first = 0;
        EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(0, &first), NCF_OK);
        return mapping->_trackRemapVect;
    }
    using Numbers = std::vector<ncfUInt32>;
};

TEST_F(SampleMappingTracks, PictureComesFirstThenSound) {
    AddVideo(1);
    AddAudio(5);
    AddAudio(3);
    Bind();
    EXPECT_EQ(Types(), (Numbers{MediaTrack::kVideo, MediaTrack::kAudio, MediaTrack::kAudio}));
    EXPECT_EQ(Map(), (Numbers{1, 5, 3}));
    EXPECT_FALSE(log->contains("videoTrackCount > 1"));
}

TEST_F(SampleMappingTracks, AlphaStandsBehindItsPictureAndReadsFromTheSameTrack) {
    AddVideo(4);
    AddAudio(2);
    clip->setAlpha(true);
    Bind();
    EXPECT_EQ(Types(), (Numbers{MediaTrack::kVideo, MediaTrack::kVideoAlpha, MediaTrack::kAudio}));
    EXPECT_EQ(Map(), (Numbers{4, 4, 2}));
}

TEST_F(SampleMappingTracks, IgnoredAlphaHasNoTrack) {
    AddVideo(4);
    clip->setAlpha(true);
    clip->setIgnoreAlpha(true);
    Bind();
    EXPECT_EQ(Types(), (Numbers{MediaTrack::kVideo}));
    EXPECT_EQ(Map(), (Numbers{4}));
}

TEST_F(SampleMappingTracks, SecondPictureTrackHasNoEntryInTheMap) {
    AddVideo(1);
    AddVideo(2);
    Bind();
    EXPECT_EQ(Types(), (Numbers{MediaTrack::kVideo, MediaTrack::kVideo}));
    EXPECT_TRUE(log->contains("videoTrackCount > 1"));
    EXPECT_EQ(Map(), (Numbers{1}));
    std::tr1::shared_ptr<MediaTrack> track;
    EXPECT_EQ(mapping->GetMediaTrack(1, track), NCF_OK);
    ncfUInt32 out = 77;
    EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(1, &out), NCF_E_FAIL);
    EXPECT_EQ(out, 77u);
    EXPECT_EQ(Console(2,
                      "QuickTimeSampleMapping::AAFTrackToQuickTimeTrack: Index into vector is "
                      "larger than vector size.\n"),
              1);
}

TEST_F(SampleMappingTracks, NumberingsPartWaysAboveTheFirstPictureTrack) {
    AddVideo(1);
    AddVideo(2);
    AddAudio(3);
    Bind();
    EXPECT_EQ(Types(), (Numbers{MediaTrack::kVideo, MediaTrack::kVideo, MediaTrack::kAudio}));
    EXPECT_EQ(Map(), (Numbers{1, 3})) << "picture 1 of the host is the sound of the movie";
}

TEST_F(SampleMappingTracks, SoundAloneStartsAtZero) {
    AddAudio(6);
    Bind();
    EXPECT_EQ(Map(), (Numbers{6}));
    EXPECT_EQ(journal.count("clip.GetVideoTrackQTId"), 0);
}

TEST_F(SampleMappingTracks, MapIsMadeOnce) {
    AddVideo(1);
    Bind();
    Map();
    journal.clear();
    Map();
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(SampleMappingTracks, MapOfAClipWithoutTracksIsTriedAtEachCall) {
    Bind();
    ncfUInt32 out = 0;
    EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(0, &out), NCF_E_FAIL);
    EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(0, &out), NCF_E_FAIL);
    EXPECT_EQ(journal.count("clip.GetVideoTrackCount"), 2);
}

TEST_F(SampleMappingTracks, TranslationNeedsAnOutputThenAClip) {
    EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(0, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(trackQTOut)", "AAFTrackToQuickTimeTrack")));
    ncfUInt32 out = 0;
    EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(0, &out), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(media_)", "AAFTrackToQuickTimeTrack")));
}

TEST_F(SampleMappingTracks, LargestTrackNumberIsPastTheEndToo) {
    AddVideo(1);
    Bind();
    ncfUInt32 out = 0;
    EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(0xFFFFFFFF, &out), NCF_E_FAIL);
}

TEST_F(SampleMappingTracks, TrackIdZeroIsInvalid) {
    AddVideo(0);
    Bind();
    ncfUInt32 out = 77;
    EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(0, &out), NCF_E_FAIL);
    EXPECT_EQ(out, 77u);
    EXPECT_EQ(Console(2,
                      "QuickTimeSampleMapping::AAFTrackToQuickTimeTrack: 0, an invalid QuickTime "
                      "track value, was returned.\n"),
              1);
}

TEST_F(SampleMappingTracks, FailureToMapIsTheClipsAndLeavesWhatWasFound) {
    AddVideo(1);
    AddAudio(2);
    const std::pair<const char*, const char*> calls[] = {
        {"GetVideoTrackCount", "media->GetVideoTrackCount(&videoTrackCount)"},
        {"GetVideoTrackQTId", "media->GetVideoTrackQTId(track, qtTrack)"},
        {"GetAudioTrackCount", "media->GetAudioTrackCount(&audioTrackCount)"},
        {"GetAudioTrackQTId", "media->GetAudioTrackQTId(track, qtTrack)"},
    };
    const std::size_t left[] = {0, 0, 1, 1};
    for (std::size_t i = 0; i < 4; ++i) {
        clip->results = {{calls[i].first, NCF_E_ABORT}};
        std::vector<ncfUInt32> map = {9, 9, 9};
        log->clear();
        EXPECT_EQ(RemapAAFTracksToQuickTimeTracks(clip, map), NCF_E_ABORT);
        EXPECT_EQ(map.size(), left[i]);
        EXPECT_TRUE(log->once(std::string("NCF_RETURN(0x80000007): ") + calls[i].second +
                              " : RemapAAFTracksToQuickTimeTracks"));
    }
    Bind();
    clip->results = {{"GetVideoTrackQTId", NCF_E_HANDLE}};
    ncfUInt32 out = 0;
    EXPECT_EQ(mapping->AAFTrackToQuickTimeTrack(0, &out), NCF_E_HANDLE);
    EXPECT_TRUE(
        log->once(Record("80000006", "RemapAAFTracksToQuickTimeTracks(media_, _trackRemapVect)",
                         "AAFTrackToQuickTimeTrack")));
}

TEST_F(SampleMappingTracks, TrackPastTheEndIsSilentlyInvalid) {
    AddVideo(1);
    Bind();
    std::tr1::shared_ptr<MediaTrack> track;
    EXPECT_EQ(mapping->GetMediaTrack(1, track), NCF_E_INVALIDARG);
    EXPECT_EQ(mapping->GetMediaTrack(0xFFFFFFFF, track), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(SampleMappingTracks, EmptySlotIsAsserted) {
    mapping->mediaTracks_.resize(1);
    std::tr1::shared_ptr<MediaTrack> track;
    EXPECT_EQ(mapping->GetMediaTrack(0, track), NCF_E_FAIL);
    EXPECT_TRUE(log->once(Check("NCFASSERT( mediaTrack.get() )", "GetMediaTrack")));
    EXPECT_EQ(mapping->FirstTrackOf(MediaTrack::kVideo), nullptr);
}

TEST_F(SampleMappingTracks, SoundHasTwoFormatsLittleEndianFirst) {
    AddAudio(1);
    Bind();
    const auto& formats = mapping->mediaTracks_.at(0)->GetFormats();
    ASSERT_EQ(formats.size(), 2u);
    EXPECT_TRUE(dynamic_cast<const QTAudioFormat&>(*formats[0]) ==
                QTAudioFormat(0x4132434C, 3, 24));
    EXPECT_TRUE(dynamic_cast<const QTAudioFormat&>(*formats[1]) ==
                QTAudioFormat(0x41324342, 3, 24));
}

TEST_F(SampleMappingTracks, FindersGiveTheFirstOfAKind) {
    AddVideo(1);
    AddVideo(2);
    clip->setAlpha(true);
    Bind();
    EXPECT_EQ(mapping->FirstTrackOf(MediaTrack::kVideo), mapping->mediaTracks_[0].get());
    EXPECT_EQ(mapping->FirstTrackOf(MediaTrack::kVideoAlpha), mapping->mediaTracks_[2].get());
    EXPECT_EQ(mapping->FirstTrackOf(MediaTrack::kAudio), nullptr);
}

}  // namespace
