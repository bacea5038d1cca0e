// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

using DictionaryOfAFile = ModelFixture;

TEST_F(DictionaryOfAFile, LookUpsOfUnknownIdsLeaveTheOutputAlone) {
    auto* classDef = reinterpret_cast<IAAFClassDef*>(this);
    auto* typeDef = reinterpret_cast<IAAFTypeDef*>(this);
    auto* dataDef = reinterpret_cast<IAAFDataDef*>(this);
    auto* container = reinterpret_cast<IAAFContainerDef*>(this);
    EXPECT_EQ(dictionary->LookupClassDef(kOwnId, &classDef), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(dictionary->LookupTypeDef(kOwnId, &typeDef), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(dictionary->LookupDataDef(kAAFDataDef_Unknown, &dataDef), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(dictionary->LookupContainerDef(kOwnId, &container), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(static_cast<void*>(classDef), this);
    EXPECT_EQ(static_cast<void*>(typeDef), this);
    EXPECT_EQ(static_cast<void*>(dataDef), this);
    EXPECT_EQ(static_cast<void*>(container), this);
}

TEST_F(DictionaryOfAFile, StartsWithTheBuiltInDefinitions) {
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountDataDefs), 11u);
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountContainerDefs), 93u);
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountCodecDefs), 0u);
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountOperationDefs), 0u);
}

TEST_F(DictionaryOfAFile, BuiltInDefinitionsHaveNameAndDescription) {
    const auto definition =
        As<IAAFDefObject>(Out(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_Picture));
    wchar_t text[40] = {};
    EXPECT_EQ(definition->GetName(text, sizeof text), AAFRESULT_SUCCESS);
    EXPECT_STREQ(text, L"DataDef_Picture");
    EXPECT_EQ(definition->GetDescription(text, sizeof text), AAFRESULT_SUCCESS);
    EXPECT_STREQ(text, L"Picture data");
    const auto container = Out(dictionary, &IAAFDictionary::LookupContainerDef,
                               ncfGuid("4313B571-D8BA-11D2-809B-006008143E6F"));
    EXPECT_EQ(As<IAAFDefObject>(container)->GetDescription(text, sizeof text), AAFRESULT_SUCCESS);
    EXPECT_STREQ(text, L"");
    aafBoolean_t identified = -1;
    EXPECT_EQ(container->EssenceIsIdentified(&identified), AAFRESULT_PROP_NOT_PRESENT);
}

