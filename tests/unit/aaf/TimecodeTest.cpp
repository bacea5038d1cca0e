// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/Timecode.h"

#include <climits>

#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

class TimecodeTest : public AAFTest {
protected:
    NCFRESULT Add(ncfUInt32 track, aafLength_t movieLength = 100, aafLength_t maxLength = 1000,
                  aafLength_t startTime = 0) {
        return AddTimecodeAAFTrack({7, 1, 30}, track, 4, {30000, 1001}, movieLength, maxLength,
                                   startTime, Dictionary(), mob);
    }
    // Lines without the look-ups of definitions.
    std::vector<std::string> Calls() const {
        std::vector<std::string> calls;
        for (const std::string& line : aaf.journal().lines()) {
            if (line.find(".Lookup") == std::string::npos ||
                line.find("Slot") != std::string::npos) {
                calls.push_back(line);
            }
        }
        return calls;
    }
    IAAFSmartPointer<IAAFMob> mob = Make<IAAFMob>("SourceMob");
};

TEST_F(TimecodeTest, TheMainTrackIsATimecodeAlone) {
    ASSERT_EQ(Add(0), NCF_OK);
    EXPECT_EQ(Calls(),
              (std::vector<std::string>{
                  "SourceMob1.GetMobID", "ClassDefSequence1.CreateInstance",
                  "Sequence1.Initialize DataDef1", "ClassDefTimecode1.CreateInstance",
                  "Timecode1.QueryInterface 92B88035-2B2B-11D2-BF7E-00104BC9156D",
                  "Timecode1.Initialize 0 {7 drop 1 fps 30}", "Timecode1.SetDataDef DataDef1",
                  "Timecode1.SetLength 100", "Sequence1.AppendComponent Timecode1",
                  "Sequence1.QueryInterface 7A2F0570-1BA3-11D2-BFAA-006097116212",
                  "SourceMob1.AppendNewTimelineSlot 30000/1001 Sequence1 5 'TC1' 0",
                  "SourceMob1.LookupSlot 5", "SourceMob1Slot1.SetPhysicalNum 1"}));
    EXPECT_TRUE(aaf.has("Dictionary.LookupDataDef 7F275E81-77E5-11D2-807F-006008143E6F"));
}

TEST_F(TimecodeTest, AnAuxiliaryTrackHasFillersOnBothSides) {
    ASSERT_EQ(Add(1, 100, 1000, 30), NCF_OK);
    const std::vector<std::string> calls = Calls();
    const auto append =
        std::find(calls.begin(), calls.end(), "Sequence1.AppendComponent Timecode1");
    ASSERT_NE(append, calls.end());
    EXPECT_EQ(std::vector<std::string>(append + 1, append + 9),
              (std::vector<std::string>{
                  "ClassDefFiller1.CreateInstance", "Filler1.Initialize DataDef1 30",
                  "Filler1.QueryInterface 38E6F8A1-2A2C-11D2-8411-00600832ACB8",
                  "Sequence1.PrependComponent Filler1", "ClassDefFiller1.CreateInstance",
                  "Filler2.Initialize DataDef1 870",
                  "Filler2.QueryInterface 38E6F8A1-2A2C-11D2-8411-00600832ACB8",
                  "Sequence1.AppendComponent Filler2"}));
    EXPECT_TRUE(aaf.has("SourceMob1.AppendNewTimelineSlot 30000/1001 Sequence1 5 'AuxTC1' 0"));
    EXPECT_TRUE(aaf.has("SourceMob1Slot1.SetPhysicalNum 3"));
}

TEST_F(TimecodeTest, FillersOfNoLengthAreMadeLikeAnyOther) {
    ASSERT_EQ(Add(2, 1000, 1000), NCF_OK);
    EXPECT_TRUE(aaf.has("Filler1.Initialize DataDef1 0"));
    EXPECT_TRUE(aaf.has("Filler2.Initialize DataDef1 0"));
    EXPECT_TRUE(aaf.has("SourceMob1.AppendNewTimelineSlot 30000/1001 Sequence1 5 'AuxTC2' 0"));
    EXPECT_TRUE(aaf.has("SourceMob1Slot1.SetPhysicalNum 4"));
}

TEST_F(TimecodeTest, LengthsAndStartsGoBeyond32Bits) {
    ASSERT_EQ(Add(1, 5000000000, 20000000000, 6000000000), NCF_OK);
    EXPECT_TRUE(aaf.has("Filler1.Initialize DataDef1 6000000000"));
    EXPECT_TRUE(aaf.has("Timecode1.SetLength 5000000000"));
    EXPECT_TRUE(aaf.has("Filler2.Initialize DataDef1 9000000000"));
}

TEST_F(TimecodeTest, AFillerThatWouldBeNegativeIsTheLibrarysToRefuse) {
    EXPECT_EQ(Add(1, 2592000, 0), NCF_E_FAIL);
    EXPECT_TRUE(aaf.has("Filler2.Initialize DataDef1 -2592000"));
    EXPECT_TRUE(
        lines.contains("Unable to initialize the filler, AAFResult = 0x801200fc, "
                       "QuickTimeToAAF("));
}

TEST_F(TimecodeTest, LengthsBeyondTheRangeDoNotOverflow) {
    EXPECT_EQ(Add(1, LLONG_MAX, 0, 0), NCF_E_FAIL);
}

