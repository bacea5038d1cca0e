// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

using Slot = TransientFile;
using SourceMob = TransientFile;

namespace {

std::wstring NameOf(IAAFMobSlot* slot) {
    return TextOf<IAAFMobSlot>(slot, &IAAFMobSlot::GetNameBufLen, &IAAFMobSlot::GetName);
}

}  // namespace

TEST_F(Slot, StartsWithoutNameNumberAndSegment) {
    Ptr<IAAFTimelineMobSlot> timeline = Make<IAAFTimelineMobSlot>(AUID_AAFTimelineMobSlot);
    Ptr<IAAFMobSlot> slot = As<IAAFMobSlot>(timeline);
    aafUInt32 number = 9;
    aafRational_t rate{9, 9};
    wchar_t name[4];
    Ptr<IAAFSegment> segment;
    Ptr<IAAFDataDef> dataDef;
    EXPECT_EQ(0u, Get(slot, &IAAFMobSlot::GetSlotID));
    EXPECT_EQ(AAFRESULT_SUCCESS, timeline->GetEditRate(&rate));
    EXPECT_EQ(0, rate.numerator);
    EXPECT_EQ(0, rate.denominator);
    EXPECT_EQ(0, Get(timeline, &IAAFTimelineMobSlot::GetOrigin));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, slot->GetName(name, sizeof name));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, slot->GetPhysicalNum(&number));
    EXPECT_EQ(AAFRESULT_NULLOBJECT, slot->GetSegment(segment.Out()));
    EXPECT_EQ(AAFRESULT_NULLOBJECT, slot->GetDataDef(dataDef.Out()));
}

TEST_F(Slot, TakesAnyPhysicalNumberAndName) {
    Ptr<IAAFMobSlot> slot = Make<IAAFMobSlot>(AUID_AAFTimelineMobSlot);
    EXPECT_EQ(AAFRESULT_SUCCESS, slot->SetPhysicalNum(0xFFFFFFFF));
    EXPECT_EQ(0xFFFFFFFFu, Get(slot, &IAAFMobSlot::GetPhysicalNum));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, slot->SetName(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, slot->SetName(L""));
    EXPECT_EQ(L"", NameOf(slot));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, slot->GetPhysicalNum(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, slot->GetSlotID(nullptr));
}

TEST_F(Slot, GivesTheStoredSegmentItself) {
    Ptr<IAAFMobSlot> slot = Make<IAAFMobSlot>(AUID_AAFTimelineMobSlot);
    Ptr<IAAFSourceClip> clip = Clip(5);
    Ptr<IAAFSegment> segment = As<IAAFSegment>(clip);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, slot->SetSegment(nullptr));
    ASSERT_EQ(AAFRESULT_SUCCESS, slot->SetSegment(segment));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, slot->SetSegment(segment));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED,
              Make<IAAFMobSlot>(AUID_AAFTimelineMobSlot)->SetSegment(segment));
    Ptr<IAAFSegment> found = Get(slot, &IAAFMobSlot::GetSegment);
    EXPECT_EQ(segment.get(), found.get());
    Ptr<IAAFDataDef> dataDef = Get(slot, &IAAFMobSlot::GetDataDef);
    EXPECT_EQ(DataDef(kAAFDataDef_LegacyPicture).get(), dataDef.get());
    ASSERT_EQ(AAFRESULT_SUCCESS, slot->SetSegment(As<IAAFSegment>(Clip(6))));
    EXPECT_EQ(AAFRESULT_SUCCESS, Make<IAAFMobSlot>(AUID_AAFTimelineMobSlot)->SetSegment(segment));
}

