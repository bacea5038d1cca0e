// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class ObjectReferences : public ModelFixture {
protected:
    aaf::RefPtr<aaf::Object> Make(const aafUID_t& classId) {
        return model->NewObject<aaf::Object>(classId);
    }
    aaf::RefPtr<aaf::Object> MobNumber(unsigned char number) {
        const auto made = Make(AUID_AAFMasterMob);
        aafMobID_t id{};
        id.SMPTELabel[0] = number;
        made->PutStruct(aaf::prop::Mob_MobID, id);
        return made;
    }
    const aaf::PropertyKey& slots = aaf::prop::Mob_Slots;
    aaf::RefPtr<aaf::Object> mob = Make(AUID_AAFMasterMob);
    aaf::RefPtr<aaf::Object> slot = Make(AUID_AAFTimelineMobSlot);
};

TEST_F(ObjectReferences, AppendedObjectHasOneMoreReferenceAndAnOwner) {
    ASSERT_EQ(mob->AppendObject(slots, slot->Identity()), AAFRESULT_SUCCESS);
    EXPECT_EQ(CountOf(slot), 2u);
    EXPECT_EQ(slot->owner(), mob.get());
    EXPECT_EQ(mob->CountObjects(slots), 1u);
}

TEST_F(ObjectReferences, OwnedObjectIsRefusedByASecondOwner) {
    const auto other = Make(AUID_AAFMasterMob);
    ASSERT_EQ(mob->AppendObject(slots, slot->Identity()), AAFRESULT_SUCCESS);
    EXPECT_EQ(other->AppendObject(slots, slot->Identity()), AAFRESULT_OBJECT_ALREADY_ATTACHED);
    EXPECT_EQ(mob->AppendObject(slots, slot->Identity()), AAFRESULT_OBJECT_ALREADY_ATTACHED);
    EXPECT_FALSE(other->IsPresent(slots));
    EXPECT_EQ(CountOf(slot), 2u);
}

TEST_F(ObjectReferences, RemovedObjectIsFreeAgain) {
    const auto other = Make(AUID_AAFMasterMob);
    ASSERT_EQ(mob->AppendObject(slots, slot->Identity()), AAFRESULT_SUCCESS);
    ASSERT_EQ(mob->RemoveObjectAt(slots, 0), AAFRESULT_SUCCESS);
    EXPECT_EQ(CountOf(slot), 1u);
    EXPECT_EQ(other->AppendObject(slots, slot->Identity()), AAFRESULT_SUCCESS);
    EXPECT_EQ(mob->RemoveObjectAt(slots, 0), AAFRESULT_BADINDEX);
    EXPECT_EQ(mob->RemoveObject(slots, slot->Identity()), AAFRESULT_OBJECT_NOT_FOUND);
    EXPECT_EQ(other->RemoveObject(slots, slot->Identity()), AAFRESULT_SUCCESS);
}

