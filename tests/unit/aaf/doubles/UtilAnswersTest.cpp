// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What a description asks the utility library and the retriever, and what it
// does with answers that the real ones never give.

#include <gmock/gmock.h>

#include <algorithm>

#include "source/aaf/MobIds.h"
#include "source/aaf/NewAAFFromMovie.h"
#include "tests/unit/aaf/doubles/UtilDouble.h"
#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

using ::testing::ElementsAre;

constexpr char kRoad[] = "NMA::Impl::NewAAFFromMovie";
constexpr char kTracks[] = "NMA::Impl::AddTracksToAAF";

class UtilAnswersTest : public AAFTest {
protected:
    UtilAnswersTest() {
        utilDouble = UtilDouble();
        utilDouble.journal = &journal;
        retrieverInit = NCF_OK;
        clip->videoTracks = 0;
        clip->timecode.resize(1);
        clip->content = {'a', 'b', 'c'};
        journal.clear();
    }
    ~UtilAnswersTest() override { utilDouble.journal = nullptr; }

    NCFRESULT Describe() {
        file = nullptr;
        return NewAAFFromMovie(Media(), Console(), &file, host.factory());
    }
    // What the journal holds of these functions.
    std::vector<std::string> Asked(const std::string& start) const {
        return journal.startingWith(start);
    }
    int Logged(NCFRESULT result, const std::string& statement, const char* function) const {
        return log.count(ReturnRecord(result, statement, function));
    }

    IAAFSmartPointer<IAAFFile> file;
};

TEST_F(UtilAnswersTest, TheNameIsAskedBetweenTheMobsAndTheEditorsSettings) {
    ASSERT_EQ(Describe(), NCF_OK);
    const auto& all = journal.lines();
    const auto name = std::find(all.begin(), all.end(), "NMASplitPath \\media\\a clip.mov");
    ASSERT_NE(name, all.end());
    EXPECT_LT(name, std::find(all.begin(), all.end(), "create editor settings"));
    EXPECT_TRUE(aaf.has("MasterMob1.SetName 'a name'"));
    EXPECT_TRUE(aaf.has("NetworkLocator1.SetPath 'a url'"));

    journal.clear();
    aaf.refuse("SourceMob4.Initialize");
    EXPECT_LT(Describe(), 0);
    EXPECT_THAT(Asked("NMASplitPath"), ElementsAre());
}

TEST_F(UtilAnswersTest, ARefusedNameEndsTheRoadBeforeTheEditorsSettings) {
    utilDouble.split = NCF_E_NOTFOUND;
    EXPECT_EQ(Describe(), NCF_E_NOTFOUND);
    EXPECT_EQ(
        Logged(NCF_E_NOTFOUND, "NMASplitPath(theMoviePathW.InArg(), clipName.OutArg())", kRoad), 1);
    EXPECT_THAT(Asked("create editor settings"), ElementsAre());
}

TEST_F(UtilAnswersTest, ARefusedUrlEndsTheLocator) {
    utilDouble.url = NCF_E_NOTFOUND;
    EXPECT_EQ(Describe(), NCF_E_NOTFOUND);
    EXPECT_EQ(Logged(NCF_E_NOTFOUND, "AddLocator(theMoviePathW, pDictionary, pEssenceDesc)", kRoad),
              1);
    EXPECT_EQ(aaf.place("ClassDefNetworkLocator1.CreateInstance"), -1);
}

TEST_F(UtilAnswersTest, TheContentGoesIntoTheDigestInOneCall) {
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_THAT(Asked("GenerateUMIDFromData"),
                ElementsAre("GenerateUMIDFromData_Begin", "GenerateUMIDFromData_AddData abc",
                            "GenerateUMIDFromData_Finish"));
}

TEST_F(UtilAnswersTest, ADigestThatFailsIsLoggedWithItsStatementAndEndsTheRoad) {
    const std::pair<NCFRESULT UtilDouble::*, const char*> statements[] = {
        {&UtilDouble::begin, "GenerateUMIDFromData_Begin(&UMIDGenState)"},
        {&UtilDouble::add,
         "GenerateUMIDFromData_AddData(&UMIDGenState, contentSize, (unsigned char*)pContent)"},
        {&UtilDouble::finish, "GenerateUMIDFromData_Finish(&UMIDGenState, &uid)"},
    };
    for (const auto& [answer, statement] : statements) {
        log.clear();
        utilDouble = UtilDouble();
        utilDouble.*answer = NCF_E_ABORT;
        EXPECT_EQ(Describe(), NCF_E_ABORT) << statement;
        EXPECT_EQ(Logged(NCF_E_ABORT, statement, "NMA::Impl::GenerateUID"), 1) << statement;
        EXPECT_EQ(Logged(NCF_E_ABORT,
                         "GenerateUID(media, &pContent[0], (ncfUInt32)pContent.size(), "
                         "fileMobID.material)",
                         kRoad),
                  1)
            << statement;
        EXPECT_EQ(aaf.place("MasterMob1.SetMobID"), -1);
    }
}

