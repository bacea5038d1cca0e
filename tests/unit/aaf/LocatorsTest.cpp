// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/Locators.h"

#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

class LocatorsTest : public AAFTest {
protected:
    NCFRESULT Add() { return AddLocator(NMAString("\\media\\a clip.mov"), Dictionary(), essence); }

    IAAFSmartPointer<IAAFEssenceDescriptor> essence =
        Make<IAAFEssenceDescriptor>("ImportDescriptor");
};

TEST_F(LocatorsTest, CarryTheMoviesPathAsAFileUrl) {
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(
        aaf.journal().lines(),
        (std::vector<std::string>{
            "Dictionary.LookupClassDef NetworkLocator", "ClassDefNetworkLocator1.CreateInstance",
            "NetworkLocator1.QueryInterface D4F89061-69D6-11D2-841B-00600832ACB8",
            "NetworkLocator1.SetPath 'file:///media/a%20clip.mov'",
            "ImportDescriptor1.AppendLocator NetworkLocator1"}));
}

TEST_F(LocatorsTest, EveryRefusalComesBackUnchanged) {
    for (const char* call : {"ClassDefNetworkLocator1.CreateInstance", "NetworkLocator",
                             "ImportDescriptor1.AppendLocator"}) {
        aaf.clearRefusals();
        aaf.refuse(call, AAFRESULT_NOMEMORY);
        EXPECT_EQ(Add(), AAFRESULT_NOMEMORY) << call;
    }
    aaf.clearRefusals();
    EXPECT_EQ(Add(), NCF_OK);
}

TEST_F(LocatorsTest, AFailedLookUpIsUnexpected) {
    aaf.refuse("Dictionary.LookupClassDef");
    EXPECT_EQ(Add(), NCF_E_UNEXPECTED);
}

TEST_F(LocatorsTest, AnEmptyPathOrDictionaryIsAFailureNotACrash) {
    EXPECT_EQ(AddLocator(NMAString("\\a.mov"), nullptr, essence), NCF_E_UNEXPECTED);
    EXPECT_EQ(AddLocator(NMAString("\\a.mov"), Dictionary(), nullptr), NCF_E_UNEXPECTED);
}

class StartTimeTest : public AAFTest {
protected:
    StartTimeTest() {
        IAAFSmartPointer<IAAFDataDef> kind = Make<IAAFDataDef>("DataDef");
        const auto source = As<IAAFSourceMob>(mob);
        for (const aafSlotID_t id : {4u, 5u}) {
            aafSourceRef_t reference{};
            reference.sourceSlotID = id;
            reference.startTime = id;
            source->NewPhysSourceRef({25, 1}, id, kind, reference, 100);
        }
        aaf.clearJournal();
    }
    IAAFSmartPointer<IAAFMob> mob = Make<IAAFMob>("SourceMob");
};

TEST_F(StartTimeTest, IsAddedToEverySourceClip) {
    ASSERT_EQ(AddStartTimeToSourceClip(mob, 1000), NCF_OK);
    EXPECT_TRUE(aaf.has("SourceMob1Clip1.SetSourceReference {00 slot 4 at 1004}"));
    EXPECT_TRUE(aaf.has("SourceMob1Clip2.SetSourceReference {00 slot 5 at 1005}"));
}

TEST_F(StartTimeTest, GoesBeyond32Bits) {
    ASSERT_EQ(AddStartTimeToSourceClip(mob, 6000000000), NCF_OK);
    ASSERT_EQ(AddStartTimeToSourceClip(mob, 6000000000), NCF_OK);
    EXPECT_TRUE(aaf.has("SourceMob1Clip1.SetSourceReference {00 slot 4 at 6000000004}"));
    EXPECT_TRUE(aaf.has("SourceMob1Clip2.SetSourceReference {00 slot 5 at 12000000005}"));
}

TEST_F(StartTimeTest, TheLoopEndsAtAnyOtherAnswerOfTheEnumerator) {
    int enumerator = 0;
    for (const HRESULT answer : {AAFRESULT_INTERNAL_ERROR, HRESULT{1}}) {
        aaf.clearJournal();
        aaf.refuse("SlotEnumerator" + std::to_string(++enumerator) + ".NextOne", answer, 2);
        EXPECT_EQ(AddStartTimeToSourceClip(mob, 1000), NCF_OK);
        EXPECT_EQ(aaf.linesOf("SourceMob1Clip1.SetSourceReference").size(), 1u);
        EXPECT_EQ(aaf.place("SourceMob1Clip2.SetSourceReference"), -1);
    }
}

TEST_F(StartTimeTest, EveryOtherRefusalComesBackUnchanged) {
    for (const char* call :
         {"SourceMob1.GetSlots", "SourceMob1Slot1.GetSegment", "SourceMob1Clip1.QueryInterface",
          "SourceMob1Clip1.GetSourceReference", "SourceMob1Clip1.SetSourceReference"}) {
        aaf.clearRefusals();
        aaf.refuse(call, AAFRESULT_PROP_NOT_PRESENT);
        EXPECT_EQ(AddStartTimeToSourceClip(mob, 1), AAFRESULT_PROP_NOT_PRESENT) << call;
    }
}

}  // namespace
}  // namespace NMA::Impl
