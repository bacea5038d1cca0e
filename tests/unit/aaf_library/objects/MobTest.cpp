// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <cstring>

#include <chrono>

#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

using Mob = TransientFile;

TEST_F(Mob, StartsWithAFreshIdOfTheUsualLabel) {
    aafMobID_t first{};
    aafMobID_t second{};
    Make<IAAFMob>(AUID_AAFMasterMob)->GetMobID(&first);
    Make<IAAFMob>(AUID_AAFMasterMob)->GetMobID(&second);
    const aafUInt8 label[] = {0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01,
                              0x01, 0x01, 0x01, 0x01, 0x0F, 0x00};
    EXPECT_EQ(0, std::memcmp(label, first.SMPTELabel, sizeof label));
    EXPECT_EQ(0x13, first.length);
    EXPECT_EQ(0, first.instanceHigh);
    EXPECT_EQ(0, first.instanceMid);
    EXPECT_EQ(0, first.instanceLow);
    EXPECT_FALSE(SameMobId(first, second));
}

TEST_F(Mob, StartsWithTheTimeOfDayAndWithoutNameOrSlots) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    aafTimeStamp_t created{};
    aafTimeStamp_t modified{};
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetCreateTime(&created));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetModTime(&modified));
    EXPECT_GE(created.date.year, 2026);
    EXPECT_EQ(0, created.time.fraction);
    EXPECT_EQ(0, std::memcmp(&created, &modified, sizeof created));
    aafUInt32 length = 0;
    wchar_t name[8] = L"";
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->GetName(name, sizeof name));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->GetNameBufLen(&length));
    EXPECT_EQ(0u, Get(mob, &IAAFMob::CountSlots));
}

TEST_F(Mob, HasOneReferenceAndOneIdentity) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    EXPECT_EQ(1u, ReferencesOf(mob.get()));
    Ptr<IUnknown> ofMob = As<IUnknown>(mob);
    Ptr<IUnknown> ofMaster = As<IUnknown>(As<IAAFMasterMob>(mob));
    EXPECT_EQ(ofMob.get(), ofMaster.get());
    EXPECT_NE(static_cast<void*>(ofMob.get()), static_cast<void*>(mob.get()));
}

TEST_F(Mob, TakesAnyIdWhileItIsFree) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    aafMobID_t id{};
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetMobID(aafMobID_t{}));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetMobID(MobId(7)));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetMobID(&id));
    EXPECT_TRUE(SameMobId(MobId(7), id));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->GetMobID(nullptr));
}

TEST_F(Mob, TakesAnyNameButNone) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->SetName(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetName(L""));
    EXPECT_EQ(sizeof(aafCharacter), Get(mob, &IAAFMob::GetNameBufLen));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetName(L"\x00E4 \x20AC"));
    EXPECT_EQ(L"\x00E4 \x20AC", TextOf<IAAFMob>(mob, &IAAFMob::GetNameBufLen, &IAAFMob::GetName));
    wchar_t small[2];
    EXPECT_EQ(AAFRESULT_SMALLBUF, mob->GetName(small, sizeof small));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->GetName(nullptr, 100));
}

TEST_F(Mob, GivesNameAndTimesTogether) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    const aafTimeStamp_t time{{2020, 2, 29}, {1, 2, 3, 4}};
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->SetModTime(time));
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->SetCreateTime(time));
    aafTimeStamp_t modified{};
    aafTimeStamp_t created{};
    wchar_t name[8] = L"";
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->GetMobInfo(&modified, &created, name, sizeof name));
    mob->SetName(L"clip");
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetMobInfo(&modified, &created, name, sizeof name));
    EXPECT_STREQ(L"clip", name);
    EXPECT_EQ(0, std::memcmp(&time, &modified, sizeof time));
    EXPECT_EQ(0, std::memcmp(&time, &created, sizeof time));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->GetMobInfo(nullptr, &created, name, sizeof name));
}

