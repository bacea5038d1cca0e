// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class IntegerTypes : public ModelFixture {
protected:
    template <class Number>
    HRESULT Create(const aafUID_t& type, Number number, Ptr<IAAFPropertyValue>* value) {
        IAAFPropertyValue* out = nullptr;
        const HRESULT result = TypeAs<IAAFTypeDefInt>(type)->CreateValue(
            reinterpret_cast<aafMemPtr_t>(&number), sizeof number, &out);
        *value = Ptr<IAAFPropertyValue>::Adopt(out);
        return result;
    }
    template <class Number>
    HRESULT Get(const aafUID_t& type, const Ptr<IAAFPropertyValue>& value, Number* number) {
        return TypeAs<IAAFTypeDefInt>(type)->GetInteger(
            value.get(), reinterpret_cast<aafMemPtr_t>(number), sizeof *number);
    }
};

TEST_F(IntegerTypes, SmallerIntegersAreExtendedByTheirSign) {
    Ptr<IAAFPropertyValue> value;
    aafInt32 wide = 0;
    ASSERT_EQ(Create(kAAFTypeID_Int32, aafInt8{-2}, &value), AAFRESULT_SUCCESS);
    EXPECT_EQ(Get(kAAFTypeID_Int32, value, &wide), AAFRESULT_SUCCESS);
    EXPECT_EQ(wide, -2);
    ASSERT_EQ(Create(kAAFTypeID_UInt32, aafUInt8{0xFE}, &value), AAFRESULT_SUCCESS);
    EXPECT_EQ(Get(kAAFTypeID_UInt32, value, &wide), AAFRESULT_SUCCESS);
    EXPECT_EQ(wide, 0xFE);
}

TEST_F(IntegerTypes, SizesThatDoNotFitAreRefused) {
    Ptr<IAAFPropertyValue> value;
    EXPECT_EQ(Create(kAAFTypeID_Int32, aafInt64{1}, &value), AAFRESULT_BAD_SIZE);
    aafUInt8 three[3] = {};
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(TypeAs<IAAFTypeDefInt>(kAAFTypeID_Int32)->CreateValue(three, 3, &out),
              AAFRESULT_BAD_SIZE);
    EXPECT_EQ(TypeAs<IAAFTypeDefInt>(kAAFTypeID_Int32)->CreateValue(three, 0, &out),
              AAFRESULT_BAD_SIZE);
}

TEST_F(IntegerTypes, ReadingExtendsIntoLargerAndRefusesSmaller) {
    Ptr<IAAFPropertyValue> value;
    ASSERT_EQ(Create(kAAFTypeID_Int32, aafInt32{-5}, &value), AAFRESULT_SUCCESS);
    aafInt64 wide = 0;
    aafInt16 narrow = 0;
    EXPECT_EQ(Get(kAAFTypeID_Int32, value, &wide), AAFRESULT_SUCCESS);
    EXPECT_EQ(wide, -5);
    EXPECT_EQ(Get(kAAFTypeID_Int32, value, &narrow), AAFRESULT_BAD_SIZE);
}

TEST_F(IntegerTypes, ValuesOfOtherKindsAreRefused) {
    const auto text = TypeAs<IAAFTypeDefString>(kAAFTypeID_String);
    wchar_t letter[] = L"a";
    const auto value = Out(text, &IAAFTypeDefString::CreateValueFromCString,
                           reinterpret_cast<aafMemPtr_t>(letter), sizeof letter);
    aafInt32 number = 0;
    EXPECT_EQ(Get(kAAFTypeID_Int32, value, &number), AAFRESULT_BAD_TYPE);
}

TEST_F(IntegerTypes, RenamesReadAsTheirBase) {
    const auto length = model->NewValue(*model->FindType(kAAFTypeID_LengthType));
    aafInt64 number = 1;
    EXPECT_EQ(TypeAs<IAAFTypeDefInt>(kAAFTypeID_Int64)
                  ->GetInteger(length.get(), reinterpret_cast<aafMemPtr_t>(&number), 8),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(number, 0);
    const auto rename = TypeAs<IAAFTypeDefRename>(kAAFTypeID_LengthType);
    EXPECT_EQ(Out(rename, &IAAFTypeDefRename::GetBaseType).get(), Type(kAAFTypeID_Int64).get());
    const auto base = Out(rename, &IAAFTypeDefRename::GetBaseValue, length.get());
    EXPECT_EQ(Out(base, &IAAFPropertyValue::GetType).get(), Type(kAAFTypeID_Int64).get());
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(rename->GetBaseValue(Int32Value(1).get(), &out), AAFRESULT_BAD_TYPE);
    EXPECT_EQ(rename->CreateValue(nullptr, &out), AAFRESULT_NULL_PARAM);
}

TEST_F(IntegerTypes, BuiltInOnesHaveTheirSign) {
    const std::pair<aafUID_t, aafBoolean_t> expected[] = {
        {kAAFTypeID_Int8, kAAFTrue},    {kAAFTypeID_Int16, kAAFTrue},
        {kAAFTypeID_Int32, kAAFTrue},   {kAAFTypeID_Int64, kAAFTrue},
        {kAAFTypeID_UInt8, kAAFFalse},  {kAAFTypeID_UInt16, kAAFFalse},
        {kAAFTypeID_UInt32, kAAFFalse}, {kAAFTypeID_UInt64, kAAFFalse},
    };
    for (const auto& entry : expected) {
        aafBoolean_t isSigned = -1;
        EXPECT_EQ(TypeAs<IAAFTypeDefInt>(entry.first)->IsSigned(&isSigned), AAFRESULT_SUCCESS);
        EXPECT_EQ(isSigned, entry.second);
    }
}

TEST_F(IntegerTypes, InitializeWorksOnce) {
    const auto type = NewMeta<IAAFTypeDefInt>(AUID_AAFTypeDefInt);
    aafUInt32 size = 0;
    EXPECT_EQ(type->GetSize(&size), AAFRESULT_NOT_INITIALIZED);
    EXPECT_EQ(type->Initialize(kOwnId, 4, 2, L"Own"), AAFRESULT_INVALID_ENUM_VALUE);
    EXPECT_EQ(type->Initialize(kOwnId, 3, kAAFTrue, L"Own"), AAFRESULT_BAD_SIZE);
    EXPECT_EQ(type->Initialize(kOwnId, 4, kAAFTrue, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->Initialize(kOwnId, 4, kAAFTrue, L"Own"), AAFRESULT_SUCCESS);
    EXPECT_EQ(type->Initialize(kOwnId, 4, kAAFTrue, L"Own"), AAFRESULT_ALREADY_INITIALIZED);
    EXPECT_EQ(::Get(type, &IAAFTypeDefInt::GetSize), 4u);
}

TEST_F(IntegerTypes, NullArgumentsAreRefused) {
    const auto type = TypeAs<IAAFTypeDefInt>(kAAFTypeID_Int32);
    aafUInt8 bytes[4] = {};
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(type->CreateValue(nullptr, 4, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->CreateValue(bytes, 4, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->GetInteger(nullptr, bytes, 4), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->GetInteger(Int32Value(1).get(), nullptr, 4), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->SetInteger(nullptr, bytes, 4), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->GetSize(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->IsSigned(nullptr), AAFRESULT_NULL_PARAM);
}

}  // namespace