TEST_F(Slot, HasMarksThatAreAbsentAtFirst) {
    Ptr<IAAFTimelineMobSlot2> slot = Make<IAAFTimelineMobSlot2>(AUID_AAFTimelineMobSlot);
    aafPosition_t at = 0;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, slot->GetMarkIn(&at));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, slot->GetMarkOut(&at));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, slot->GetUserPos(&at));
    EXPECT_EQ(AAFRESULT_SUCCESS, slot->SetMarkIn(-1));
    EXPECT_EQ(AAFRESULT_SUCCESS, slot->SetMarkOut(2));
    EXPECT_EQ(AAFRESULT_SUCCESS, slot->SetUserPos(3));
    EXPECT_EQ(-1, Get(slot, &IAAFTimelineMobSlot2::GetMarkIn));
    EXPECT_EQ(2, Get(slot, &IAAFTimelineMobSlot2::GetMarkOut));
    EXPECT_EQ(3, Get(slot, &IAAFTimelineMobSlot2::GetUserPos));
}

TEST_F(SourceMob, HasNoDescriptorAtFirst) {
    Ptr<IAAFSourceMob> mob = Make<IAAFSourceMob>(AUID_AAFSourceMob);
    Ptr<IAAFEssenceDescriptor> descriptor = Get(mob, &IAAFSourceMob::GetEssenceDescriptor);
    EXPECT_EQ(nullptr, descriptor.get());
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->GetEssenceDescriptor(nullptr));
}

TEST_F(SourceMob, ReplacesItsDescriptorAndFreesTheOldOne) {
    Ptr<IAAFSourceMob> mob = Make<IAAFSourceMob>(AUID_AAFSourceMob);
    Ptr<IAAFSourceMob> other = Make<IAAFSourceMob>(AUID_AAFSourceMob);
    Ptr<IAAFEssenceDescriptor> first = Make<IAAFEssenceDescriptor>(AUID_AAFCDCIDescriptor);
    Ptr<IAAFEssenceDescriptor> second = Make<IAAFEssenceDescriptor>(AUID_AAFImportDescriptor);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->SetEssenceDescriptor(nullptr));
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->SetEssenceDescriptor(first));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, mob->SetEssenceDescriptor(first));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, other->SetEssenceDescriptor(first));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetEssenceDescriptor(second));
    EXPECT_EQ(AAFRESULT_SUCCESS, other->SetEssenceDescriptor(first));
    Ptr<IAAFEssenceDescriptor> found = Get(mob, &IAAFSourceMob::GetEssenceDescriptor);
    EXPECT_EQ(second.get(), found.get());
}

TEST_F(SourceMob, AppendsNilReferencesAlsoUnderOneId) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(mob);
    Ptr<IAAFDataDef> sound = DataDef(kAAFDataDef_LegacySound);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, source->AddNilReference(1, 5, nullptr, {25, 1}));
    EXPECT_EQ(AAFRESULT_BADRATE, source->AddNilReference(1, 5, sound, {25, 0}));
    EXPECT_EQ(AAFRESULT_SUCCESS, source->AddNilReference(1, 12960000, sound, {25, 1}));
    EXPECT_EQ(AAFRESULT_SUCCESS, source->AddNilReference(1, -5, sound, {25, 1}));
    EXPECT_EQ(2u, Get(mob, &IAAFMob::CountSlots));

    Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, 1);
    EXPECT_EQ(L"Test", NameOf(slot));
    EXPECT_EQ(0, Get(As<IAAFTimelineMobSlot>(slot), &IAAFTimelineMobSlot::GetOrigin));
    Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
    aafSourceRef_t reference{MobId(1), 1, 1};
    aafLength_t length = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceClip>(segment)->GetSourceReference(&reference));
    EXPECT_TRUE(SameMobId(aafMobID_t{}, reference.sourceID));
    EXPECT_EQ(0u, reference.sourceSlotID);
    EXPECT_EQ(0, reference.startTime);
    EXPECT_EQ(12960000, Get(As<IAAFComponent>(segment), &IAAFComponent::GetLength));
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->GetSlotAt(1, slot.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, slot->GetSegment(segment.Out()));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, As<IAAFComponent>(segment)->GetLength(&length));
}