TEST_F(Mob, InitializesAnyNumberOfTimes) {
    Ptr<IAAFMasterMob> master = Make<IAAFMasterMob>(AUID_AAFMasterMob);
    Ptr<IAAFSourceMob> source = Make<IAAFSourceMob>(AUID_AAFSourceMob);
    EXPECT_EQ(AAFRESULT_SUCCESS, master->Initialize());
    EXPECT_EQ(AAFRESULT_SUCCESS, master->Initialize());
    EXPECT_EQ(AAFRESULT_SUCCESS, source->Initialize());
    EXPECT_EQ(AAFRESULT_SUCCESS, source->Initialize());
}

TEST_F(Mob, IsOfOneKindOnly) {
    Ptr<IAAFMob> master = Make<IAAFMob>(AUID_AAFMasterMob);
    void* out = master.get();
#ifdef _WIN32
    const HRESULT refused = static_cast<HRESULT>(0x80004002u);
#else
    const HRESULT refused = static_cast<HRESULT>(0x80000004u);
#endif
    EXPECT_EQ(refused, master->QueryInterface(IID_IAAFSourceMob, &out));
    EXPECT_EQ(nullptr, out);
}

TEST_F(Mob, AppendsTimelineSlots) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    Ptr<IAAFSegment> segment = As<IAAFSegment>(Clip(5));
    Ptr<IAAFTimelineMobSlot> slot;
    EXPECT_EQ(AAFRESULT_NULL_PARAM,
              mob->AppendNewTimelineSlot({25, 1}, nullptr, 1, L"a", 0, slot.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM,
              mob->AppendNewTimelineSlot({25, 1}, segment, 1, nullptr, 0, slot.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM,
              mob->AppendNewTimelineSlot({25, 1}, segment, 1, L"a", 0, nullptr));
    // Neither rate nor origin nor id is checked.
    ASSERT_EQ(AAFRESULT_SUCCESS,
              mob->AppendNewTimelineSlot({1, 0}, segment, 0, L"name", -3, slot.Out()));
    EXPECT_EQ(2u, ReferencesOf(slot.get()));
    aafRational_t rate{};
    EXPECT_EQ(-3, Get(slot, &IAAFTimelineMobSlot::GetOrigin));
    EXPECT_EQ(AAFRESULT_SUCCESS, slot->GetEditRate(&rate));
    EXPECT_EQ(1, rate.numerator);
    EXPECT_EQ(0, rate.denominator);
    Ptr<IAAFMobSlot> plain = As<IAAFMobSlot>(slot);
    EXPECT_EQ(0u, Get(plain, &IAAFMobSlot::GetSlotID));
    EXPECT_EQ(L"name",
              TextOf<IAAFMobSlot>(plain, &IAAFMobSlot::GetNameBufLen, &IAAFMobSlot::GetName));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED,
              mob->AppendNewTimelineSlot({25, 1}, segment, 2, L"b", 0, slot.Out()));
    EXPECT_EQ(1u, Get(mob, &IAAFMob::CountSlots));
}

TEST_F(Mob, AppendsStaticAndEventSlots) {
    Ptr<IAAFMob2> mob = Make<IAAFMob2>(AUID_AAFMasterMob);
    Ptr<IAAFStaticMobSlot> fixed;
    Ptr<IAAFEventMobSlot> events;
    EXPECT_EQ(AAFRESULT_SUCCESS,
              mob->AppendNewStaticSlot(As<IAAFSegment>(Clip(5)), 1, L"still", fixed.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendNewEventSlot({25, 1}, As<IAAFSegment>(Clip(5)), 2,
                                                         L"events", 7, events.Out()));
    EXPECT_EQ(7, Get(As<IAAFEventMobSlot2>(events), &IAAFEventMobSlot2::GetEventSlotOrigin));
    aafRational_t rate{};
    EXPECT_EQ(AAFRESULT_SUCCESS, events->GetEditRate(&rate));
    EXPECT_EQ(25, rate.numerator);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, events->SetEditRate(nullptr));
}

