// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class EnumerationTypes : public ModelFixture {
protected:
    Ptr<IAAFTypeDefEnum> siting = TypeAs<IAAFTypeDefEnum>(kAAFTypeID_ColorSitingType);
    Ptr<IAAFTypeDefExtEnum> usage = TypeAs<IAAFTypeDefExtEnum>(kAAFTypeID_UsageType);
};

TEST_F(EnumerationTypes, MembersHaveNamesAndValues) {
    const auto value = Out(siting, &IAAFTypeDefEnum::CreateValueFromName, L"UnknownSiting");
    aafInt64 number = 0;
    EXPECT_EQ(siting->GetIntegerValue(value.get(), &number), AAFRESULT_SUCCESS);
    EXPECT_EQ(number, 255);
    wchar_t name[20] = {};
    EXPECT_EQ(siting->GetNameFromInteger(4, name, sizeof name), AAFRESULT_SUCCESS);
    EXPECT_STREQ(name, L"Rec601");
    EXPECT_EQ(siting->GetNameFromValue(value.get(), name, sizeof name), AAFRESULT_SUCCESS);
    EXPECT_STREQ(name, L"UnknownSiting");
    aafUInt32 count = 0;
    EXPECT_EQ(siting->CountElements(&count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 6u);
}

TEST_F(EnumerationTypes, UnknownMembersAreIllegal) {
    const auto value = Out(siting, &IAAFTypeDefEnum::CreateValueFromName, L"Rec601");
    IAAFPropertyValue* out = nullptr;
    wchar_t name[20] = {};
    EXPECT_EQ(siting->CreateValueFromName(L"None", &out), AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(siting->SetIntegerValue(value.get(), 6), AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(siting->GetNameFromInteger(6, name, sizeof name), AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(siting->SetIntegerValue(value.get(), 2), AAFRESULT_SUCCESS);
    EXPECT_EQ(siting->CreateValueFromName(nullptr, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(siting->GetIntegerValue(value.get(), nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(EnumerationTypes, OwnEnumerationsAreMade) {
    const auto own = NewMeta<IAAFTypeDefEnum>(AUID_AAFTypeDefEnum);
    wchar_t one[] = L"One";
    aafString_t names[] = {one};
    aafInt64 values[] = {-1};
    EXPECT_EQ(own->Initialize(kOwnId, Type(kAAFTypeID_String).get(), values, names, 1, L"Own"),
              AAFRESULT_BAD_TYPE);
    ASSERT_EQ(own->Initialize(kOwnId, Type(kAAFTypeID_Int16).get(), values, names, 1, L"Own"),
              AAFRESULT_SUCCESS);
    const auto value = Out(own, &IAAFTypeDefEnum::CreateValueFromName, L"One");
    aafInt64 number = 0;
    EXPECT_EQ(own->GetIntegerValue(value.get(), &number), AAFRESULT_SUCCESS);
    EXPECT_EQ(number, -1);
    EXPECT_EQ(own->RegisterSize(3), AAFRESULT_BAD_SIZE);
}

// Programs name elements as their headers do, files without that prefix.
TEST_F(EnumerationTypes, ElementsAreFoundWithAndWithoutTheirPrefix) {
    const auto hint = TypeAs<IAAFTypeDefEnum>(kAAFTypeID_EditHintType);
    for (const wchar_t* name : {L"RelativeLeft", L"kAAFRelativeLeft"}) {
        const auto value = Out(hint, &IAAFTypeDefEnum::CreateValueFromName, name);
        aafInt64 number = 0;
        EXPECT_EQ(hint->GetIntegerValue(value.get(), &number), AAFRESULT_SUCCESS);
        EXPECT_EQ(number, 2);
    }
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(hint->CreateValueFromName(L"kAAF", &out), AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(hint->CreateValueFromName(L"kAAFkAAFRelativeLeft", &out), AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(hint->CreateValueFromName(L"Relative", &out), AAFRESULT_ILLEGAL_VALUE);

    const auto own = NewMeta<IAAFTypeDefEnum>(AUID_AAFTypeDefEnum);
    wchar_t prefixed[] = L"kAAFOwn";
    aafString_t names[] = {prefixed};
    aafInt64 values[] = {7};
    ASSERT_EQ(own->Initialize(kOwnId, Type(kAAFTypeID_Int16).get(), values, names, 1, L"Own"),
              AAFRESULT_SUCCESS);
    Out(own, &IAAFTypeDefEnum::CreateValueFromName, L"Own");
    Out(own, &IAAFTypeDefEnum::CreateValueFromName, L"kAAFOwn");

    ASSERT_EQ(usage->AppendElement(kOwnId, L"Usage_Own"), AAFRESULT_SUCCESS);
    const auto value = Out(usage, &IAAFTypeDefExtEnum::CreateValueFromName, L"kAAFUsage_Own");
    aafUID_t id{};
    EXPECT_EQ(usage->GetAUIDValue(value.get(), &id), AAFRESULT_SUCCESS);
    EXPECT_TRUE(id == kOwnId);
}

TEST_F(EnumerationTypes, ExtendibleOnesGrow) {
    wchar_t name[20] = {};
    EXPECT_EQ(usage->GetNameFromAUID(kOwnId, name, sizeof name), AAFRESULT_ILLEGAL_VALUE);
    ASSERT_EQ(usage->AppendElement(kOwnId, L"Usage_Own"), AAFRESULT_SUCCESS);
    EXPECT_EQ(usage->AppendElement(kOwnId, L"Usage_Own"), AAFRESULT_INVALID_PARAM);
    EXPECT_EQ(usage->GetNameFromAUID(kOwnId, name, sizeof name), AAFRESULT_SUCCESS);
    EXPECT_STREQ(name, L"Usage_Own");
    const auto value = Out(usage, &IAAFTypeDefExtEnum::CreateValueFromName, L"Usage_TopLevel");
    aafUID_t id{};
    EXPECT_EQ(usage->GetAUIDValue(value.get(), &id), AAFRESULT_SUCCESS);
    EXPECT_TRUE(id == ncfGuid("0D010102-0101-0700-060E-2B3404010101"));
    EXPECT_EQ(usage->SetAUIDValue(value.get(), kOtherOwnId), AAFRESULT_ILLEGAL_VALUE);
}

}  // namespace
