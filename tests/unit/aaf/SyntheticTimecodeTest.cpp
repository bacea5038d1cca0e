// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <filesystem>
#include <fstream>

#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/Timecode.h"
#include "source/plugin/os/Os.h"
#include "tests/support/TestFiles.h"
#include "tests/support/fakes/FakeLock.h"
#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

constexpr char kAddSyntheticTimeCode[] = "NMA::Impl::AddSyntheticTimeCode";

class SyntheticTimecodeTest : public AAFTest {
protected:
    SyntheticTimecodeTest() { clip->setTiming(); }

    // Gives the clip a file that was written at a time of a day in UTC.
    void MakeFile(int hour, int minute, int second) {
        const std::string path = Write("a clip.mov", "bytes");
        // 2001-09-09, a Sunday.
        SetDate(std::filesystem::u8path(path),
                86400LL * 11574 + 3600 * hour + 60 * minute + second);
        INCFString* const name = MakeHostString(path);
        clip->setFileName(name);
        name->Release();
    }
    NCFRESULT Add() { return AddSyntheticTimeCode(Media(), &slots, Console(), Dictionary(), mob); }
    ncfUInt32 slots = 0;
    IAAFSmartPointer<IAAFMob> mob = Make<IAAFMob>("SourceMob");
};

TEST_F(SyntheticTimecodeTest, MakesAMainAndAnAuxiliarySlotFromTheFilesDate) {
    MakeFile(1, 2, 3);
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(slots, 2u);
    EXPECT_TRUE(aaf.has("Timecode1.Initialize 0 {0 drop 0 fps 25}"));
    EXPECT_TRUE(aaf.has("Timecode1.SetLength 2160000"));
    EXPECT_TRUE(aaf.has("SourceMob1.AppendNewTimelineSlot 25/1 Sequence1 1 'TC1' 0"));
    EXPECT_TRUE(aaf.has("SourceMob1Slot1.SetPhysicalNum 1"));
    const int frames = ((1 * 60 + 2) * 60 + 3) * 25;  // no frames are dropped at 25
    EXPECT_TRUE(aaf.has("Timecode2.Initialize 0 {" + std::to_string(frames) + " drop 1 fps 25}"));
    EXPECT_TRUE(aaf.has("Timecode2.SetLength 100"));
    EXPECT_TRUE(aaf.has("SourceMob1.AppendNewTimelineSlot 25/1 Sequence2 2 'AuxTC1' 0"));
    EXPECT_TRUE(aaf.has("SourceMob1Slot2.SetPhysicalNum 3"));
    EXPECT_TRUE(aaf.has("Filler1.Initialize DataDef1 0"));
    EXPECT_TRUE(aaf.has("Filler2.Initialize DataDef1 " + std::to_string(2160000 - 100)));
}

TEST_F(SyntheticTimecodeTest, TellsTheDateInUtcToTheConsole) {
    MakeFile(23, 59, 58);
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(
        host.console().count(4, "Modification Date is day 9, hour 23, minute 59, second 58\n\n"),
        1);
}

TEST_F(SyntheticTimecodeTest, CountsTheTimeOfDayAsDropFrame) {
    clip->rate = {30000, 1001};
    clip->setTiming();
    MakeFile(1, 0, 0);
    ASSERT_EQ(Add(), NCF_OK);
    // An hour of 30 frames a second drops 108 numbers.
    EXPECT_TRUE(aaf.has("Timecode2.Initialize 0 {107892 drop 1 fps 30}"));
    EXPECT_TRUE(aaf.has("Timecode1.SetLength 2592000"));
}

TEST_F(SyntheticTimecodeTest, ADateThatCannotBeReadIsMidnight) {
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(slots, 2u);
    EXPECT_TRUE(aaf.has("Timecode2.Initialize 0 {0 drop 1 fps 25}"));
    EXPECT_EQ(host.console().count(4, "Modification Date is day 0, hour 0, minute 0, second 0\n\n"),
              1);
    // The system's number for a file that is not there is 2 everywhere.
    EXPECT_TRUE(
        log.once(std::string(kAddSyntheticTimeCode) + " - FileTimeToSystemTime, hresult: 2"));
}

TEST_F(SyntheticTimecodeTest, TellsTheErrorOfTheFailedQueryNotOfTheLogsOwnWork) {
    struct FailingLock : FakeLock {
        NCFRESULT Lock() override {
            ncfUInt64 size = 0;
            EXPECT_FALSE(os::GetFileSize(os::kNoFile, &size)) << "leaves another number";
            return NCF_OK;
        }
    };
    PluginLogSink::Instance().Stop();
    host.maker(CompID_LockComponent, [](const GUID&, void** out) {
        *out = static_cast<INCFLock*>(new FailingLock);
        return NCF_OK;
    });
    PluginLogSink::Instance().Start(host.factory());
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_TRUE(
        log.once(std::string(kAddSyntheticTimeCode) + " - FileTimeToSystemTime, hresult: 2"));
}