TEST_F(Mob, FindsTheFirstSlotWithAnId) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    Ptr<IAAFTimelineMobSlot> first;
    Ptr<IAAFTimelineMobSlot> second;
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(Clip(1)), 4,
                                                            L"", 0, first.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(Clip(1)), 4,
                                                            L"", 0, second.Out()));
    Ptr<IAAFMobSlot> found = Get(mob, &IAAFMob::LookupSlot, 4);
    EXPECT_EQ(As<IAAFMobSlot>(first).get(), found.get());
    IAAFMobSlot* out = found;
    EXPECT_EQ(AAFRESULT_SLOT_NOT_FOUND, mob->LookupSlot(5, &out));
    EXPECT_EQ(nullptr, out);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->LookupSlot(4, nullptr));
}

TEST_F(Mob, FindsSlotsByTheIdsThatTheyHaveNow) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    const auto append = [&](aafSlotID_t id) {
        Ptr<IAAFTimelineMobSlot> slot;
        EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(Clip(1)),
                                                                id, L"", 0, slot.Out()));
        return As<IAAFMobSlot>(slot);
    };
    const auto found = [&](aafSlotID_t id) {
        Ptr<IAAFMobSlot> slot;
        mob->LookupSlot(id, slot.Out());
        return slot;
    };
    const Ptr<IAAFMobSlot> first = append(1);
    const Ptr<IAAFMobSlot> second = append(2);
    EXPECT_EQ(second.get(), found(2).get());

    // By the slot's own operation.
    EXPECT_EQ(AAFRESULT_SUCCESS, first->SetSlotID(2));
    EXPECT_EQ(first.get(), found(2).get());
    EXPECT_EQ(nullptr, found(1).get());

    // By its place in the list.
    const Ptr<IAAFMobSlot> third = append(3);
    EXPECT_EQ(third.get(), found(3).get());
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->RemoveSlotAt(0));
    EXPECT_EQ(second.get(), found(2).get());
    EXPECT_EQ(third.get(), found(3).get());
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->PrependSlot(first));
    EXPECT_EQ(first.get(), found(2).get());
    EXPECT_EQ(third.get(), found(3).get());

    // By the value that stands in the slot, and by another one in its stead.
    Ptr<IAAFClassDef> slots = Get(dictionary_, &IAAFDictionary::LookupClassDef, AUID_AAFMobSlot);
    const aafUID_t slotId = ncfGuid("01070101-0000-0000-060E-2B3401010102");
    Ptr<IAAFPropertyDef> property = Get(slots, &IAAFClassDef::LookupPropertyDef, slotId);
    Ptr<IAAFTypeDef> type = Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_UInt32);
    const Ptr<IAAFTypeDefInt> integers = As<IAAFTypeDefInt>(type);
    const Ptr<IAAFObject> object = As<IAAFObject>(first);
    aafUInt32 number = 7;
    Ptr<IAAFPropertyValue> value = Get(object, &IAAFObject::GetPropertyValue, property);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              integers->SetInteger(value, reinterpret_cast<aafMemPtr_t>(&number), sizeof number));
    EXPECT_EQ(first.get(), found(7).get());
    EXPECT_EQ(second.get(), found(2).get());
    number = 9;
    ASSERT_EQ(AAFRESULT_SUCCESS, integers->CreateValue(reinterpret_cast<aafMemPtr_t>(&number),
                                                       sizeof number, value.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, object->SetPropertyValue(property, value));
    EXPECT_EQ(first.get(), found(9).get());
    EXPECT_EQ(nullptr, found(7).get());
}

// A track of sound may claim tens of thousands of channels, each with a slot.
TEST_F(Mob, TakesAndFindsManySlotsInGoodTime) {
    constexpr aafSlotID_t kSlots = 20000;
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
    const Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(mob);
    const Ptr<IAAFDataDef> sound = DataDef(kAAFDataDef_LegacySound);
    const auto start = std::chrono::steady_clock::now();
    for (aafSlotID_t id = 1; id <= kSlots; ++id) {
        ASSERT_EQ(AAFRESULT_SUCCESS, source->AddNilReference(id, 10, sound, {25, 1}));
        Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, id);
        ASSERT_EQ(AAFRESULT_SUCCESS, slot->SetName(L""));
    }
    // Looking through all slots each time takes more than a minute.
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(20));
}

