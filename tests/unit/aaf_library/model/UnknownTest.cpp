// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "not_implemented/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

using UnknownObjects = ModelFixture;

TEST_F(UnknownObjects, NewObjectHasOneReference) {
    EXPECT_EQ(CountOf(New(AUID_AAFMasterMob)), 1u);
}

TEST_F(UnknownObjects, BothFormsOfTheRootIdGiveOnePointerUnlikeAllOthers) {
    const auto definition = Out(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_Picture);
    void* zero = nullptr;
    void* usual = nullptr;
    void* fromOther = nullptr;
    ASSERT_EQ(definition->QueryInterface(IID_IUnknown_Zero, &zero), AAFRESULT_SUCCESS);
    ASSERT_EQ(definition->QueryInterface(IID_IUnknown_COM, &usual), AAFRESULT_SUCCESS);
    const auto object = As<IAAFObject>(definition);
    ASSERT_EQ(object->QueryInterface(IID_IUnknown_Zero, &fromOther), AAFRESULT_SUCCESS);
    EXPECT_EQ(zero, usual);
    EXPECT_EQ(zero, fromOther);
    EXPECT_NE(zero, static_cast<void*>(definition.get()));
    EXPECT_NE(zero, static_cast<void*>(object.get()));
    EXPECT_NE(zero, static_cast<void*>(As<IAAFDefObject>(definition).get()));
    for (int i = 0; i < 3; ++i) {
        static_cast<IUnknown*>(zero)->Release();
    }
}

TEST_F(UnknownObjects, SameInterfaceIsAlwaysTheSamePointer) {
    const auto object = New(AUID_AAFMasterMob);
    EXPECT_EQ(As<IAAFObject>(object).get(), object.get());
    EXPECT_EQ(Class(AUID_AAFMob).get(), Class(AUID_AAFMob).get());
    EXPECT_EQ(Type(kAAFTypeID_Int32).get(), Type(kAAFTypeID_Int32).get());
}

TEST_F(UnknownObjects, RefusedInterfaceGivesNullAndThePlatformsCode) {
    const auto object = New(AUID_AAFMasterMob);
    void* out = this;
    EXPECT_EQ(object->QueryInterface(IID_IAAFFile, &out), aaf::AAF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(object->QueryInterface(IID_IAAFObject, nullptr), aaf::AAF_E_INVALIDARG);
    EXPECT_EQ(CountOf(object), 1u);
#ifndef _WIN32
    EXPECT_EQ(static_cast<aafUInt32>(aaf::AAF_E_NOINTERFACE), 0x80000004u);
#endif
}

TEST_F(UnknownObjects, DataDefinitionAnswersItsWholeFamily) {
    const auto definition = Out(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_Sound);
    EXPECT_TRUE(As<IAAFDataDef2>(definition));
    EXPECT_TRUE(As<IAAFDataDef3>(definition));
    EXPECT_TRUE(As<IAAFDefObject>(definition));
    EXPECT_TRUE(As<IAAFObject>(definition));
}

TEST_F(UnknownObjects, ForeignObjectIsRefusedAndNotTouched) {
    struct Foreign final : aaf::NotImplemented<IAAFTypeDef> {
        HRESULT QueryInterface(REFIID, void** out) override {
            *out = nullptr;
            return aaf::AAF_E_NOINTERFACE;
        }
        ULONG AddRef() override { return ++references; }
        ULONG Release() override { return --references; }
        ULONG references = 1;
    } foreign;
    EXPECT_LT(dictionary->RegisterTypeDef(&foreign), 0);
    EXPECT_EQ(foreign.references, 1u);
}

}  // namespace
