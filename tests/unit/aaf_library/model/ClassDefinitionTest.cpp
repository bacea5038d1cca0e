// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

using ClassDefinitions = ModelFixture;

TEST_F(ClassDefinitions, LookupSearchesParentsButNotSubclasses) {
    IAAFPropertyDef* out = nullptr;
    EXPECT_TRUE(PropertyOf(AUID_AAFCDCIDescriptor, aaf::prop::FileDescriptor_Length.id));
    EXPECT_EQ(Class(AUID_AAFFileDescriptor)
                  ->LookupPropertyDef(aaf::prop::CDCIDescriptor_ComponentWidth.id, &out),
              AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(Class(AUID_AAFMob)->LookupPropertyDef(kOwnId, &out), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(Class(AUID_AAFMob)->LookupPropertyDef(kOwnId, nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(ClassDefinitions, RequiredPropertiesAreThoseOfAllParentsAndTheOneAskedFor) {
    aaf::ClassDefinition& slots = *model->FindClass(AUID_AAFTimelineMobSlot);
    const auto idsWith = [&](const GUID& andThis) {
        std::vector<GUID> ids;
        for (const aaf::PropertyDefinition* property : slots.RequiredProperties(andThis)) {
            ids.push_back(property->id());
        }
        return ids;
    };
    const std::vector<GUID> required = {aaf::prop::TimelineMobSlot_EditRate.id,
                                        aaf::prop::TimelineMobSlot_Origin.id,
                                        aaf::prop::MobSlot_SlotID.id, aaf::prop::MobSlot_Segment.id,
                                        aaf::prop::InterchangeObject_ObjClass.id};
    EXPECT_EQ(idsWith(kOwnId), required);
    std::vector<GUID> withName = required;
    withName.insert(withName.begin() + 3, aaf::prop::MobSlot_SlotName.id);
    EXPECT_EQ(idsWith(aaf::prop::MobSlot_SlotName.id), withName);
}

TEST_F(ClassDefinitions, NewOptionalPropertyIsOptionalNotUniqueAndFound) {
    const auto type = Type(kAAFTypeID_Int32);
    const auto property = Out(Class(AUID_AAFMob), &IAAFClassDef::RegisterOptionalPropertyDef,
                              kOwnId, L"Own", type.get());
    aafBoolean_t optional = kAAFFalse;
    aafBoolean_t unique = kAAFTrue;
    wchar_t name[8] = {};
    EXPECT_EQ(property->GetIsOptional(&optional), AAFRESULT_SUCCESS);
    EXPECT_EQ(property->GetIsUniqueIdentifier(&unique), AAFRESULT_SUCCESS);
    EXPECT_EQ(property->GetName(name, sizeof name), AAFRESULT_SUCCESS);
    EXPECT_EQ(optional, kAAFTrue);
    EXPECT_EQ(unique, kAAFFalse);
    EXPECT_STREQ(name, L"Own");
    EXPECT_EQ(PropertyOf(AUID_AAFMasterMob, kOwnId).get(), property.get());
    EXPECT_EQ(Out(property, &IAAFPropertyDef::GetTypeDef).get(), type.get());
}

TEST_F(ClassDefinitions, OptionalPropertyMayBeRegisteredWithoutOutput) {
    EXPECT_EQ(
        Class(AUID_AAFMob)
            ->RegisterOptionalPropertyDef(kOwnId, L"Own", Type(kAAFTypeID_Int32).get(), nullptr),
        AAFRESULT_SUCCESS);
    EXPECT_TRUE(PropertyOf(AUID_AAFMob, kOwnId));
}

TEST_F(ClassDefinitions, SecondRegistrationOnTheSameClassIsRefusedAndTheFirstStays) {
    const auto type = Type(kAAFTypeID_Int32);
    const auto first = Out(Class(AUID_AAFMob), &IAAFClassDef::RegisterOptionalPropertyDef, kOwnId,
                           L"Own", type.get());
    IAAFPropertyDef* out = first.get();
    EXPECT_EQ(Class(AUID_AAFMob)->RegisterOptionalPropertyDef(kOwnId, L"Other", type.get(), &out),
              AAFRESULT_INVALID_PARAM);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(PropertyOf(AUID_AAFMob, kOwnId).get(), first.get());
}

TEST_F(ClassDefinitions, IdOfAnotherClassIsADuplicate) {
    const auto type = Type(kAAFTypeID_Int32);
    ASSERT_EQ(Class(AUID_AAFMob)->RegisterOptionalPropertyDef(kOwnId, L"Own", type.get(), nullptr),
              AAFRESULT_SUCCESS);
    for (const aafUID_t& other : {AUID_AAFMasterMob, AUID_AAFInterchangeObject, AUID_AAFFiller}) {
        EXPECT_EQ(Class(other)->RegisterOptionalPropertyDef(kOwnId, L"Own", type.get(), nullptr),
                  AAFRESULT_PROPERTY_DUPLICATE);
    }
    // Also that of a built-in class nobody has looked up yet.
    EXPECT_EQ(
        Class(AUID_AAFMob)
            ->RegisterOptionalPropertyDef(aaf::prop::Timecode_FPS.id, L"FPS", type.get(), nullptr),
        AAFRESULT_PROPERTY_DUPLICATE);
}

TEST_F(ClassDefinitions, MetaModelIsClosedButForRenamesAndExtendibleEnumerations) {
    const auto type = Type(kAAFTypeID_Int32);
    for (const aafUID_t& closed :
         {AUID_AAFMetaDefinition, AUID_AAFMetaDictionary, AUID_AAFClassDef, AUID_AAFPropertyDef,
          AUID_AAFTypeDef, AUID_AAFTypeDefRecord, AUID_AAFTypeDefOpaque}) {
        EXPECT_EQ(Class(closed)->RegisterOptionalPropertyDef(kOwnId, L"Own", type.get(), nullptr),
                  AAFRESULT_NOT_EXTENDABLE);
    }
    EXPECT_EQ(Class(AUID_AAFTypeDefRename)
                  ->RegisterOptionalPropertyDef(kOwnId, L"Own", type.get(), nullptr),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(Class(AUID_AAFTypeDefExtEnum)
                  ->RegisterOptionalPropertyDef(kOtherOwnId, L"Own", type.get(), nullptr),
              AAFRESULT_SUCCESS);
}

TEST_F(ClassDefinitions, TypeOfAPropertyMustBeRegistered) {
    const auto type = NewMeta<IAAFTypeDefInt>(AUID_AAFTypeDefInt);
    ASSERT_EQ(type->Initialize(kOwnId, 2, kAAFTrue, L"Own"), AAFRESULT_SUCCESS);
    EXPECT_EQ(Class(AUID_AAFMob)
                  ->RegisterOptionalPropertyDef(kOtherOwnId, L"Own", As<IAAFTypeDef>(type).get(),
                                                nullptr),
              AAFRESULT_NO_MORE_OBJECTS);
}

TEST_F(ClassDefinitions, PropertyIdMayEqualATypeId) {
    EXPECT_EQ(Class(AUID_AAFMob)
                  ->RegisterOptionalPropertyDef(kAAFTypeID_Int32, L"Own",
                                                Type(kAAFTypeID_Int32).get(), nullptr),
              AAFRESULT_SUCCESS);
    EXPECT_TRUE(Type(kAAFTypeID_Int32));
}

TEST_F(ClassDefinitions, PropertiesOfAKnownClassAreThereBeforeAnybodyAskedTheClassForThem) {
    EXPECT_EQ(model->FindProperty(aaf::prop::GPITrigger_ActiveState.id), nullptr);
    aaf::ClassDefinition* trigger = model->FindClass(AUID_AAFGPITrigger);
    aaf::PropertyDefinition* state = model->FindProperty(aaf::prop::GPITrigger_ActiveState.id);
    ASSERT_NE(state, nullptr);
    EXPECT_EQ(&state->owner(), trigger);
    EXPECT_EQ(state, trigger->FindProperty(aaf::prop::GPITrigger_ActiveState.pid));
    EXPECT_EQ(state->name(), L"ActiveState");
    EXPECT_TRUE(state->IsBuiltIn());
}

TEST_F(ClassDefinitions, BuiltInPropertiesComeInTheirOrderWhicheverWasLookedUpFirst) {
    aaf::ClassDefinition* mob = model->FindClass(AUID_AAFMob);
    ASSERT_NE(mob->FindProperty(aaf::prop::Mob_Slots.id), nullptr);
    mob->AddProperty(kOwnId, L"A", kAAFTypeID_Int32, true, false);
    EXPECT_TRUE(mob->IsExtended());
    const aaf::BuiltInClass* entry = aaf::FindBuiltInClass(AUID_AAFMob);
    ASSERT_EQ(mob->properties().size(), entry->properties.size() + 1);
    for (std::size_t i = 0; i < entry->properties.size(); ++i) {
        EXPECT_EQ(mob->properties()[i]->id(), entry->properties[i].key.id);
    }
    EXPECT_EQ(mob->properties().back()->id(), kOwnId);
    EXPECT_FALSE(model->FindClass(AUID_AAFMasterMob)->IsExtended());
}

TEST_F(ClassDefinitions, NumbersAreAllottedFromTheTopDownwards) {
    aaf::ClassDefinition* mob = model->FindClass(AUID_AAFMob);
    EXPECT_EQ(mob->AddProperty(kOwnId, L"A", kAAFTypeID_Int32, true, false).pid(), 0xFFFF);
    EXPECT_EQ(mob->AddProperty(kOtherOwnId, L"B", kAAFTypeID_Int32, true, false).pid(), 0xFFFE);
    aaf::ClassDefinition* mpeg = model->FindClass(AUID_AAFMPEGVideoDescriptor);
    EXPECT_EQ(mpeg->FindProperty(aaf::prop::MPEGVideoDescriptor_SingleSequence.id)->pid(), 0xFFFD);
}

TEST_F(ClassDefinitions, NullArgumentsAreRefused) {
    const auto mob = Class(AUID_AAFMob);
    const auto type = Type(kAAFTypeID_Int32);
    EXPECT_EQ(mob->RegisterOptionalPropertyDef(kOwnId, nullptr, type.get(), nullptr),
              AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->RegisterOptionalPropertyDef(kOwnId, L"Own", nullptr, nullptr),
              AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetPropertyDefs(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->CountPropertyDefs(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetName(nullptr, 0), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetNameBufLen(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetParent(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->IsConcrete(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->IsRoot(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->IsUniquelyIdentified(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetUniqueIdentifier(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->CreateInstance(IID_IAAFObject, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->RegisterNewPropertyDef(kOwnId, L"Own", type.get(), 2, kAAFFalse, nullptr),
              AAFRESULT_INVALID_ENUM_VALUE);
}

TEST_F(ClassDefinitions, NameNeedsRoomForItsZero) {
    aafUInt32 size = 0;
    wchar_t name[8] = {};
    const auto mob = Class(AUID_AAFMob);
    ASSERT_EQ(mob->GetNameBufLen(&size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, 4 * sizeof(wchar_t));
    EXPECT_EQ(mob->GetName(name, size - 1), AAFRESULT_SMALLBUF);
    EXPECT_EQ(mob->GetName(name, size), AAFRESULT_SUCCESS);
    EXPECT_STREQ(name, L"Mob");
}

TEST_F(ClassDefinitions, OwnClassIsMadeAfterRegistration) {
    const auto own = NewMeta<IAAFClassDef>(AUID_AAFClassDef);
    ASSERT_EQ(own->Initialize(kOwnId, Class(AUID_AAFTaggedValue).get(), L"Own", kAAFTrue),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(own->Initialize(kOwnId, Class(AUID_AAFTaggedValue).get(), L"Own", kAAFTrue),
              AAFRESULT_ALREADY_INITIALIZED);
    ASSERT_EQ(own->RegisterNewPropertyDef(kOtherOwnId, L"Needed", Type(kAAFTypeID_Int32).get(),
                                          kAAFFalse, kAAFFalse, nullptr),
              AAFRESULT_SUCCESS);
    IUnknown* out = nullptr;
    EXPECT_EQ(own->CreateInstance(IID_IAAFObject, &out), AAFRESULT_NO_MORE_OBJECTS);
    ASSERT_EQ(dictionary->RegisterClassDef(own.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(dictionary->RegisterClassDef(own.get()), AAFRESULT_SUCCESS);
    const auto made = New(kOwnId);
    EXPECT_EQ(Out(made, &IAAFObject::GetDefinition).get(), own.get());
    aafBoolean_t present = kAAFTrue;
    EXPECT_EQ(made->IsPropertyPresent(PropertyOf(kOwnId, kOtherOwnId).get(), &present),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(present, kAAFFalse);
}

TEST_F(ClassDefinitions, ForgottenClassGivesItsPropertyIdsBack) {
    auto own = NewMeta<IAAFClassDef>(AUID_AAFClassDef);
    ASSERT_EQ(own->Initialize(kOwnId, Class(AUID_AAFTaggedValue).get(), L"Own", kAAFTrue),
              AAFRESULT_SUCCESS);
    ASSERT_EQ(own->RegisterOptionalPropertyDef(kOtherOwnId, L"Own", Type(kAAFTypeID_Int32).get(),
                                               nullptr),
              AAFRESULT_SUCCESS);
    EXPECT_TRUE(model->HasProperty(kOtherOwnId));
    own = nullptr;
    EXPECT_FALSE(model->HasProperty(kOtherOwnId));
}

TEST_F(ClassDefinitions, UniqueIdentifierIsInherited) {
    aafBoolean_t unique = kAAFFalse;
    EXPECT_EQ(Class(AUID_AAFMasterMob)->IsUniquelyIdentified(&unique), AAFRESULT_SUCCESS);
    EXPECT_EQ(unique, kAAFTrue);
    EXPECT_EQ(Class(AUID_AAFFiller)->IsUniquelyIdentified(&unique), AAFRESULT_SUCCESS);
    EXPECT_EQ(unique, kAAFFalse);
}

}  // namespace