TEST_F(TimecodeTest, ThePhysicalNumbersAnswerIsIgnored) {
    aaf.refuse("SourceMob1Slot1.SetPhysicalNum");
    EXPECT_EQ(Add(0), NCF_OK);
}

struct FailedStep {
    const char* call;
    const char* message;
    NCFRESULT result;
};

void PrintTo(const FailedStep& step, std::ostream* to) {
    *to << step.call;
}

class TimecodeFailureTest : public TimecodeTest,
                            public ::testing::WithParamInterface<FailedStep> {};

TEST_P(TimecodeFailureTest, IsToldWithTheLibrarysResultAndHasACodeOfItsOwn) {
    const FailedStep& step = GetParam();
    aaf.refuse(step.call, AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(1), step.result);
    EXPECT_TRUE(aaf.hasRefused());
    ASSERT_EQ(lines.lines().size(), 1u);
    EXPECT_EQ(lines.lines()[0].level, 1u);
    const std::string start =
        std::string(step.message) + ", AAFResult = 0x8012015e, QuickTimeToAAF(";
    EXPECT_EQ(lines.lines()[0].text.substr(0, start.size()), start);
    EXPECT_TRUE(
        log.returned(step.result,
                     "AddTimecode( pDictionary, movieEditRate, trackLabel, pMobSourceMob, nSlotID, "
                     "movieLength, maxLength, startTime, timecode, timecodeTrackNum)",
                     "NMA::Impl::AddTimecodeAAFTrack"));
}

INSTANTIATE_TEST_SUITE_P(
    EveryStep, TimecodeFailureTest,
    ::testing::Values(
        FailedStep{"ClassDefSequence1.CreateInstance", "Unable to create a new sequence",
                   NMA_E_AAF_CREATE},
        FailedStep{"Sequence1.Initialize", "Unable to initialize the sequence", NCF_E_FAIL},
        FailedStep{"ClassDefTimecode1.CreateInstance", "Unable to create a new component",
                   NMA_E_AAF_CREATE},
        FailedStep{"Timecode1.QueryInterface", "Unable to query timecode", NMA_E_AAF_QUERY},
        FailedStep{"Timecode1.Initialize", "Unable to initialize the timecode component",
                   NCF_E_FAIL},
        FailedStep{"Timecode1.SetDataDef", "Unable to set the component type", NMA_E_AAF_ADD},
        FailedStep{"Timecode1.SetLength", "Unable to set the timecode length", NMA_E_AAF_ADD},
        FailedStep{"Sequence1.AppendComponent", "Unable to add the component", NMA_E_AAF_ADD},
        FailedStep{"ClassDefFiller1.CreateInstance", "Unable to create a new filler",
                   NMA_E_AAF_CREATE},
        FailedStep{"Filler1.Initialize", "Unable to initialize the filler", NCF_E_FAIL},
        FailedStep{"Filler1.QueryInterface", "Unable to query component", NMA_E_AAF_QUERY},
        FailedStep{"Sequence1.PrependComponent", "Unable to add the component", NMA_E_AAF_ADD},
        FailedStep{"Filler2.Initialize", "Unable to initialize the filler", NCF_E_FAIL},
        FailedStep{"Filler2.QueryInterface", "Unable to query component", NMA_E_AAF_QUERY},
        FailedStep{"Sequence1.AppendComponent Filler2", "Unable to add the component",
                   NMA_E_AAF_ADD},
        FailedStep{"Sequence1.QueryInterface", "Unable to query the sequence", NMA_E_AAF_QUERY},
        FailedStep{"SourceMob1.AppendNewTimelineSlot", "Unable to add the timecode", NMA_E_AAF_ADD},
        FailedStep{"SourceMob1.LookupSlot", "Unable to lookup slot", NMA_E_AAF_ADD}));

TEST_F(TimecodeTest, APositiveAnswerCountsAsFailureToo) {
    aaf.refuse("Timecode1.SetLength", 1);
    EXPECT_EQ(Add(0), NMA_E_AAF_ADD);
    EXPECT_TRUE(lines.contains("Unable to set the timecode length, AAFResult = 0x1, "));
}

TEST_F(TimecodeTest, AThrownCodeIsReturnedAsItIs) {
    aaf.throwsRefusals = true;
    aaf.refuse("Sequence1.Initialize", AAFRESULT_NOMEMORY);
    EXPECT_EQ(Add(0), AAFRESULT_NOMEMORY);
    EXPECT_TRUE(lines.lines().empty());
}

TEST_F(TimecodeTest, AFailedLookUpIsAnUnknownException) {
    aaf.refuse("Dictionary.LookupDataDef");
    EXPECT_EQ(Add(0), NCF_E_UNEXPECTED);
    EXPECT_TRUE(lines.contains("Received an unknown exception, QuickTimeToAAF("));
    EXPECT_TRUE(log.once("NMA::Impl::AddTimecodeReceived an unknown exception"));
}

TEST_F(TimecodeTest, TheMobsIdIsAskedAndItsFailureCounts) {
    aaf.refuse("SourceMob1.GetMobID", AAFRESULT_NOT_OPEN);
    EXPECT_EQ(Add(0), AAFRESULT_NOT_OPEN);
    EXPECT_EQ(aaf.place("Sequence1"), -1);
}

}  // namespace
}  // namespace NMA::Impl
