// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/essence/support/MappingFixture.h"

namespace {

// Track 0 picture, tracks 1 and 2 sound 8 and 9.
class AudioFormats : public MappingFixture {
protected:
    AudioFormats() {
        AddVideo(7);
        AddAudio(8);
        AddAudio(9);
        Bind();
        EXPECT_EQ(QuerySound(), NCF_OK);
        journal.clear();
    }
    ncfUInt32 Channels(ncfUInt32 track) {
        return dynamic_cast<AudioMediaTrack&>(*mapping->mediaTracks_[track])
            .GetNumberAudioChannels();
    }
};

TEST_F(AudioFormats, CountsUnderTheLock) {
    ncfUInt32 count = 0;
    EXPECT_EQ(mapping->GetNumberOfAudioFormats(1, &count), NCF_OK);
    EXPECT_EQ(count, 2u);
    EXPECT_EQ(journal.lines(), (Lines{"lock", "unlock"}));
}

TEST_F(AudioFormats, CountNeedsAnOutputThenASoundTrack) {
    ncfUInt32 count = 77;
    EXPECT_EQ(mapping->GetNumberOfAudioFormats(9, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(numFormats)", "GetNumberOfAudioFormats")));
    EXPECT_EQ(mapping->GetNumberOfAudioFormats(9, &count), NCF_E_INVALIDARG);
    EXPECT_TRUE(
        log->once(Record("80000003", "GetMediaTrack(trackNMA, track)", "GetNumberOfAudioFormats")));
    log->clear();
    EXPECT_EQ(mapping->GetNumberOfAudioFormats(0, &count), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->records().empty()) << "a picture is refused silently";
    EXPECT_EQ(count, 77u);
}

TEST_F(AudioFormats, TellsAFormatUnderTheLock) {
    ncfUInt32 format = 0;
    ncfUInt16 bytes = 0;
    ncfUInt16 bits = 0;
    EXPECT_EQ(mapping->GetAudioFormat(1, 0, &format, &bytes, &bits), NCF_OK);
    EXPECT_EQ(format, SF_PCM_INT_LE);
    EXPECT_EQ(bytes, 3);
    EXPECT_EQ(bits, 24);
    EXPECT_EQ(mapping->GetAudioFormat(2, 1, &format, &bytes, &bits), NCF_OK);
    EXPECT_EQ(format, SF_PCM_INT_BE);
    EXPECT_EQ(journal.lines(), (Lines{"lock", "unlock", "lock", "unlock"}));
}

TEST_F(AudioFormats, NullOutputOutranksABadTrack) {
    ncfUInt32 format = 77;
    ncfUInt16 bytes = 77;
    ncfUInt16 bits = 77;
    EXPECT_EQ(mapping->GetAudioFormat(9, 0, nullptr, nullptr, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(mapping->GetAudioFormat(9, 0, &format, nullptr, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(mapping->GetAudioFormat(9, 0, &format, &bytes, nullptr), NCF_E_INVALIDARG);
    for (const char* name : {"sampleFormat", "bytesPerSample", "bitsPerSample"}) {
        EXPECT_TRUE(log->once(Check(std::string("CHK_INARG(") + name + ")", "GetAudioFormat")));
    }
    EXPECT_FALSE(log->contains("GetMediaTrack"));
    EXPECT_EQ(mapping->GetAudioFormat(9, 0, &format, &bytes, &bits), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->contains("GetMediaTrack(trackNMA, track)"));
    EXPECT_EQ(mapping->GetAudioFormat(0, 0, &format, &bytes, &bits), NCF_E_INVALIDARG);
    EXPECT_EQ(mapping->GetAudioFormat(1, 2, &format, &bytes, &bits), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(
        Record("80000003", "track->GetMediaFormat(formatIndex, mediaFormat)", "GetAudioFormat")));
    EXPECT_EQ(format, 77u);
}

TEST_F(AudioFormats, FormatOfAnotherKindIsRefused) {
    mapping->mediaTracks_[1]->AddFormat(QTImageFormat());
    ncfUInt32 format = 77;
    ncfUInt16 bytes = 77;
    ncfUInt16 bits = 77;
    EXPECT_EQ(mapping->GetAudioFormat(1, 2, &format, &bytes, &bits), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(audio_format)", "GetAudioFormat")));
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 2), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(audio_format)", "SetWorkingAudioFormat")));
}

TEST_F(AudioFormats, ChoiceTellsTheReaderAndKeepsItsChannelCount) {
    wrapper->rate = 44100.0;
    wrapper->sound->channels = 5;
    clip->metadata.channelsPerFrame = 5;
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_OK);
    EXPECT_EQ(journal.count("sound.SetParams 8 3 1 44100.000000 1"), 1);
    EXPECT_EQ(Channels(1), 5u);
    EXPECT_EQ(Channels(2), 1u);
    EXPECT_EQ(wrapper->lastTrack, 8u);
    EXPECT_TRUE(log->records().empty());
    EXPECT_EQ(journal.lines().front(), "lock");
    EXPECT_EQ(journal.lines().back(), "unlock");
    EXPECT_EQ(mapping->SetWorkingAudioFormat(2, 1), NCF_OK);
    EXPECT_EQ(journal.count("sound.SetParams 9 3 0 44100.000000 1"), 1)
        << "big-endian, and one channel is offered again";
}

TEST_F(AudioFormats, ChoosesUnderTheLock) {
    std::vector<ncfUInt32> chosen;
    lock->whenLocked = [&] { chosen.push_back(mapping->mediaTracks_[1]->GetSelectedIndex()); };
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 1), NCF_OK);
    EXPECT_EQ(chosen, std::vector<ncfUInt32>{0}) << "nothing is chosen before the lock";
    EXPECT_EQ(mapping->mediaTracks_[1]->GetSelectedIndex(), 1u);
}

TEST_F(AudioFormats, ReportsAChannelCountThatDiffersFromTheFiles) {
    wrapper->sound->channels = 6;
    clip->metadata.channelsPerFrame = 2;
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_OK);
    EXPECT_EQ(Channels(1), 6u);
    EXPECT_TRUE(log->contains("numAudioChannels(6) != audioInfo.channelsPerFrame(2)"));
}

TEST_F(AudioFormats, ReaderWithoutChannelsIsRefused) {
    wrapper->sound->channels = 0;
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_E_FAIL);
    EXPECT_EQ(Channels(1), 1u);
    EXPECT_TRUE(
        log->once(Record("80000008", "audio_track->SetNumberAudioChannels(numAudioChannels)",
                         "SetWorkingAudioFormat")));
}

TEST_F(AudioFormats, ChoicePastTheEndLeavesTheIndexChanged) {
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 5), NCF_E_INVALIDARG);
    EXPECT_EQ(mapping->mediaTracks_[1]->GetSelectedIndex(), 5u);
    EXPECT_FALSE(mapping->mediaTracks_[1]->GetSelectedFormat());
    EXPECT_TRUE(log->once(Record("80000003", "track->GetMediaFormat(formatIndex, mediaFormat)",
                                 "SetWorkingAudioFormat")));
    EXPECT_EQ(journal.startingWith("sound.").size(), 0u);
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 1), NCF_OK);
    EXPECT_FALSE(mapping->mediaTracks_[1]->GetSelectedFormat()) << "never set for sound";
}