TEST_F(SourceMob, PutsNewReferencesIntoSlotsOldOrNew) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(mob);
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    const aafSourceRef_t reference{MobId(3), 4, 5};
    EXPECT_EQ(AAFRESULT_NULL_PARAM, source->NewPhysSourceRef({25, 1}, 7, nullptr, reference, 10));
    // The rate is not checked and the target need not exist.
    EXPECT_EQ(AAFRESULT_SUCCESS, source->NewPhysSourceRef({30, 0}, 7, picture, reference, 10));
    Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, 7);
    EXPECT_EQ(L"ASlot", NameOf(slot));
    slot->SetName(L"mine");

    EXPECT_EQ(AAFRESULT_SUCCESS, source->NewPhysSourceRef({25, 1}, 7, picture, reference, 20));
    aafRational_t rate{};
    EXPECT_EQ(1u, Get(mob, &IAAFMob::CountSlots));
    EXPECT_EQ(L"mine", NameOf(slot));
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFTimelineMobSlot>(slot)->GetEditRate(&rate));
    EXPECT_EQ(30, rate.numerator);
    Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
    EXPECT_EQ(20, Get(As<IAAFComponent>(segment), &IAAFComponent::GetLength));
    aafSourceRef_t found{};
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceClip>(segment)->GetSourceReference(&found));
    EXPECT_TRUE(SameMobId(MobId(3), found.sourceID));
    EXPECT_EQ(4u, found.sourceSlotID);
    EXPECT_EQ(5, found.startTime);
}

TEST_F(SourceMob, RefusesADataDefinitionThatTheDictionaryLacks) {
    Ptr<IAAFDataDef> unknown = Make<IAAFDataDef>(AUID_AAFDataDef);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              unknown->Initialize(ncfGuid("ABCDEF00-0000-0000-0000-000000000001"), L"n", L"d"));
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS,
              Make<IAAFMasterMob>(AUID_AAFMasterMob)
                  ->NewPhysSourceRef({25, 1}, 1, unknown, aafSourceRef_t{}, 10));
}

TEST_F(SourceMob, AppendsToSequencesOnly) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(mob);
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    EXPECT_EQ(AAFRESULT_SUCCESS,
              source->AppendPhysSourceRef({25, 1}, 1, picture, aafSourceRef_t{}, 10));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED,
              source->AppendPhysSourceRef({25, 1}, 1, picture, aafSourceRef_t{}, 10));
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    sequence->Initialize(picture);
    Ptr<IAAFTimelineMobSlot> slot;
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(sequence), 2,
                                                            L"", 0, slot.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS,
              source->AppendPhysSourceRef({25, 1}, 2, picture, aafSourceRef_t{}, 10));
    EXPECT_EQ(1u, Get(sequence, &IAAFSequence::CountComponents));
}

TEST_F(SourceMob, AppendsSlotsOfTimecodeAndEdgecode) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(mob);
    aafUInt8 header[8] = {'A', 'B'};
    EXPECT_EQ(AAFRESULT_INVALID_TIMECODE,
              source->AppendTimecodeSlot({25, 1}, 1, aafTimecode_t{0, 2, 25}, 100));
    EXPECT_EQ(AAFRESULT_SUCCESS,
              source->AppendTimecodeSlot({25, 1}, 1, aafTimecode_t{0, 0, 25}, 100));
    EXPECT_EQ(AAFRESULT_SUCCESS,
              source->AppendEdgecodeSlot({24, 1}, 2, 5, 100, kAAFFt35MM, kAAFEtKeycode, header));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE,
              source->AppendEdgecodeSlot({24, 1}, 2, 5, 100, 5, kAAFEtKeycode, header));
    for (const aafEdgeType_t odd : {-1, 4, 7, 9}) {
        EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE,
                  source->AppendEdgecodeSlot({24, 1}, 2, 5, 100, kAAFFt35MM, odd, nullptr));
        EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE,
                  Make<IAAFEdgecode>(AUID_AAFEdgecode)->Initialize(100, {5, kAAFFt35MM, odd, {}}));
    }
    Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, 1);
    EXPECT_EQ(L"Timecode", NameOf(slot));
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->LookupSlot(2, slot.Out()));
    EXPECT_EQ(L"Edgecode", NameOf(slot));
    Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
    Ptr<IAAFComponent> only = Get(As<IAAFSequence>(segment), &IAAFSequence::GetComponentAt, 0u);
    aafEdgecode_t code{};
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFEdgecode>(only)->GetEdgecode(&code));
    EXPECT_EQ(5, code.startFrame);
    EXPECT_EQ(kAAFFt35MM, code.filmKind);
    EXPECT_EQ('B', code.header[1]);
}