TEST_F(DictionaryOfAFile, CreateInstanceAnswersByTheKindOfClass) {
    auto* out = reinterpret_cast<IUnknown*>(this);
    EXPECT_EQ(dictionary->CreateInstance(AUID_AAFMob, IID_IAAFObject, &out),
              AAFRESULT_ABSTRACT_CLASS);
    EXPECT_EQ(dictionary->CreateInstance(kOwnId, IID_IAAFObject, &out), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(dictionary->CreateInstance(AUID_AAFHeader, IID_IAAFObject, &out),
              AAFRESULT_INVALID_CLASS_ID);
    EXPECT_EQ(dictionary->CreateInstance(AUID_AAFDictionary, IID_IAAFObject, &out),
              AAFRESULT_INVALID_CLASS_ID);
    EXPECT_EQ(dictionary->CreateInstance(AUID_AAFContentStorage, IID_IAAFObject, &out),
              AAFRESULT_INVALID_CLASS_ID);
    EXPECT_EQ(dictionary->CreateInstance(AUID_AAFTypeDefRecord, IID_IAAFObject, &out),
              AAFRESULT_INVALID_CLASS_ID);
    EXPECT_EQ(static_cast<void*>(out), this);
    EXPECT_EQ(dictionary->CreateInstance(AUID_AAFMasterMob, IID_IAAFFile, &out),
              aaf::AAF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(dictionary->CreateInstance(AUID_AAFMasterMob, IID_IAAFObject, nullptr),
              AAFRESULT_NULL_PARAM);
}

TEST_F(DictionaryOfAFile, CreateMetaInstanceMakesTypesAndClassesOnly) {
    IUnknown* out = nullptr;
    EXPECT_EQ(dictionary->CreateMetaInstance(AUID_AAFMasterMob, IID_IAAFMetaDefinition, &out),
              AAFRESULT_INVALID_CLASS_ID);
    EXPECT_EQ(dictionary->CreateMetaInstance(AUID_AAFTypeDef, IID_IAAFTypeDef, &out),
              AAFRESULT_ABSTRACT_CLASS);
    EXPECT_EQ(dictionary->CreateMetaInstance(AUID_AAFTypeDefRecord, IID_IAAFTypeDef, nullptr),
              AAFRESULT_NULL_PARAM);
    const std::pair<aafUID_t, IID> kinds[] = {
        {AUID_AAFTypeDefInt, IID_IAAFTypeDefInt},
        {AUID_AAFTypeDefStrongObjRef, IID_IAAFTypeDefStrongObjRef},
        {AUID_AAFTypeDefWeakObjRef, IID_IAAFTypeDefWeakObjRef},
        {AUID_AAFTypeDefEnum, IID_IAAFTypeDefEnum},
        {AUID_AAFTypeDefFixedArray, IID_IAAFTypeDefFixedArray},
        {AUID_AAFTypeDefVariableArray, IID_IAAFTypeDefVariableArrayEx},
        {AUID_AAFTypeDefSet, IID_IAAFTypeDefSet},
        {AUID_AAFTypeDefString, IID_IAAFTypeDefString},
        {AUID_AAFTypeDefStream, IID_IAAFTypeDefStream3},
        {AUID_AAFTypeDefRecord, IID_IAAFTypeDefRecord},
        {AUID_AAFTypeDefRename, IID_IAAFTypeDefRename},
        {AUID_AAFTypeDefExtEnum, IID_IAAFTypeDefExtEnum},
        {AUID_AAFTypeDefIndirect, IID_IAAFTypeDefIndirect},
        {AUID_AAFTypeDefOpaque, IID_IAAFTypeDefOpaque},
        {AUID_AAFTypeDefCharacter, IID_IAAFTypeDefCharacter},
        {AUID_AAFClassDef, IID_IAAFClassDef},
    };
    for (const auto& kind : kinds) {
        ASSERT_EQ(dictionary->CreateMetaInstance(kind.first, kind.second, &out), AAFRESULT_SUCCESS);
        EXPECT_EQ(static_cast<IUnknown*>(out)->Release(), 0u);
    }
}

TEST_F(DictionaryOfAFile, SecondTypeWithAnIdIsAcceptedAndNotEntered) {
    aafUInt32 before = 0;
    aafUInt32 after = 0;
    const auto first = NewMeta<IAAFTypeDefInt>(AUID_AAFTypeDefInt);
    const auto second = NewMeta<IAAFTypeDefInt>(AUID_AAFTypeDefInt);
    ASSERT_EQ(first->Initialize(kOwnId, 4, kAAFTrue, L"Own"), AAFRESULT_SUCCESS);
    ASSERT_EQ(second->Initialize(kOwnId, 4, kAAFTrue, L"Own"), AAFRESULT_SUCCESS);
    ASSERT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(first).get()), AAFRESULT_SUCCESS);
    dictionary->CountTypeDefs(&before);
    EXPECT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(second).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(first).get()), AAFRESULT_SUCCESS);
    dictionary->CountTypeDefs(&after);
    EXPECT_EQ(before, after);
    EXPECT_EQ(Type(kOwnId).get(), As<IAAFTypeDef>(first).get());
    // Values of the second serve a property of the first.
    const auto mob = Class(AUID_AAFMob);
    ASSERT_EQ(mob->RegisterOptionalPropertyDef(kOtherOwnId, L"Own", Type(kOwnId).get(), nullptr),
              AAFRESULT_SUCCESS);
    aafInt32 number = 17;
    const auto value =
        Out(second, &IAAFTypeDefInt::CreateValue, reinterpret_cast<aafMemPtr_t>(&number), 4);
    const auto object = New(AUID_AAFMasterMob);
    EXPECT_EQ(object->SetPropertyValue(PropertyOf(AUID_AAFMob, kOtherOwnId).get(), value.get()),
              AAFRESULT_SUCCESS);
    number = 0;
    EXPECT_EQ(first->GetInteger(value.get(), reinterpret_cast<aafMemPtr_t>(&number), 4),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(number, 17);
}