TEST_F(AudioFormats, ChoiceNeedsASoundTrackBeforeTheLock) {
    EXPECT_EQ(mapping->SetWorkingAudioFormat(0, 0), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->records().empty());
    EXPECT_EQ(mapping->SetWorkingAudioFormat(9, 0), NCF_E_INVALIDARG);
    EXPECT_TRUE(
        log->once(Record("80000003", "GetMediaTrack(trackNMA, track)", "SetWorkingAudioFormat")));
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(AudioFormats, ChoiceKeepsItsIndexThenMapsItsTrackThenLooksForTheFormat) {
    mapping->_trackRemapVect.assign(1, 3);
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 5), NCF_E_FAIL) << "the map, not the format";
    EXPECT_EQ(mapping->mediaTracks_[1]->GetSelectedIndex(), 5u);
}

TEST_F(AudioFormats, ChoiceGivesTheFailureOfEachStep) {
    wrapper->results["GetAudioInfoForTrack"] = NCF_E_ABORT;
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_E_ABORT);
    wrapper->results.clear();
    wrapper->sound->results["SetParams"] = NCF_E_HANDLE;
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_E_HANDLE);
    wrapper->sound->results.clear();
    clip->results["GetAudioTrackMetadata"] = NCF_E_NOTFOUND;
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_E_NOTFOUND);
    mapping->_trackRemapVect.assign(1, 3);
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_E_FAIL);
    const std::pair<const char*, const char*> texts[] = {
        {"80000007",
         "qtWrapper->GetAudioInfoForTrack(trackQT, NULL, &sampleRate, NULL, NULL, NULL, NULL, "
         "NULL, NULL, NULL)"},
        {"80000006",
         "_audioReaderHolder->SetParams(trackQT, bytesPerSample, audio_format->GetSampleFormat() "
         "== SF_PCM_INT_LE, sampleRate, numAudioChannels)"},
        {"8000000c", "media_->GetAudioTrackMetadata(trackQT, &audioInfo)"},
        {"80000008", "AAFTrackToQuickTimeTrack(trackNMA, &trackQT)"},
    };
    for (const auto& text : texts) {
        EXPECT_TRUE(log->once(Record(text.first, text.second, "SetWorkingAudioFormat")))
            << text.second;
    }
    EXPECT_EQ(Channels(1), 1u);
}

using AudioFormatsBeforeTheQuery = MappingFixture;

TEST_F(AudioFormatsBeforeTheQuery, ChoiceNeedsTheReaderFirst) {
    EXPECT_EQ(mapping->SetWorkingAudioFormat(9, 0), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(_audioReaderHolder)", "SetWorkingAudioFormat")));
}

}  // namespace