TEST_F(ObjectReferences, VectorsKeepTheOrderOfInsertion) {
    const auto first = Make(AUID_AAFTimelineMobSlot);
    const auto middle = Make(AUID_AAFTimelineMobSlot);
    ASSERT_EQ(mob->AppendObject(slots, slot->Identity()), AAFRESULT_SUCCESS);
    ASSERT_EQ(mob->PrependObject(slots, first->Identity()), AAFRESULT_SUCCESS);
    ASSERT_EQ(mob->InsertObjectAt(slots, 1, middle->Identity()), AAFRESULT_SUCCESS);
    EXPECT_EQ(mob->ObjectAt(slots, 0), first.get());
    EXPECT_EQ(mob->ObjectAt(slots, 1), middle.get());
    EXPECT_EQ(mob->ObjectAt(slots, 2), slot.get());
    EXPECT_EQ(mob->ObjectAt(slots, 3), nullptr);
    EXPECT_EQ(mob->InsertObjectAt(slots, 4, Make(AUID_AAFTimelineMobSlot)->Identity()),
              AAFRESULT_BADINDEX);
    EXPECT_EQ(mob->AppendObject(slots, nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(ObjectReferences, ReplacedSingleObjectIsFreeAndTheSameOneIsRefused) {
    const auto one = Make(AUID_AAFFiller);
    const auto two = Make(AUID_AAFFiller);
    const aaf::PropertyKey& segment = aaf::prop::MobSlot_Segment;
    ASSERT_EQ(slot->PutObject(segment, one->Identity()), AAFRESULT_SUCCESS);
    EXPECT_EQ(slot->PutObject(segment, one->Identity()), AAFRESULT_OBJECT_ALREADY_ATTACHED);
    ASSERT_EQ(slot->PutObject(segment, two->Identity()), AAFRESULT_SUCCESS);
    EXPECT_EQ(one->owner(), nullptr);
    EXPECT_EQ(CountOf(one), 1u);
    EXPECT_EQ(slot->ObjectAt(segment), two.get());
    IAAFObject* out = nullptr;
    ASSERT_EQ(slot->ReadObject(segment, &out), AAFRESULT_SUCCESS);
    EXPECT_EQ(out->Release(), 2u);
}

TEST_F(ObjectReferences, ObjectOfAnotherFileIsRefused) {
    const aaf::RefPtr<aaf::Model> other = aaf::Model::Create(Registry());
    const auto stranger = other->NewObject<aaf::Object>(AUID_AAFTimelineMobSlot);
    EXPECT_EQ(mob->AppendObject(slots, stranger->Identity()), AAFRESULT_OBJECT_ALREADY_ATTACHED);
}

TEST_F(ObjectReferences, ObjectCannotContainItself) {
    const auto sequence = Make(AUID_AAFSequence);
    EXPECT_EQ(sequence->AppendObject(aaf::prop::Sequence_Components, sequence->Identity()),
              AAFRESULT_OBJECT_ALREADY_ATTACHED);
}

TEST_F(ObjectReferences, SetsAreOrderedByTheBytesOfTheirKeys) {
    const auto storage = Make(AUID_AAFContentStorage);
    const aaf::PropertyKey& mobs = aaf::prop::ContentStorage_Mobs;
    const auto high = MobNumber(200);
    const auto low = MobNumber(3);
    ASSERT_EQ(storage->AddToSet(mobs, high->Identity()), AAFRESULT_SUCCESS);
    ASSERT_EQ(storage->AddToSet(mobs, low->Identity()), AAFRESULT_SUCCESS);
    EXPECT_EQ(storage->ObjectAt(mobs, 0), low.get());
    EXPECT_EQ(storage->AddToSet(mobs, MobNumber(3)->Identity()), AAFRESULT_OBJECT_ALREADY_ATTACHED);
    const aaf::Bytes key = high->UniqueKey();
    EXPECT_EQ(key.size(), 32u);
    EXPECT_EQ(storage->FindInSet(mobs, key.data(), key.size()), high.get());
    aafMobID_t id{};
    low->PutStruct(aaf::prop::Mob_MobID, (id.SMPTELabel[0] = 250, id));
    storage->SortSet(mobs);
    EXPECT_EQ(storage->ObjectAt(mobs, 0), high.get());
}

TEST_F(ObjectReferences, WeakReferenceFindsTheDictionarysDefinition) {
    const auto filler = Make(AUID_AAFFiller);
    const auto sound = Out(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_Sound);
    IAAFDataDef* out = nullptr;
    EXPECT_EQ(filler->ReadWeak(aaf::prop::Component_DataDefinition, &out),
              AAFRESULT_PROP_NOT_PRESENT);
    const ULONG before = CountOf(sound);
    ASSERT_EQ(filler->PutWeak(aaf::prop::Component_DataDefinition, sound.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(CountOf(sound), before);
    ASSERT_EQ(filler->ReadWeak(aaf::prop::Component_DataDefinition, &out), AAFRESULT_SUCCESS);
    EXPECT_EQ(out, sound.get());
    out->Release();
}

TEST_F(ObjectReferences, WeakReferenceNeedsARegisteredTarget) {
    const auto filler = Make(AUID_AAFFiller);
    const auto free = As<IAAFDataDef>(New(AUID_AAFDataDefinition));
    ASSERT_EQ(free->Initialize(kOwnId, L"Own", L""), AAFRESULT_SUCCESS);
    EXPECT_EQ(filler->PutWeak(aaf::prop::Component_DataDefinition, free.get()),
              AAFRESULT_OBJECT_NOT_ATTACHED);
    EXPECT_EQ(filler->PutWeak(aaf::prop::Component_DataDefinition, nullptr), AAFRESULT_NULL_PARAM);
    // The test is by id: the like-named definition of another file passes, an unknown one does not.
    const aaf::RefPtr<aaf::Model> other = aaf::Model::Create(Registry());
    IAAFDataDef* foreign = nullptr;
    ASSERT_EQ(other->dictionary().LookupDataDef(kAAFDataDef_Sound, &foreign), AAFRESULT_SUCCESS);
    EXPECT_EQ(filler->PutWeak(aaf::prop::Component_DataDefinition, foreign), AAFRESULT_SUCCESS);
    foreign->Release();
    const auto own = other->NewObject<aaf::DataDefinition>(AUID_AAFDataDefinition);
    ASSERT_EQ(own->Initialize(kOwnId, L"Own", L""), AAFRESULT_SUCCESS);
    ASSERT_EQ(other->dictionary().RegisterDataDef(own.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(filler->PutWeak(aaf::prop::Component_DataDefinition, own->Identity()),
              AAFRESULT_INVALID_OBJ);
}

}  // namespace
