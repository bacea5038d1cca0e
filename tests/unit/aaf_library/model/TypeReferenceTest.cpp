// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class ReferenceTypes : public ModelFixture {
protected:
    Ptr<IAAFTypeDefObjectRef> strong =
        TypeAs<IAAFTypeDefObjectRef>(kAAFTypeID_TaggedValueStrongReference);
    Ptr<IAAFTypeDefObjectRef> weak =
        TypeAs<IAAFTypeDefObjectRef>(kAAFTypeID_DataDefinitionWeakReference);
};

TEST_F(ReferenceTypes, ValueHoldsTheObjectWithoutOwningIt) {
    const auto object = New(AUID_AAFTaggedValue);
    auto value = Out(strong, &IAAFTypeDefObjectRef::CreateValue, object.get());
    EXPECT_EQ(CountOf(object), 2u);
    IUnknown* out = nullptr;
    ASSERT_EQ(strong->GetObject(value.get(), IID_IAAFObject, &out), AAFRESULT_SUCCESS);
    EXPECT_EQ(static_cast<void*>(out), static_cast<void*>(object.get()));
    out->Release();
    const auto other = New(AUID_AAFTaggedValue);
    ASSERT_EQ(strong->SetObject(value.get(), other.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(CountOf(object), 1u);
    value = nullptr;
    EXPECT_EQ(CountOf(other), 1u);
}

TEST_F(ReferenceTypes, ObjectOfAnotherClassIsRefused) {
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(strong->CreateValue(New(AUID_AAFFiller).get(), &out), AAFRESULT_BAD_TYPE);
    EXPECT_EQ(strong->CreateValue(Type(kAAFTypeID_Int32).get(), &out), AAFRESULT_INVALID_OBJ);
    EXPECT_EQ(strong->CreateValue(nullptr, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(strong->CreateValue(New(AUID_AAFTaggedValue).get(), nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(ReferenceTypes, WeakValueLeadsToTheDefinition) {
    const auto sound = Out(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_Sound);
    const auto value = Out(weak, &IAAFTypeDefObjectRef::CreateValue, sound.get());
    IUnknown* out = nullptr;
    ASSERT_EQ(weak->GetObject(value.get(), IID_IAAFDataDef, &out), AAFRESULT_SUCCESS);
    EXPECT_EQ(static_cast<void*>(out), static_cast<void*>(sound.get()));
    out->Release();
    IAAFPropertyValue* refused = nullptr;
    EXPECT_EQ(weak->CreateValue(New(AUID_AAFFiller).get(), &refused), AAFRESULT_BAD_TYPE);
}

TEST_F(ReferenceTypes, TypesTellTheClassOfTheirTarget) {
    EXPECT_EQ(Out(strong, &IAAFTypeDefObjectRef::GetObjectType).get(),
              Class(AUID_AAFTaggedValue).get());
    const auto own = NewMeta<IAAFTypeDefStrongObjRef>(AUID_AAFTypeDefStrongObjRef);
    EXPECT_EQ(own->Initialize(kOwnId, nullptr, L"Own"), AAFRESULT_NULL_PARAM);
    ASSERT_EQ(own->Initialize(kOwnId, Class(AUID_AAFFiller).get(), L"Own"), AAFRESULT_SUCCESS);
    EXPECT_EQ(Out(As<IAAFTypeDefObjectRef>(own), &IAAFTypeDefObjectRef::GetObjectType).get(),
              Class(AUID_AAFFiller).get());
}

}  // namespace