TEST_F(DictionaryOfAFile, RegisterTypeDefNeedsAnInitialisedType) {
    EXPECT_EQ(dictionary->RegisterTypeDef(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->RegisterTypeDef(NewMeta<IAAFTypeDef>(AUID_AAFTypeDefInt).get()),
              AAFRESULT_NOT_INITIALIZED);
}

TEST_F(DictionaryOfAFile, ContainerDefinitionsRegisterOnce) {
    const auto own = As<IAAFContainerDef>(New(AUID_AAFContainerDefinition));
    ASSERT_EQ(own->Initialize(kOwnId, L"", L""), AAFRESULT_SUCCESS);
    EXPECT_EQ(dictionary->RegisterContainerDef(own.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(dictionary->RegisterContainerDef(own.get()), AAFRESULT_OBJECT_ALREADY_ATTACHED);
    const auto twin = As<IAAFContainerDef>(New(AUID_AAFContainerDefinition));
    ASSERT_EQ(twin->Initialize(kOwnId, L"Twin", L""), AAFRESULT_SUCCESS);
    EXPECT_EQ(dictionary->RegisterContainerDef(twin.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountContainerDefs), 94u);
    EXPECT_EQ(Out(dictionary, &IAAFDictionary::LookupContainerDef, kOwnId).get(), own.get());
    EXPECT_EQ(dictionary->RegisterContainerDef(nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(DictionaryOfAFile, DataDefinitionsRegisterTwiceInSilence) {
    const auto own = As<IAAFDataDef>(New(AUID_AAFDataDefinition));
    ASSERT_EQ(own->Initialize(kOwnId, L"Own", L"Own"), AAFRESULT_SUCCESS);
    EXPECT_EQ(dictionary->RegisterDataDef(own.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(dictionary->RegisterDataDef(own.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountDataDefs), 12u);
}

TEST_F(DictionaryOfAFile, DefinitionsMayBeInitialisedAnewButNeedADescription) {
    const auto own = As<IAAFDataDef>(New(AUID_AAFDataDefinition));
    EXPECT_EQ(own->Initialize(kOwnId, L"", nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(own->Initialize(kOwnId, L"", L""), AAFRESULT_SUCCESS);
    EXPECT_EQ(own->Initialize(kOtherOwnId, L"Other", L""), AAFRESULT_SUCCESS);
    aafUID_t id{};
    EXPECT_EQ(As<IAAFDefObject>(own)->GetAUID(&id), AAFRESULT_SUCCESS);
    EXPECT_TRUE(id == kOtherOwnId);
}

TEST_F(DictionaryOfAFile, SecondInterfaceIsTheSameDictionary) {
    IAAFDictionary2* second = nullptr;
    ASSERT_EQ(dictionary->QueryInterface(IID_IAAFDictionary2, reinterpret_cast<void**>(&second)),
              AAFRESULT_SUCCESS);
    IAAFDataDef* picture = nullptr;
    IAAFDataDef* again = nullptr;
    ASSERT_EQ(second->LookupPictureDataDef(&picture), AAFRESULT_SUCCESS);
    ASSERT_EQ(dictionary->LookupDataDef(kAAFDataDef_Picture, &again), AAFRESULT_SUCCESS);
    EXPECT_EQ(picture, again);
    picture->Release();
    again->Release();
    second->Release();
}

TEST_F(DictionaryOfAFile, OpaqueTypesAndForwardReferencesAreNotImplemented) {
    aafUInt32 count = 0;
    EXPECT_EQ(dictionary->CountOpaqueTypeDefs(&count), AAFRESULT_NOT_IMPLEMENTED);
    EXPECT_EQ(dictionary->CreateForwardClassReference(kOwnId), AAFRESULT_NOT_IMPLEMENTED);
}

TEST_F(DictionaryOfAFile, NullOutputsAreRefused) {
    EXPECT_EQ(dictionary->LookupClassDef(AUID_AAFMob, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->LookupTypeDef(kAAFTypeID_Int32, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->LookupDataDef(kAAFDataDef_Sound, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->GetClassDefs(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->GetTypeDefs(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->GetDataDefs(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->CountClassDefs(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->CountTypeDefs(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->CountDataDefs(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(dictionary->RegisterClassDef(nullptr), AAFRESULT_NULL_PARAM);
}

}  // namespace
