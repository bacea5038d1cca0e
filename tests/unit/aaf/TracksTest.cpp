// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/Tracks.h"

#include <algorithm>

#include "source/aaf/MobIds.h"
#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

constexpr char kAddTracksToAAF[] = "NMA::Impl::AddTracksToAAF";

class TracksTest : public AAFTest {
protected:
    TracksTest() {
        clip->setTiming();
        fileMob->SetMobID(MobIdTemplate(0xB1));
        sourceMob->SetMobID(MobIdTemplate(0xA1));
        aaf.clearJournal();
    }
    NCFRESULT Add() {
        start = -1;
        return AddTracksToAAF(Media(), Console(), header, Dictionary(), masterMob,
                              As<IAAFMasterMob>(masterMob), fileMob, As<IAAFSourceMob>(fileMob),
                              sourceMob, As<IAAFSourceMob>(sourceMob), multi, host.factory(),
                              &start);
    }
    // Slots that were made, in order: "Source 2 picture".
    std::vector<std::string> Slots() const {
        std::vector<std::string> slots;
        for (const std::string& line : aaf.journal().lines()) {
            for (const char* start_ :
                 {"Master1.NewPhysSourceRef 25/1 ", "File1.NewPhysSourceRef 25/1 ",
                  "Source1.AddNilReference "}) {
                const std::string begin = start_;
                if (line.compare(0, begin.size(), begin) == 0) {
                    const std::string rest = line.substr(begin.size());
                    slots.push_back(begin.substr(0, begin.find('1')) + " " +
                                    rest.substr(0, rest.find(' ')));
                }
            }
        }
        return slots;
    }
    std::vector<std::string> Chain(int id) const {
        const std::string number = std::to_string(id);
        return {"Master " + number, "File " + number, "Source " + number};
    }
    std::vector<std::string> Chains(int first, int last) const {
        std::vector<std::string> all;
        for (int id = first; id <= last; ++id) {
            for (const std::string& slot : Chain(id)) {
                all.push_back(slot);
            }
        }
        return all;
    }

    aafPosition_t start = -1;
    IAAFSmartPointer<IAAFHeader> header = Make<IAAFHeader>("Header");
    IAAFSmartPointer<IAAFMob> masterMob = Make<IAAFMob>("Master");
    IAAFSmartPointer<IAAFMob> fileMob = Make<IAAFMob>("File");
    IAAFSmartPointer<IAAFMob> sourceMob = Make<IAAFMob>("Source");
    IAAFSmartPointer<IAAFMultipleDescriptor> multi =
        Make<IAAFMultipleDescriptor>("MultipleDescriptor");
};

// Each is missing once alone and once with all behind it.
TEST_F(TracksTest, TellsTheFirstMissingArgumentAlone) {
    const std::tr1::shared_ptr<BaseClip> none;
    const auto master = As<IAAFMasterMob>(masterMob);
    const auto file = As<IAAFSourceMob>(fileMob);
    const auto source = As<IAAFSourceMob>(sourceMob);
    const char* const names[] = {"media.get()",      "pConsole",          "pDictionary",
                                 "pMobMasterMob",    "pMasterMob",        "pMobFileMob",
                                 "pFileMob",         "pMobSourceMob",     "pSourceMob",
                                 "pMultiDescriptor", "pComponentFactory", "absoluteStartTime"};
    for (int missing = 0; missing < 12; ++missing) {
        for (const bool alone : {true, false}) {
            const auto has = [&](int i) { return i < missing || (alone && i > missing); };
            log.clear();
            // The header is not among what is checked.
            EXPECT_EQ(
                AddTracksToAAF(
                    has(0) ? Media() : none, has(1) ? Console() : NCFSmartPtr<INCFConsole>(),
                    nullptr, has(2) ? (IAAFDictionary*)Dictionary() : nullptr,
                    has(3) ? (IAAFMob*)masterMob : nullptr,
                    has(4) ? (IAAFMasterMob*)master : nullptr, has(5) ? (IAAFMob*)fileMob : nullptr,
                    has(6) ? (IAAFSourceMob*)file : nullptr, has(7) ? (IAAFMob*)sourceMob : nullptr,
                    has(8) ? (IAAFSourceMob*)source : nullptr,
                    has(9) ? (IAAFMultipleDescriptor*)multi : nullptr,
                    has(10) ? host.factory() : nullptr, has(11) ? &start : nullptr),
                NCF_E_POINTER);
            ASSERT_EQ(log.records().size(), 1u) << names[missing];
            EXPECT_EQ(log.records()[0].text,
                      std::string("CHK_PTR(") + names[missing] + ")" + kAddTracksToAAF);
        }
    }
}