TEST_F(Mob, KeepsSlotsInOrderAndFreesRemovedOnes) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    Ptr<IAAFMobSlot> slots[3];
    for (aafSlotID_t id = 0; id < 3; ++id) {
        slots[id] = Make<IAAFMobSlot>(AUID_AAFTimelineMobSlot);
        slots[id]->SetSlotID(id);
    }
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->AppendSlot(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendSlot(slots[2]));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->PrependSlot(slots[0]));
    EXPECT_EQ(AAFRESULT_BADINDEX, mob->InsertSlotAt(3, slots[1]));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->InsertSlotAt(1, slots[1]));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, mob->AppendSlot(slots[1]));
    for (aafUInt32 at = 0; at < 3; ++at) {
        Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::GetSlotAt, at);
        EXPECT_EQ(slots[at].get(), slot.get());
    }
    Ptr<IAAFMobSlot> none;
    EXPECT_EQ(AAFRESULT_BADINDEX, mob->GetSlotAt(3, none.Out()));
    EXPECT_EQ(AAFRESULT_BADINDEX, mob->RemoveSlotAt(3));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->RemoveSlotAt(1));
    EXPECT_EQ(AAFRESULT_SUCCESS, Make<IAAFMob>(AUID_AAFMasterMob)->AppendSlot(slots[1]));
}

TEST_F(Mob, EnumeratesItsLiveListOfSlots) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    Ptr<IAAFMobSlot> slot;
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->GetSlots(nullptr));
    Ptr<IEnumAAFMobSlots> slots = Get(mob, &IAAFMob::GetSlots);
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, slots->NextOne(slot.Out()));
    mob->AppendSlot(Make<IAAFMobSlot>(AUID_AAFTimelineMobSlot));
    EXPECT_EQ(AAFRESULT_SUCCESS, slots->NextOne(slot.Out()));
    IAAFMobSlot* untouched = slot;
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, slots->NextOne(&untouched));
    EXPECT_EQ(slot.get(), untouched);
}

TEST_F(Mob, KeepsEveryCommentInOrderAlsoUnderOneName) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    Ptr<IEnumAAFTaggedValues> none;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->GetComments(none.Out()));
    wchar_t audio[] = L"Audio Format";
    wchar_t empty[] = L"";
    std::wstring longName(100, L'n');
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->AppendComment(nullptr, L"x"));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->AppendComment(audio, nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendComment(audio, L"LPCM"));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendComment(longName.data(), L"long"));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendComment(audio, L"AAC"));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendComment(empty, L""));
    EXPECT_EQ((Texts{{L"Audio Format", L"LPCM"},
                     {longName, L"long"},
                     {L"Audio Format", L"AAC"},
                     {L"", L""}}),
              Comments(mob));
    EXPECT_EQ(4u, Get(mob, &IAAFMob::CountComments));
}

TEST_F(Mob, StoresACommentAsATextWithItsEnd) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    wchar_t name[] = L"name";
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendComment(name, L"abc"));
    Ptr<IEnumAAFTaggedValues> all = Get(mob, &IAAFMob::GetComments);
    Ptr<IAAFTaggedValue> value = Get(all, &IEnumAAFTaggedValues::NextOne);
    EXPECT_EQ(4 * sizeof(aafCharacter), Get(value, &IAAFTaggedValue::GetValueBufLen));
    Ptr<IAAFTypeDef> type = Get(value, &IAAFTaggedValue::GetTypeDefinition);
    Ptr<IAAFTypeDef> text = Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_String);
    EXPECT_EQ(text.get(), type.get());
}

TEST_F(Mob, RemovesComments) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    Ptr<IAAFTaggedValue> foreign = Make<IAAFTaggedValue>(AUID_AAFTaggedValue);
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->RemoveComment(foreign));
    wchar_t name[] = L"name";
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendComment(name, L"abc"));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, mob->RemoveComment(foreign));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->RemoveComment(nullptr));
    Ptr<IEnumAAFTaggedValues> all = Get(mob, &IAAFMob::GetComments);
    Ptr<IAAFTaggedValue> value = Get(all, &IEnumAAFTaggedValues::NextOne);
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->RemoveComment(value));
    EXPECT_EQ(0u, Get(mob, &IAAFMob::CountComments));
}