TEST_F(SyntheticTimecodeTest, AfterOtherSlotsTheMainSlotsFillerEndsTheClip) {
    slots = 1;
    EXPECT_EQ(Add(), NCF_E_FAIL);
    EXPECT_TRUE(aaf.has("Filler2.Initialize DataDef1 -2160000"));
}

TEST_F(SyntheticTimecodeTest, AfterOtherSlotsTheLabelsFollowTheCounter) {
    aaf.refusesNegativeLengths = false;
    slots = 1;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(slots, 3u);
    EXPECT_TRUE(aaf.has("SourceMob1.AppendNewTimelineSlot 25/1 Sequence1 2 'AuxTC1' 0"));
    EXPECT_TRUE(aaf.has("SourceMob1.AppendNewTimelineSlot 25/1 Sequence2 3 'AuxTC2' 0"));
}

TEST_F(SyntheticTimecodeTest, ChecksItsArgumentsInOrder) {
    const std::tr1::shared_ptr<BaseClip> none;
    EXPECT_EQ(AddSyntheticTimeCode(none, nullptr, nullptr, nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(AddSyntheticTimeCode(Media(), nullptr, nullptr, nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(AddSyntheticTimeCode(Media(), &slots, nullptr, nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(AddSyntheticTimeCode(Media(), &slots, Console(), nullptr, nullptr), NCF_E_POINTER);
    EXPECT_EQ(AddSyntheticTimeCode(Media(), &slots, Console(), Dictionary(), nullptr),
              NCF_E_POINTER);
    std::vector<std::string> texts;
    for (const LoggedRecord& record : log.records()) {
        texts.push_back(record.text);
    }
    EXPECT_EQ(texts, (std::vector<std::string>{
                         std::string("CHK_PTR(media.get())") + kAddSyntheticTimeCode,
                         std::string("CHK_PTR(totalExistingSlots)") + kAddSyntheticTimeCode,
                         std::string("CHK_PTR(pConsole)") + kAddSyntheticTimeCode,
                         std::string("CHK_PTR(pDictionary)") + kAddSyntheticTimeCode,
                         std::string("CHK_PTR(pMobSourceMob)") + kAddSyntheticTimeCode}));
}

TEST_F(SyntheticTimecodeTest, NeedsRateAndLength) {
    clip->failures["GetEditRate"] = NMA_E_NOTINITIALIZED;
    EXPECT_EQ(Add(), NMA_E_NOTINITIALIZED);
    clip->failures = {{"GetMovieLength", NMA_E_NOTINITIALIZED}};
    EXPECT_EQ(Add(), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(log.returned(NMA_E_NOTINITIALIZED, "media->GetMovieLength(&movieLength)",
                             kAddSyntheticTimeCode));
}

TEST_F(SyntheticTimecodeTest, ARateThatRoundsToNothingIsRefused) {
    clip->rate = {1, 3};
    clip->setTiming();
    EXPECT_EQ(Add(), NCF_E_INVALIDARG);
    EXPECT_TRUE(log.returned(NCF_E_INVALIDARG,
                             "ConvertTCToFrames( pUTCTime->tm_hour, pUTCTime->tm_min, "
                             "pUTCTime->tm_sec, 0, numFPS, TRUE, &tcInFrames)",
                             kAddSyntheticTimeCode));
}

TEST_F(SyntheticTimecodeTest, LogsTheSlotThatFailed) {
    aaf.refuse("SourceMob1.AppendNewTimelineSlot", AAFRESULT_NOMEMORY, 1);
    EXPECT_EQ(Add(), NMA_E_AAF_ADD);
    EXPECT_TRUE(
        log.returned(NMA_E_AAF_ADD,
                     "AddTimecodeAAFTrack( timecode, tcTrackNum++, (*totalExistingSlots)++, "
                     "aafEditRate, maxDuration, 0, 0, pDictionary, pMobSourceMob)",
                     kAddSyntheticTimeCode));
    slots = 0;
    aaf.refuse("SourceMob1.AppendNewTimelineSlot", AAFRESULT_NOMEMORY, 2);
    EXPECT_EQ(Add(), NMA_E_AAF_ADD);
    EXPECT_TRUE(
        log.returned(NMA_E_AAF_ADD,
                     "AddTimecodeAAFTrack( auxTimecode, tcTrackNum, (*totalExistingSlots)++, "
                     "aafEditRate, movieLength, maxDuration, 0, pDictionary, pMobSourceMob)",
                     kAddSyntheticTimeCode));
}

}  // namespace
}  // namespace NMA::Impl