TEST_F(TracksTest, AVideoClipWithTimecodeAndTwoStereoTracks) {
    clip->timecode.resize(1);
    clip->sound.resize(2);
    clip->sound[1].qtTrack = 9;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("Source1.AppendNewTimelineSlot 25/1 Sequence1 1 'TC1' 0"));
    EXPECT_EQ(Slots(), Chains(2, 6));
    EXPECT_EQ(
        aaf.linesOf("MultipleDescriptor1.AppendFileDescriptor"),
        (std::vector<std::string>{"MultipleDescriptor1.AppendFileDescriptor CDCIDescriptor1",
                                  "MultipleDescriptor1.AppendFileDescriptor PCMDescriptor1",
                                  "MultipleDescriptor1.AppendFileDescriptor PCMDescriptor2"}));
    EXPECT_TRUE(aaf.has("Dictionary.LookupDataDef 6F3C8CE1-6CEF-11D2-807D-006008143E6F"));
    EXPECT_TRUE(aaf.has("Dictionary.LookupDataDef 78E1EBE1-6CEF-11D2-807D-006008143E6F"));
    EXPECT_EQ(start, 90000);
}

TEST_F(TracksTest, AsksForEachKindWhenTheOneBeforeStands) {
    clip->timecode.resize(1);
    clip->sound.resize(2);
    clip->sound[1].qtTrack = 9;
    std::vector<std::string> asked;  // with the last call to the library
    clip->whenAsked = [&](const std::string& operation) {
        for (const char* question :
             {"GetEditRate", "GetMovieLength", "GetTimeCodeTrackCount", "GetTimecodeTrackQTId",
              "GetTimeCodeTrackMetadata", "GetVideoTrackCount", "GetAudioTrackCount"}) {
            if (operation == question) {
                const auto& calls = aaf.journal().lines();
                const std::string last = calls.empty() ? "" : calls.back();
                // Descriptors ask for the rate again: only slots tell the place.
                if (last.find("Descriptor") == std::string::npos) {
                    asked.push_back(operation + " after " + last);
                }
            }
        }
    };
    const IAAFSmartPointer<IAAFMasterMob> master = As<IAAFMasterMob>(masterMob);
    const IAAFSmartPointer<IAAFSourceMob> file = As<IAAFSourceMob>(fileMob);
    const IAAFSmartPointer<IAAFSourceMob> source = As<IAAFSourceMob>(sourceMob);
    aaf.clearJournal();
    ASSERT_EQ(AddTracksToAAF(Media(), Console(), header, Dictionary(), masterMob, master, fileMob,
                             file, sourceMob, source, multi, host.factory(), &start),
              NCF_OK);
    EXPECT_EQ(asked,
              (std::vector<std::string>{
                  "GetEditRate after ", "GetMovieLength after ", "GetTimeCodeTrackCount after ",
                  "GetTimecodeTrackQTId after ", "GetTimeCodeTrackMetadata after ",
                  "GetVideoTrackCount after Source1Slot1.SetPhysicalNum 1",
                  "GetAudioTrackCount after Source1Slot2.SetName ''"}));
    // Each descriptor comes before its slots.
    const std::vector<int> places = {
        aaf.place("MultipleDescriptor1.AppendFileDescriptor CDCIDescriptor1"),
        aaf.place("Master1.NewPhysSourceRef 25/1 2 "),
        aaf.place("MultipleDescriptor1.AppendFileDescriptor PCMDescriptor1"),
        aaf.place("Master1.NewPhysSourceRef 25/1 3 "),
        aaf.place("MultipleDescriptor1.AppendFileDescriptor PCMDescriptor2"),
        aaf.place("Master1.NewPhysSourceRef 25/1 5 ")};
    EXPECT_TRUE(std::is_sorted(places.begin(), places.end()));
    EXPECT_GT(places.front(), 0);
}

TEST_F(TracksTest, EverySlotsNameIsEmptyInAllMobs) {
    clip->timecode.resize(1);
    clip->sound.resize(1);
    ASSERT_EQ(Add(), NCF_OK);
    for (const char* mob : {"Master1", "File1", "Source1"}) {
        int named = 0;
        for (const std::string& line : aaf.linesOf(mob)) {
            if (line.find(".SetName ") != std::string::npos) {
                EXPECT_EQ(line.substr(line.find(' ')), " ''");
                ++named;
            }
        }
        EXPECT_EQ(named, 3) << mob;
    }
}

