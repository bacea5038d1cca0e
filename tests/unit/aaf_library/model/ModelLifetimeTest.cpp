// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

// Leaks and early ends show under the address sanitizer; the counts here show
// that no reference is taken that a caller could see.
namespace {

using ModelLifetime = ModelFixture;

TEST_F(ModelLifetime, ObjectAloneKeepsItsDictionaryUsable) {
    const auto object = New(AUID_AAFMasterMob);
    model = nullptr;
    const auto held = Out(object, &IAAFObject::GetDictionary);
    aafUInt32 count = 0;
    EXPECT_EQ(held->CountDataDefs(&count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 11u);
}

TEST_F(ModelLifetime, DefinitionAloneKeepsItsModelUsable) {
    const auto definition = Out(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_Sound);
    model = nullptr;
    const auto object = As<IAAFObject>(definition);
    const auto classDef = Out(object, &IAAFObject::GetDefinition);
    aafBoolean_t concrete = kAAFFalse;
    EXPECT_EQ(classDef->IsConcrete(&concrete), AAFRESULT_SUCCESS);
    EXPECT_EQ(concrete, kAAFTrue);
}

TEST_F(ModelLifetime, ValueAloneKeepsItsTypeUsable) {
    const auto value = Int32Value(5);
    model = nullptr;
    const auto type = Out(value, &IAAFPropertyValue::GetType);
    EXPECT_EQ(Get(type, &IAAFTypeDef::GetTypeCategory), kAAFTypeCatInt);
}

TEST_F(ModelLifetime, UnregisteredTypeOutlivesItsHolderForTheSakeOfValues) {
    auto type = NewMeta<IAAFTypeDefInt>(AUID_AAFTypeDefInt);
    ASSERT_EQ(type->Initialize(kOwnId, 2, kAAFTrue, L"Own"), AAFRESULT_SUCCESS);
    aafInt16 number = -7;
    const auto value = Out(type, &IAAFTypeDefInt::CreateValue,
                           reinterpret_cast<aafMemPtr_t>(&number), sizeof number);
    type = nullptr;
    const auto again = As<IAAFTypeDefInt>(Out(value, &IAAFPropertyValue::GetType));
    aafInt16 read = 0;
    EXPECT_EQ(again->GetInteger(value.get(), reinterpret_cast<aafMemPtr_t>(&read), 2),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(read, -7);
}

TEST_F(ModelLifetime, TypeUsedBeforeItsRegistrationDoesNotHoldTheModelAfterwards) {
    auto type = NewMeta<IAAFTypeDefInt>(AUID_AAFTypeDefInt);
    ASSERT_EQ(type->Initialize(kOwnId, 2, kAAFTrue, L"Own"), AAFRESULT_SUCCESS);
    aafInt16 number = -7;
    Out(type, &IAAFTypeDefInt::CreateValue, reinterpret_cast<aafMemPtr_t>(&number), sizeof number);
    ASSERT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(type).get()), AAFRESULT_SUCCESS);
    // The model's own reference and the caller's.
    EXPECT_EQ(CountOf(type), 2u);
}

TEST_F(ModelLifetime, ContainedObjectOutlivesItsOwnerWhileHeld) {
    aaf::RefPtr<aaf::Object> mob = model->NewObject<aaf::Object>(AUID_AAFMasterMob);
    const aaf::RefPtr<aaf::Object> slot = model->NewObject<aaf::Object>(AUID_AAFTimelineMobSlot);
    ASSERT_EQ(mob->AppendObject(aaf::prop::Mob_Slots, slot->Identity()), AAFRESULT_SUCCESS);
    EXPECT_EQ(CountOf(slot), 2u);
    model = nullptr;
    mob = nullptr;
    EXPECT_EQ(CountOf(slot), 1u);
    EXPECT_EQ(slot->owner(), nullptr);
    IAAFDictionary* out = nullptr;
    ASSERT_EQ(slot->GetDictionary(&out), AAFRESULT_SUCCESS);
    out->Release();
}

TEST_F(ModelLifetime, HeldPartOfAFreeObjectKeepsOnlyTheModel) {
    aaf::RefPtr<aaf::Object> mob = model->NewObject<aaf::Object>(AUID_AAFMasterMob);
    mob->PutString(aaf::prop::Mob_Name, L"name");
    IAAFPropertyValue* value = nullptr;
    ASSERT_EQ(mob->GetPropertyValue(PropertyOf(AUID_AAFMob, aaf::prop::Mob_Name.id).get(), &value),
              AAFRESULT_SUCCESS);
    model = nullptr;
    mob = nullptr;
    aafUInt32 count = 0;
    IAAFTypeDef* type = nullptr;
    ASSERT_EQ(value->GetType(&type), AAFRESULT_SUCCESS);
    const auto text = As<IAAFTypeDefString>(Ptr<IAAFTypeDef>::Adopt(type));
    EXPECT_EQ(text->GetCount(value, &count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 5u);
    EXPECT_EQ(value->Release(), 0u);
}

TEST_F(ModelLifetime, LookUpsLeaveCountsAsTheyWere) {
    const auto type = Type(kAAFTypeID_Rational);
    const ULONG before = CountOf(type);
    for (int i = 0; i < 3; ++i) {
        Type(kAAFTypeID_Rational);
    }
    EXPECT_EQ(CountOf(type), before);
}

}  // namespace
