// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/AAFTrack.h"

#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/MobIds.h"
#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

class AAFTrackTest : public AAFTest {
protected:
    AAFTrackTest() {
        fileMob->SetMobID(MobIdTemplate(0xB1));
        sourceMob->SetMobID(MobIdTemplate(0xA1));
        aaf.clearJournal();
    }
    NCFRESULT Add(ncfUInt32 slots, ncfUInt32 existing, aafPosition_t start = 0) {
        return AddAAFTrack(kAAFDataDef_LegacySound, L"A%d", slots, existing, existing, {25, 1}, 100,
                           Dictionary(), masterMob, As<IAAFMasterMob>(masterMob), fileMob,
                           As<IAAFSourceMob>(fileMob), sourceMob, As<IAAFSourceMob>(sourceMob),
                           start);
    }
    IAAFSmartPointer<IAAFMob> masterMob = Make<IAAFMob>("Master");
    IAAFSmartPointer<IAAFMob> fileMob = Make<IAAFMob>("File");
    IAAFSmartPointer<IAAFMob> sourceMob = Make<IAAFMob>("Source");
};

TEST_F(AAFTrackTest, ChainsOneSlotThroughTheThreeMobs) {
    ASSERT_EQ(Add(1, 2), NCF_OK);
    std::vector<std::string> calls = aaf.journal().lines();
    calls.erase(calls.begin(), calls.begin() + 3);  // the fixture's queries
    EXPECT_EQ(calls, (std::vector<std::string>{
                         "File1.GetMobID", "Source1.GetMobID",
                         "Dictionary.LookupDataDef 78E1EBE1-6CEF-11D2-807D-006008143E6F",
                         "Master1.NewPhysSourceRef 25/1 3 DataDef1 {B1 slot 3 at 0} 100",
                         "Master1.LookupSlot 3", "Master1Slot1.SetName ''",
                         "File1.NewPhysSourceRef 25/1 3 DataDef1 {A1 slot 3 at 0} 100",
                         "File1.LookupSlot 3", "File1Slot1.SetName ''",
                         "Source1.AddNilReference 3 12960000 DataDef1 25/1", "Source1.LookupSlot 3",
                         "Source1Slot1.SetName ''"}));
}

TEST_F(AAFTrackTest, NumbersSlotsWithoutAGap) {
    ASSERT_EQ(Add(6, 1), NCF_OK);
    for (int id = 2; id <= 7; ++id) {
        EXPECT_GE(aaf.place("Source1.AddNilReference " + std::to_string(id) + " "), 0) << id;
    }
    EXPECT_EQ(aaf.place("Source1.AddNilReference 8 "), -1);
}

TEST_F(AAFTrackTest, NoSlotsForNoChannels) {
    EXPECT_EQ(Add(0, 1), NCF_OK);
    EXPECT_EQ(aaf.place("Master1.NewPhysSourceRef"), -1);
}

TEST_F(AAFTrackTest, AStartTimeMovesTheReferencesApartAndLengthensTheFileMob) {
    ASSERT_EQ(Add(1, 0, 10), NCF_OK);
    EXPECT_TRUE(aaf.has("Master1.NewPhysSourceRef 25/1 1 DataDef1 {B1 slot 1 at 10} 100"));
    EXPECT_TRUE(aaf.has("File1.NewPhysSourceRef 25/1 1 DataDef1 {A1 slot 1 at -10} 110"));
}

// The number where the names begin has no part in the ids.
TEST_F(AAFTrackTest, TakesIdsFromTheSlotsThereAreNotFromTheStartOfTheNames) {
    ASSERT_EQ(AddAAFTrack(kAAFDataDef_LegacySound, L"A%d", 2, 40, 7, {25, 1}, 100, Dictionary(),
                          masterMob, As<IAAFMasterMob>(masterMob), fileMob,
                          As<IAAFSourceMob>(fileMob), sourceMob, As<IAAFSourceMob>(sourceMob), 0),
              NCF_OK);
    EXPECT_TRUE(aaf.has("Master1.NewPhysSourceRef 25/1 8 DataDef1 {B1 slot 8 at 0} 100"));
    EXPECT_TRUE(aaf.has("File1.NewPhysSourceRef 25/1 9 DataDef1 {A1 slot 9 at 0} 100"));
    EXPECT_TRUE(aaf.has("Source1.AddNilReference 9 12960000 DataDef1 25/1"));
}

TEST_F(AAFTrackTest, StartsGoBeyond32Bits) {
    ASSERT_EQ(Add(1, 0, 6000000000), NCF_OK);
    EXPECT_TRUE(aaf.has("Master1.NewPhysSourceRef 25/1 1 DataDef1 {B1 slot 1 at 6000000000} 100"));
    EXPECT_TRUE(
        aaf.has("File1.NewPhysSourceRef 25/1 1 DataDef1 {A1 slot 1 at -6000000000} 6000000100"));
}

TEST_F(AAFTrackTest, EveryRefusalComesBackUnchanged) {
    for (const char* call : {"File1.GetMobID", "Source1.GetMobID", "Dictionary.LookupDataDef",
                             "Master1.NewPhysSourceRef", "Master1.LookupSlot", "Master1Slot",
                             "File1.NewPhysSourceRef", "File1.LookupSlot", "File1Slot",
                             "Source1.AddNilReference", "Source1.LookupSlot", "Source1Slot"}) {
        aaf.clearRefusals();
        aaf.refuse(call, AAFRESULT_NOMEMORY);
        EXPECT_EQ(Add(1, 0), AAFRESULT_NOMEMORY) << call;
    }
}

TEST_F(AAFTrackTest, AnEmptyMobIsUnexpected) {
    fileMob = nullptr;
    EXPECT_EQ(AddAAFTrack(kAAFDataDef_LegacySound, L"A%d", 1, 0, 0, {25, 1}, 100, Dictionary(),
                          masterMob, nullptr, fileMob, nullptr, sourceMob, nullptr, 0),
              NCF_E_UNEXPECTED);
}

}  // namespace
}  // namespace NMA::Impl