TEST_F(TracksTest, WithoutTimecodeEveryIdMovesUpByOne) {
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("Source1.AppendNewTimelineSlot 25/1 Sequence1 1 'TC1' 0"));
    EXPECT_TRUE(aaf.has("Source1.AppendNewTimelineSlot 25/1 Sequence2 2 'AuxTC1' 0"));
    EXPECT_EQ(Slots(), Chain(3));
    EXPECT_EQ(start, 0);
}

TEST_F(TracksTest, AnAudioOnlyClipNeverTouchesTheRetriever) {
    clip->videoTracks = 0;
    clip->timecode.resize(1);
    clip->sound.resize(1);
    clip->sound[0].metadata.channelsPerFrame = 6;
    std::filesystem::remove(Folder() + "FourCharMapper.xml");
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    EXPECT_EQ(Slots(), Chains(2, 7));
}

TEST_F(TracksTest, SeveralVideoTracksShowTheFirstAlone) {
    clip->videoTracks = 2;
    clip->timecode.resize(1);
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(Slots(), Chain(2));
    EXPECT_EQ(aaf.linesOf("MultipleDescriptor1.AppendFileDescriptor").size(), 1u);
}

TEST_F(TracksTest, AlphaIsASecondPictureWithTheNextId) {
    clip->timecode.resize(1);
    clip->setAlpha(true, false);
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(Slots(), Chains(2, 3));
    EXPECT_EQ(
        aaf.linesOf("MultipleDescriptor1.AppendFileDescriptor"),
        (std::vector<std::string>{"MultipleDescriptor1.AppendFileDescriptor CDCIDescriptor1",
                                  "MultipleDescriptor1.AppendFileDescriptor CDCIDescriptor2"}));
}

TEST_F(TracksTest, IgnoredAlphaShowsNothing) {
    clip->timecode.resize(1);
    clip->setAlpha(true, true);
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(Slots(), Chain(2));
}

TEST_F(TracksTest, AlphaWithoutAVideoTrackNeedsARetrieverBeforeAnyDescriptor) {
    clip->videoTracks = 0;
    clip->timecode.resize(1);
    clip->setAlpha(true, false);
    const std::string missing =
        std::string("NCFASSERT( QuickTimeToAAFInfoRetriever::GetInstance() )") + kAddTracksToAAF;
    EXPECT_EQ(Add(), NCF_E_FAIL);
    EXPECT_TRUE(log.once(missing));
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr) << "no track: no data files";
    EXPECT_TRUE(aaf.linesOf("Dictionary.CreateInstance AUID_AAFCDCIDescriptor").empty());
    EXPECT_EQ(aaf.place("CDCIDescriptor1"), -1);

    StartRetriever();  // as a clip described before has done
    EXPECT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(log.once(missing));
    EXPECT_EQ(aaf.linesOf("MultipleDescriptor1.AppendFileDescriptor").size(), 1u);
}

TEST_F(TracksTest, ATrackWithoutChannelsHasADescriptorAndNoSlot) {
    clip->videoTracks = 0;
    clip->timecode.resize(1);
    clip->sound.resize(2);
    clip->sound[0].metadata.channelsPerFrame = 0;
    clip->sound[1].qtTrack = 9;
    clip->sound[1].metadata.channelsPerFrame = 1;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(Slots(), Chain(2));
    EXPECT_EQ(aaf.linesOf("MultipleDescriptor1.AppendFileDescriptor").size(), 2u);
}

TEST_F(TracksTest, TimecodeAtAnotherRateIsScaled) {
    clip->timecode.resize(1);
    clip->timecode[0].metadata.numFrames = 30;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(start, 3600 * 30 * 25 / 30);
    EXPECT_TRUE(aaf.has("Timecode1.Initialize 0 {0 drop 0 fps 25}"));
    EXPECT_TRUE(aaf.has("Timecode1.SetLength 2160000"));
}

TEST_F(TracksTest, ScaledTimecodeIsRounded) {
    clip->timecode.resize(1);
    clip->timecode[0].metadata = {0, 0, 0, 1, 2400, 100, 0, 24};
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(start, 1);  // 1.0417 + 0.5
    clip->timecode[0].metadata = {0, 0, 0, 12, 2400, 100, 0, 24};
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(start, 13);  // 12.5 + 0.5
}

