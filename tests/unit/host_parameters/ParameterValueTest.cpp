// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ParameterValue.h"

#include <gtest/gtest.h>

#include "host_interfaces/framework/ResultCodes.h"

namespace {

using host::MakeRef;

TEST(ParameterValue, GivesBackTheNumberThatItTook) {
    const auto value = MakeRef<host::ParameterValue>();
    const ncfUInt32 number = 0xFEDCBA98;
    ASSERT_EQ(value->SetData(kValueTypeUInt32, &number, 4, 0), NCF_OK);
    ncfUInt32 read = 0;
    EXPECT_EQ(value->GetData(&read, 4), NCF_OK);
    EXPECT_EQ(read, number);
    ncfUInt16 half = 0;
    EXPECT_EQ(value->GetData(&half, 2), NCF_OK) << "less may be asked for";
    EXPECT_EQ(half, 0xBA98);
}

TEST(ParameterValue, WritesNothingWhenItHoldsTooLittle) {
    const auto value = MakeRef<host::ParameterValue>();
    ncfUInt64 read = 0x5555;
    EXPECT_EQ(value->GetData(&read, 4), NCF_E_FAIL) << "a new value holds nothing";
    EXPECT_EQ(value->GetData(&read, 1), NCF_E_FAIL);
    EXPECT_EQ(value->GetData(&read, 0), NCF_OK);
    const ncfUInt32 number = 7;
    ASSERT_EQ(value->SetData(kValueTypeUInt32, &number, 4, 0), NCF_OK);
    EXPECT_EQ(value->GetData(&read, 8), NCF_E_FAIL);
    EXPECT_EQ(value->Clear(), NCF_OK);
    EXPECT_EQ(value->GetData(&read, 4), NCF_E_FAIL) << "cleared";
    EXPECT_EQ(read, 0x5555u);
}

TEST(ParameterValue, RefusesOtherTypesSizesAndNulls) {
    const auto value = MakeRef<host::ParameterValue>(ncfUInt32{7});
    const ncfUInt64 number = 9;
    EXPECT_EQ(value->SetData(kParamTypeChoice, &number, 4, 0), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(value->SetData(kValueTypeUInt32, &number, 8, 0), NCF_E_INVALIDARG);
    EXPECT_EQ(value->SetData(kValueTypeUInt32, &number, 0, 0), NCF_E_INVALIDARG);
    EXPECT_EQ(value->SetData(kValueTypeUInt32, nullptr, 4, 0), NCF_E_POINTER);
    EXPECT_EQ(value->GetData(nullptr, 4), NCF_E_POINTER);
    ncfUInt32 read = 0;
    EXPECT_EQ(value->GetData(&read, 4), NCF_OK);
    EXPECT_EQ(read, 7u) << "it is as it was";
}

TEST(ValueFactory, MakesValuesThatHoldNothing) {
    const auto factory = MakeRef<host::ValueFactory>();
    host::Ref<IParameterValue> first, second;
    ASSERT_EQ(factory->CreateValue(first.Out()), NCF_OK);
    ASSERT_EQ(factory->CreateValue(second.Out()), NCF_OK);
    EXPECT_NE(first.get(), second.get());
    ncfUInt32 read = 0;
    EXPECT_EQ(first->GetData(&read, 4), NCF_E_FAIL);
    EXPECT_EQ(factory->CreateValue(nullptr), NCF_E_POINTER);
}

}  // namespace
