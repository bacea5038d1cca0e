// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class IndirectTypes : public ModelFixture {
protected:
    Ptr<IAAFTypeDefIndirect> type = TypeAs<IAAFTypeDefIndirect>(kAAFTypeID_Indirect);
};

TEST_F(IndirectTypes, WrapAndUnwrapAnyPlainValue) {
    const auto wrapped =
        Out(type, &IAAFTypeDefIndirect::CreateValueFromActualValue, Int32Value(12).get());
    aafUInt32 size = 0;
    aafInt32 number = 0;
    EXPECT_EQ(type->GetActualSize(wrapped.get(), &size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, 4u);
    EXPECT_EQ(type->GetActualData(wrapped.get(), reinterpret_cast<aafMemPtr_t>(&number), 4),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(number, 12);
    EXPECT_EQ(NumberOf(Out(type, &IAAFTypeDefIndirect::GetActualValue, wrapped.get())), 12);
    EXPECT_EQ(Out(type, &IAAFTypeDefIndirect::GetActualType, wrapped.get()).get(),
              Type(kAAFTypeID_Int32).get());
}

TEST_F(IndirectTypes, EmptyOrMisfittingValuesAreIllegal) {
    aafUInt32 size = 0;
    const auto empty = model->NewValue(*model->FindType(kAAFTypeID_Indirect));
    EXPECT_EQ(type->GetActualSize(empty.get(), &size), AAFRESULT_ILLEGAL_VALUE);
    aafUInt8 data[3] = {};
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(type->CreateValueFromActualData(Type(kAAFTypeID_Int32).get(), data, 3, &out),
              AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(type->CreateValueFromActualData(nullptr, data, 3, &out), AAFRESULT_NULL_PARAM);
}

TEST_F(IndirectTypes, OpaqueValuesGiveTheirHandle) {
    const auto opaque = TypeAs<IAAFTypeDefOpaque>(kAAFTypeID_Opaque);
    const auto wrapped = Out(As<IAAFTypeDefIndirect>(opaque),
                             &IAAFTypeDefIndirect::CreateValueFromActualValue, Int32Value(1).get());
    aafUInt32 size = 0;
    ASSERT_EQ(opaque->GetHandleBufLen(wrapped.get(), &size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, 21u);
    aafUInt8 handle[21] = {};
    EXPECT_EQ(opaque->GetHandle(wrapped.get(), 20, handle, &size), AAFRESULT_SMALLBUF);
    ASSERT_EQ(opaque->GetHandle(wrapped.get(), 21, handle, &size), AAFRESULT_SUCCESS);
    const auto copy = Out(opaque, &IAAFTypeDefOpaque::CreateValueFromHandle, handle, 21);
    aafUID_t id{};
    EXPECT_EQ(opaque->GetActualTypeID(copy.get(), &id), AAFRESULT_SUCCESS);
    EXPECT_TRUE(id == kAAFTypeID_Int32);
    EXPECT_EQ(opaque->SetHandle(copy.get(), 5, handle), AAFRESULT_ILLEGAL_VALUE);
}

}  // namespace