TEST_F(Mob, KeepsAttributesAndRawData) {
    Ptr<IAAFMob2> mob = Make<IAAFMob2>(AUID_AAFMasterMob);
    Ptr<IEnumAAFTaggedValues> attributes;
    Ptr<IEnumAAFKLVData> raw;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->GetAttributes(attributes.Out()));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->GetKLVData(raw.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendAttribute(L"a", L"1"));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendAttribute(L"a", L"1"));
    EXPECT_EQ(2u, Get(mob, &IAAFMob2::CountAttributes));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetAttributes(attributes.Out()));

    Ptr<IAAFKLVData> data = Make<IAAFKLVData>(AUID_AAFKLVData);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->AppendKLVData(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendKLVData(data));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, mob->AppendKLVData(data));
    EXPECT_EQ(1u, Get(mob, &IAAFMob2::CountKLVData));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->RemoveKLVData(data));
}

TEST_F(Mob, ChangesReferencesInAllThatItHolds) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    Ptr<IAAFSourceClip> clip = Make<IAAFSourceClip>(AUID_AAFSourceClip);
    ASSERT_EQ(AAFRESULT_SUCCESS, clip->Initialize(DataDef(kAAFDataDef_LegacyPicture), 5,
                                                  aafSourceRef_t{MobId(1), 2, 3}));
    sequence->Initialize(DataDef(kAAFDataDef_LegacyPicture));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(As<IAAFComponent>(clip)));
    Ptr<IAAFTimelineMobSlot> slot;
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(sequence), 1,
                                                            L"", 0, slot.Out()));
    aafSourceRef_t reference{};
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->ChangeRef(MobId(8), MobId(9)));
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->GetSourceReference(&reference));
    EXPECT_TRUE(SameMobId(MobId(1), reference.sourceID));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->ChangeRef(MobId(1), MobId(9)));
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->GetSourceReference(&reference));
    EXPECT_TRUE(SameMobId(MobId(9), reference.sourceID));
    EXPECT_EQ(3, reference.startTime);
}

TEST_F(Mob, CopiesItselfIntoItsFileUnderAFreshId) {
    Ptr<IAAFMob> mob = FileMob(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    Ptr<IAAFMob> copy = Get(mob, &IAAFMob::Copy, L"twin");
    aafMobID_t id{};
    aafNumSlots_t mobs = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, copy->GetMobID(&id));
    EXPECT_FALSE(SameMobId(MobId(1), id));
    EXPECT_EQ(L"twin", TextOf<IAAFMob>(copy, &IAAFMob::GetNameBufLen, &IAAFMob::GetName));
    EXPECT_EQ(1u, Get(copy, &IAAFMob::CountSlots));
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kAAFFileMob, &mobs));
    EXPECT_EQ(2u, mobs);
}

TEST_F(Mob, OfACompositionHasDefaultFades) {
    Ptr<IAAFCompositionMob2> mob = Make<IAAFCompositionMob2>(AUID_AAFCompositionMob);
    aafDefaultFade_t fade{};
    EXPECT_EQ(AAFRESULT_NULL_PARAM, mob->Initialize(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->Initialize(L"edit"));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetDefaultFade(&fade));
    EXPECT_EQ(kAAFFalse, fade.valid);
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, mob->SetDefaultFade(4, 3, {25, 1}));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetDefaultFade(4, kAAFFadeLinearAmp, {25, 1}));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetDefaultFade(&fade));
    EXPECT_EQ(kAAFTrue, fade.valid);
    EXPECT_EQ(4, fade.fadeLength);
    EXPECT_EQ(25, fade.fadeEditUnit.numerator);
    aafMobID_t rendering{};
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->GetRendering(&rendering));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetRendering(MobId(4)));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetRendering(&rendering));
    EXPECT_TRUE(SameMobId(MobId(4), rendering));
}

