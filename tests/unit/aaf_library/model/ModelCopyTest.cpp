// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class ModelCopies : public ModelFixture {
protected:
    aaf::RefPtr<aaf::Model> target = aaf::Model::Create(Registry());
    aaf::RefPtr<aaf::Object> mob = model->NewObject<aaf::Object>(AUID_AAFMasterMob);
};

TEST_F(ModelCopies, ValuesAndContainedObjectsAreCopied) {
    mob->PutString(aaf::prop::Mob_Name, L"name");
    const auto slot = model->NewObject<aaf::Object>(AUID_AAFTimelineMobSlot);
    slot->PutInteger(aaf::prop::MobSlot_SlotID, 7);
    mob->AppendObject(aaf::prop::Mob_Slots, slot->Identity());
    const aaf::RefPtr<aaf::Object> copy = target->CopyObject(*mob);
    ASSERT_TRUE(copy);
    EXPECT_EQ(copy->model(), target.get());
    EXPECT_EQ(copy->StringOr(aaf::prop::Mob_Name, L""), L"name");
    ASSERT_EQ(copy->CountObjects(aaf::prop::Mob_Slots), 1u);
    const aaf::Object* copied = copy->ObjectAt(aaf::prop::Mob_Slots, 0);
    EXPECT_EQ(copied->IntegerOr(aaf::prop::MobSlot_SlotID, 0), 7);
    EXPECT_EQ(copied->owner(), copy.get());
    EXPECT_EQ(slot->owner(), mob.get());
}

TEST_F(ModelCopies, RegisteredPropertiesAndTypesComeAlong) {
    const auto record = NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord);
    const auto rational = Type(kAAFTypeID_Rational);
    IAAFTypeDef* types[] = {rational.get()};
    wchar_t member[] = L"X";
    aafString_t names[] = {member};
    aafUInt32 zero = 0;
    ASSERT_EQ(record->Initialize(kOwnId, types, names, 1, L"Box"), AAFRESULT_SUCCESS);
    ASSERT_EQ(record->RegisterMembers(&zero, 1, 8), AAFRESULT_SUCCESS);
    ASSERT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(record).get()), AAFRESULT_SUCCESS);
    ASSERT_EQ(Class(AUID_AAFMob)
                  ->RegisterOptionalPropertyDef(kOtherOwnId, L"Box", Type(kOwnId).get(), nullptr),
              AAFRESULT_SUCCESS);
    aafRational_t x{3, 4};
    ASSERT_EQ(mob->PutStruct({aaf::kNoPropertyId, kOtherOwnId}, x), AAFRESULT_SUCCESS);
    // Numbers differ from model to model.
    target->FindClass(AUID_AAFMPEGVideoDescriptor);
    const aaf::RefPtr<aaf::Object> copy = target->CopyObject(*mob);
    ASSERT_TRUE(copy);
    aafRational_t read{};
    EXPECT_EQ(copy->ReadStruct({aaf::kNoPropertyId, kOtherOwnId}, &read), AAFRESULT_SUCCESS);
    EXPECT_EQ(read.denominator, 4);
    EXPECT_NE(target->FindProperty(kOtherOwnId)->pid(), model->FindProperty(kOtherOwnId)->pid());
    EXPECT_EQ(target->FindType(kOwnId)->model(), target.get());
}

TEST_F(ModelCopies, DefinitionsThatAreReferredToComeAlong) {
    const auto own = model->NewObject<aaf::DataDefinition>(AUID_AAFDataDefinition);
    ASSERT_EQ(own->Initialize(kOwnId, L"Own", L"Own"), AAFRESULT_SUCCESS);
    ASSERT_EQ(dictionary->RegisterDataDef(own.get()), AAFRESULT_SUCCESS);
    const auto filler = model->NewObject<aaf::Object>(AUID_AAFFiller);
    ASSERT_EQ(filler->PutWeak(aaf::prop::Component_DataDefinition, own->Identity()),
              AAFRESULT_SUCCESS);
    const aaf::RefPtr<aaf::Object> copy = target->CopyObject(*filler);
    ASSERT_TRUE(copy);
    auto* definition =
        dynamic_cast<aaf::DataDefinition*>(copy->WeakTarget(aaf::prop::Component_DataDefinition));
    ASSERT_NE(definition, nullptr);
    EXPECT_EQ(definition->model(), target.get());
    EXPECT_EQ(definition->StringOr(aaf::prop::DefinitionObject_Name, L""), L"Own");
}

TEST_F(ModelCopies, OriginalMayGoBeforeTheCopy) {
    mob->PutString(aaf::prop::Mob_Name, L"name");
    const aaf::RefPtr<aaf::Object> copy = target->CopyObject(*mob);
    mob = nullptr;
    model = nullptr;
    target = nullptr;
    EXPECT_EQ(copy->StringOr(aaf::prop::Mob_Name, L""), L"name");
}

}  // namespace