TEST_F(TracksTest, TheRoundedRateOfNtscIsThirty) {
    clip->rate = {30000, 1001};
    clip->setTiming();
    clip->timecode.resize(1);
    clip->timecode[0].metadata = {0, 1, 0, 2, 30000, 1001, 1, 30};
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(start, 1800);  // numbers 0 and 1 of the minute are dropped
    EXPECT_TRUE(aaf.has("Timecode1.Initialize 0 {0 drop 1 fps 30}"));
    EXPECT_TRUE(aaf.has("Timecode1.SetLength 2592000"));
}

TEST_F(TracksTest, OnlyTheLowByteOfDropAndFramesCounts) {
    clip->timecode.resize(1);
    clip->timecode[0].metadata.drop = 0x100;
    clip->timecode[0].metadata.numFrames = 0x119;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(start, 90000);
    EXPECT_TRUE(aaf.has("Timecode1.Initialize 0 {0 drop 0 fps 25}"));
    clip->timecode[0].metadata.drop = 0x102;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(aaf.has("Timecode2.Initialize 0 {0 drop 1 fps 25}"));
}

TEST_F(TracksTest, TimecodeWithoutARateIsRefused) {
    clip->timecode.resize(1);
    clip->timecode[0].metadata.numFrames = 0x100;
    EXPECT_EQ(Add(), NCF_E_INVALIDARG);
    EXPECT_TRUE(log.returned(
        NCF_E_INVALIDARG,
        "ConvertTCToFrames(tcInfo.hours, tcInfo.minutes, tcInfo.seconds, tcInfo.frames, "
        "tcFPS, *((bool*)&tcInfo.drop), &tcInFrames)",
        kAddTracksToAAF));
}

TEST_F(TracksTest, AScaledStartGoesBeyond32Bits) {
    clip->rate = {1000000, 1};
    clip->setTiming();
    clip->timecode.resize(1);
    clip->timecode[0].metadata = {2, 0, 0, 0, 1, 1, 0, 1};  // 7200 seconds, 1 frame each
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(start, 7200000000);
}

TEST_F(TracksTest, ATimecodeWithSomethingToTellIsStillComplete) {
    clip->timecode.resize(1);
    clip->timecode[0].result = 1;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(start, 90000);
    EXPECT_EQ(host.console().count(2, "TimeCode track metadata incomplete.\n"), 0);
    EXPECT_EQ(aaf.linesOf("Source1.AppendNewTimelineSlot").size(), 1u);
}

TEST_F(TracksTest, OfSeveralTimecodeTracksTheLastStartWins) {
    clip->timecode.resize(2);
    clip->timecode[1].qtTrack = 4;
    clip->timecode[1].metadata.hours = 2;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(start, 180000);
    EXPECT_TRUE(aaf.has("Source1.AppendNewTimelineSlot 25/1 Sequence2 2 'AuxTC1' 0"));
    EXPECT_TRUE(aaf.has("Source1Slot2.SetPhysicalNum 3"));
    EXPECT_TRUE(aaf.has("Filler1.Initialize DataDef1 0"));
    EXPECT_TRUE(aaf.has("Filler2.Initialize DataDef1 0"));
    EXPECT_EQ(Slots(), Chain(3));
}

TEST_F(TracksTest, ATrackWithoutMetadataGetsTheFilesDate) {
    clip->timecode.resize(2);
    clip->timecode[0].result = NCF_E_PARAMETERNOTAVAILABLE;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(host.console().count(2, "TimeCode track metadata incomplete.\n"), 1);
    EXPECT_TRUE(aaf.has("Source1.AppendNewTimelineSlot 25/1 Sequence2 2 'AuxTC1' 0"));
    EXPECT_EQ(Slots(), Chain(3));
    EXPECT_EQ(journal.count("clip GetTimeCodeTrackMetadata"), 1)
        << "later tracks are not looked at";
}

TEST_F(TracksTest, ASecondTrackWithoutMetadataFailsTheClip) {
    clip->timecode.resize(2);
    clip->timecode[1].qtTrack = 4;
    clip->timecode[1].result = NCF_E_PARAMETERNOTAVAILABLE;
    EXPECT_EQ(Add(), NCF_E_FAIL);
    aaf.refusesNegativeLengths = false;
    aaf.clearJournal();
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(aaf.linesOf("Source1.AppendNewTimelineSlot").size(), 3u);
    EXPECT_EQ(start, 90000);
}