TEST_F(Mob, AnswersNotImplementedToAccessOfEssence) {
    Ptr<IAAFMasterMob> master = Make<IAAFMasterMob>(AUID_AAFMasterMob);
    aafUInt16 channels = 0;
    EXPECT_EQ(AAFRESULT_NOT_IMPLEMENTED, master->CountChannels(1, nullptr, nullptr, &channels));
}

// The second of two mobs has a property whose id another class of the target has.
TEST_F(Mob, IsClonedWithAllThatItNeedsOrNotAtAll) {
    const aafUID_t own = ncfGuid("ABCDEF00-0000-0000-0000-000000000014");
    const auto add = [&](IAAFDictionary* dictionary, const aafUID_t& classId) {
        Ptr<IAAFPropertyDef> made;
        EXPECT_EQ(
            AAFRESULT_SUCCESS,
            Get(dictionary, &IAAFDictionary::LookupClassDef, classId)
                ->RegisterOptionalPropertyDef(
                    own, L"Own", Get(dictionary, &IAAFDictionary::LookupTypeDef, kAAFTypeID_Int32),
                    made.Out()));
        return made;
    };
    Ptr<IAAFMob> file = FileMob(2);
    Ptr<IAAFPropertyValue> value;
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFObject>(file)->CreateOptionalPropertyValue(
                                     add(dictionary_, AUID_AAFMob), value.Out()));
    Ptr<IAAFMob> other = FileMob(1);
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(other);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              source->NewPhysSourceRef({25, 1}, 2, DataDef(kAAFDataDef_LegacyPicture),
                                       {MobId(2), 1, 0}, 10));
    Ptr<IAAFEssenceData> essence = Make<IAAFEssenceData>(AUID_AAFEssenceData);
    ASSERT_EQ(AAFRESULT_SUCCESS, essence->Initialize(source));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(file));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(other));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddEssenceData(essence));

    Ptr<IAAFFile> target;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, target.Out()));
    add(Get(target, &IAAFFile::GetDictionary), AUID_AAFComponent);
    Ptr<IAAFHeader> header = Get(target, &IAAFFile::GetHeader);
    Ptr<IAAFMob> clone;
    aafNumSlots_t mobs = 0;
    EXPECT_EQ(AAFRESULT_INTERNAL_ERROR,
              other->CloneExternal(kAAFFollowDepend, kAAFIncludeMedia, target, clone.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, header->CountMobs(kAAFAllMob, &mobs));
    EXPECT_EQ(0u, mobs);
    EXPECT_EQ(0u, Get(header, &IAAFHeader::CountEssenceData));
    // Alone it can be had.
    EXPECT_EQ(AAFRESULT_SUCCESS,
              other->CloneExternal(kAAFNoFollowDepend, kAAFIncludeMedia, target, clone.Out()));
    EXPECT_EQ(1u, Get(header, &IAAFHeader::CountEssenceData));
}

// However long the way, it takes no more stack.
TEST_F(Mob, IsClonedWithAllMobsOfALongWay) {
    constexpr std::uint32_t kMobs = 15000;
    const auto idOf = [](std::uint32_t number) {
        aafMobID_t id = MobId(1);
        id.SMPTELabel[1] = static_cast<aafUInt8>(number >> 8);
        id.SMPTELabel[2] = static_cast<aafUInt8>(number);
        return id;
    };
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    for (std::uint32_t number = 0; number < kMobs; ++number) {
        Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
        ASSERT_EQ(AAFRESULT_SUCCESS, mob->SetMobID(idOf(number)));
        // The last one leads back to the first.
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  As<IAAFMasterMob>(mob)->NewPhysSourceRef({25, 1}, 1, picture,
                                                           {idOf((number + 1) % kMobs), 1, 0}, 10));
        ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    }
    Ptr<IAAFFile> target;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, target.Out()));
    Ptr<IAAFMob> clone;
    ASSERT_EQ(AAFRESULT_SUCCESS,
              Get(header_, &IAAFHeader::LookupMob, idOf(0))
                  ->CloneExternal(kAAFFollowDepend, kAAFNoIncludeMedia, target, clone.Out()));
    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, Get(target, &IAAFFile::GetHeader)->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(kMobs, count);
}

}  // namespace aaf_test