// The library frees its state in no other function.
TEST_F(UtilAnswersTest, ADigestThatTakesNoDataIsFinishedAllTheSame) {
    utilDouble.add = NCF_E_ABORT;
    aafUID_t uid = ncfGuid("99999999-9999-9999-9999-999999999999");
    EXPECT_EQ(GenerateUID(Media(), "abc", 3, uid), NCF_E_ABORT);
    EXPECT_THAT(Asked("GenerateUMIDFromData_Finish"), ElementsAre("GenerateUMIDFromData_Finish"));
    EXPECT_EQ(uid, ncfGuid("99999999-9999-9999-9999-999999999999"));

    journal.clear();
    utilDouble.begin = NCF_E_ABORT;
    EXPECT_EQ(GenerateUID(Media(), "abc", 3, uid), NCF_E_ABORT);
    EXPECT_THAT(Asked("GenerateUMIDFromData"), ElementsAre("GenerateUMIDFromData_Begin"));
}

TEST_F(UtilAnswersTest, ARealTrackCountsByItsOwnRateAndLastsByTheClipsWithoutDrop) {
    clip->rate = {30000, 1001};
    clip->timecode[0].metadata = {1, 2, 3, 4, 30000, 1001, 1, 25};
    utilDouble.frames = 1000;
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_THAT(Asked("ConvertTCToFrames"), ElementsAre("ConvertTCToFrames 1:2:3:4 at 25 drop"));
    EXPECT_THAT(Asked("GetMaxDuration"), ElementsAre("GetMaxDuration 30"));
    EXPECT_TRUE(aaf.has("Timecode1.Initialize 0 {0 drop 1 fps 30}"));
    EXPECT_TRUE(aaf.has("Timecode1.SetLength 5000"));
}

TEST_F(UtilAnswersTest, AMadeUpTrackCountsWithDropAndLastsWithout) {
    clip->timecode.clear();
    utilDouble.frames = 77;
    ASSERT_EQ(Describe(), NCF_OK);
    EXPECT_THAT(Asked("ConvertTCToFrames"), ElementsAre("ConvertTCToFrames 0:0:0:0 at 25 drop"));
    EXPECT_THAT(Asked("GetMaxDuration"), ElementsAre("GetMaxDuration 25"));
    EXPECT_TRUE(aaf.has("Timecode1.Initialize 0 {0 drop 0 fps 25}"));
    EXPECT_TRUE(aaf.has("Timecode2.Initialize 0 {77 drop 1 fps 25}"));
    EXPECT_TRUE(aaf.has("Filler2.Initialize DataDef1 4900"));
}

TEST_F(UtilAnswersTest, AMovieLongerThanTimecodeCanBeFailsByItsFiller) {
    clip->timecode.clear();
    utilDouble.maxDuration = 99;
    EXPECT_EQ(Describe(), NCF_E_FAIL);
    EXPECT_TRUE(aaf.has("Filler2.Initialize DataDef1 -1"));
}

TEST_F(UtilAnswersTest, TimecodeThatCannotBeCountedIsLoggedAndReturned) {
    utilDouble.convert = NCF_E_ABORT;
    EXPECT_EQ(Describe(), NCF_E_ABORT);
    EXPECT_EQ(Logged(NCF_E_ABORT,
                     "ConvertTCToFrames(tcInfo.hours, tcInfo.minutes, tcInfo.seconds, "
                     "tcInfo.frames, tcFPS, *((bool*)&tcInfo.drop), &tcInFrames)",
                     kTracks),
              1);
    EXPECT_EQ(aaf.place("Sequence1"), -1);
}

TEST_F(UtilAnswersTest, TheRetrieverIsStartedAfterTimecodeAndMustBeThere) {
    clip->videoTracks = 1;
    EXPECT_EQ(Describe(), NCF_E_FAIL);
    EXPECT_THAT(Asked("Init"), ElementsAre("Init FourCharMapper.xml AAFInfo.xml"));
    EXPECT_TRUE(
        log.once(std::string("NCFASSERT( QuickTimeToAAFInfoRetriever::GetInstance() )") + kTracks));
    EXPECT_GE(aaf.place("SourceMob2Slot1.SetPhysicalNum"), 0);
    EXPECT_EQ(aaf.place("MultipleDescriptor1.AppendFileDescriptor"), -1);

    retrieverInit = NCF_E_ABORT;
    EXPECT_EQ(Describe(), NCF_E_ABORT);
    EXPECT_EQ(Logged(NCF_E_ABORT,
                     "QuickTimeToAAFInfoRetriever::Init(pConsole, pComponentFactory, fourCharXML, "
                     "AAFInfoXML)",
                     kTracks),
              1);
}

}  // namespace
}  // namespace NMA::Impl