TEST_F(TracksTest, FailuresOfTheClipAreLoggedAndReturned) {
    clip->timecode.resize(1);
    clip->sound.resize(1);
    const std::pair<const char*, const char*> statements[] = {
        {"GetEditRate", "media->GetEditRate(&movieEditRate)"},
        {"GetMovieLength", "media->GetMovieLength(&movieLength)"},
        {"GetTimeCodeTrackCount", "media->GetTimeCodeTrackCount(&tcTrackCount)"},
        {"GetTimecodeTrackQTId", "media->GetTimecodeTrackQTId(tc_track, qtTrack)"},
        {"GetVideoTrackCount", "media->GetVideoTrackCount(&videoTrackCount)"},
        {"GetAudioTrackCount", "media->GetAudioTrackCount(&audioTrackCount)"},
        {"GetColorDetails",
         "AddVideoDescriptor(media, pConsole, pMobMasterMob, pHeader, pDictionary, "
         "pMultiDescriptor)"},
        {"GetAudioTrackQTId",
         "AddAudioDescriptor( media, audio_track, pConsole, pMobMasterMob, pDictionary, "
         "pMultiDescriptor, slotsToAdd)"},
    };
    for (const auto& [operation, statement] : statements) {
        log.clear();
        clip->failures = {{operation, NCF_E_NOTFOUND}};
        EXPECT_EQ(Add(), NCF_E_NOTFOUND) << operation;
        EXPECT_TRUE(log.returned(NCF_E_NOTFOUND, statement, kAddTracksToAAF)) << operation;
    }
}

TEST_F(TracksTest, SlotsThatAreRefusedAreLoggedAndReturned) {
    clip->timecode.resize(1);
    aaf.refuse("Master1.NewPhysSourceRef", AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(
        log.returned(AAFRESULT_NOMEMORY,
                     "AddAAFTrack(dataDefUID, slotFormatLabel, slotsToAdd, startingSlot, "
                     "totalExistingSlots++, aaf_rate, movieLength, pDictionary, pMobMasterMob, "
                     "pMasterMob, pMobFileMob, pFileMob, pMobSourceMob, pSourceMob, 0 )",
                     kAddTracksToAAF));
    clip->videoTracks = 0;
    clip->sound.resize(1);
    aaf.clearRefusals();
    aaf.refuse("Master1.NewPhysSourceRef", AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(
        log.returned(AAFRESULT_NOMEMORY,
                     "AddAAFTrack(dataDefUID, slotFormatLabel, slotsToAdd, startingSlot, "
                     "totalExistingSlots, aaf_rate, movieLength, pDictionary, pMobMasterMob, "
                     "pMasterMob, pMobFileMob, pFileMob, pMobSourceMob, pSourceMob, 0 )",
                     kAddTracksToAAF));
    aaf.clearRefusals();
    aaf.refuse("Source1.AppendNewTimelineSlot", AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(), NMA_E_AAF_ADD);
    EXPECT_TRUE(
        log.returned(NMA_E_AAF_ADD,
                     "AddTimecodeAAFTrack(timecode, startingSlot, totalExistingSlots++, aaf_rate, "
                     "maxDuration, maxDuration, 0, pDictionary, pMobSourceMob)",
                     kAddTracksToAAF));
    clip->timecode.clear();
    aaf.clearRefusals();
    aaf.refuse("Source1.AppendNewTimelineSlot", AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(), NMA_E_AAF_ADD);
    EXPECT_TRUE(log.returned(NMA_E_AAF_ADD,
                             "AddSyntheticTimeCode(media, &totalExistingSlots, pConsole, "
                             "pDictionary, pMobSourceMob)",
                             kAddTracksToAAF));
}

TEST_F(TracksTest, MissingDataFilesEndEveryClipWithVideo) {
    std::filesystem::remove(std::filesystem::u8path(Folder() + "AAFInfo.xml"));
    clip->timecode.resize(1);
    for (int time = 1; time <= 2; ++time) {
        EXPECT_EQ(Add(), NCF_E_UNEXPECTED);
        EXPECT_EQ(
            log.count(ReturnRecord(NCF_E_UNEXPECTED,
                                   "QuickTimeToAAFInfoRetriever::Init(pConsole, pComponentFactory, "
                                   "fourCharXML, AAFInfoXML)",
                                   kAddTracksToAAF)),
            time);
    }
    EXPECT_TRUE(Slots().empty());
}

}  // namespace
}  // namespace NMA::Impl