TEST_F(SourceMob, ExtendsTheTimecodeAndEdgecodeThatASlotHas) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(mob);
    aafUInt8 header[8] = {};
    for (const aafFrameLength_t length : {100, 20}) {
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  source->AppendTimecodeSlot({25, 1}, 1, aafTimecode_t{length, 0, 25}, length));
        EXPECT_EQ(AAFRESULT_SUCCESS, source->AppendEdgecodeSlot({24, 1}, 2, 5, length, kAAFFt35MM,
                                                                kAAFEtKeycode, header));
    }
    EXPECT_EQ(2u, Get(mob, &IAAFMob::CountSlots));
    for (const aafSlotID_t id : {1u, 2u}) {
        Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, id);
        Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
        Ptr<IAAFSequence> sequence = As<IAAFSequence>(segment);
        EXPECT_EQ(2u, Get(sequence, &IAAFSequence::CountComponents));
        EXPECT_EQ(120, Get(As<IAAFComponent>(segment), &IAAFComponent::GetLength));
        aafUID_t kind{};
        As<IAAFDefObject>(Get(As<IAAFComponent>(segment), &IAAFComponent::GetDataDef))
            ->GetAUID(&kind);
        EXPECT_EQ(id == 1 ? kAAFDataDef_LegacyTimecode : kAAFDataDef_Edgecode, kind);
    }
    Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, 1u);
    Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
    Ptr<IAAFComponent> second = Get(As<IAAFSequence>(segment), &IAAFSequence::GetComponentAt, 1u);
    aafTimecode_t timecode{};
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFTimecode>(second)->GetTimecode(&timecode));
    EXPECT_EQ(20, timecode.startFrame);
    // Edgecode is no timecode, and a clip is no sequence.
    EXPECT_EQ(AAFRESULT_INVALID_DATADEF,
              source->AppendEdgecodeSlot({24, 1}, 1, 5, 9, kAAFFt35MM, kAAFEtKeycode, header));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              source->AddNilReference(3, 10, DataDef(kAAFDataDef_LegacyPicture), {25, 1}));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED,
              source->AppendTimecodeSlot({25, 1}, 3, aafTimecode_t{0, 0, 25}, 10));
}

TEST_F(SourceMob, IsReachedFromAMasterMob) {
    Ptr<IAAFMob> file = FileMob(1);
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    Ptr<IAAFMasterMob> master = As<IAAFMasterMob>(mob);
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    EXPECT_EQ(AAFRESULT_SLOT_NOT_FOUND,
              master->AddMasterSlot(picture, 2, As<IAAFSourceMob>(file), 5, L"V1"));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              master->AddMasterSlot(picture, 1, As<IAAFSourceMob>(file), 5, L"V1"));
    Ptr<IAAFMob> found;
    Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, 5);
    EXPECT_EQ(L"V1", NameOf(slot));
    Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
    Ptr<IAAFSourceClip> clip = As<IAAFSourceClip>(segment);
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, clip->ResolveRef(found.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_MOB_NOT_FOUND, clip->ResolveRef(found.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(file));
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->ResolveRef(found.Out()));
    EXPECT_EQ(file.get(), found.get());
    ASSERT_EQ(AAFRESULT_SUCCESS, file->GetSlotAt(0, slot.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, slot->GetSegment(segment.Out()));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, As<IAAFSourceClip>(segment)->ResolveRef(found.Out()));
}

}  // namespace aaf_test
