// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class StreamTypes : public ModelFixture {
protected:
    Ptr<IAAFTypeDefStream> type = TypeAs<IAAFTypeDefStream>(kAAFTypeID_Stream);
    aaf::RefPtr<aaf::PropertyValue> value = model->NewValue(*model->FindType(kAAFTypeID_Stream));
    aafUInt8 data[4] = {1, 2, 3, 4};
};

TEST_F(StreamTypes, WritesMoveThePositionAndReadsFollow) {
    ASSERT_EQ(type->Write(value.get(), 4, data), AAFRESULT_SUCCESS);
    ASSERT_EQ(type->SetPosition(value.get(), 2), AAFRESULT_SUCCESS);
    aafUInt8 read[4] = {};
    aafUInt32 count = 0;
    EXPECT_EQ(type->Read(value.get(), 4, read, &count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 2u);
    EXPECT_EQ(read[0], 3);
    EXPECT_EQ(type->Read(value.get(), 4, read, &count), AAFRESULT_END_OF_DATA);
    EXPECT_EQ(count, 0u);
    ASSERT_EQ(type->SetPosition(value.get(), 0), AAFRESULT_SUCCESS);
    ASSERT_EQ(type->Append(value.get(), 2, data), AAFRESULT_SUCCESS);
    aafInt64 size = 0;
    EXPECT_EQ(type->GetSize(value.get(), &size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, 6);
}

TEST_F(StreamTypes, PositionsAndSizesOutsideAreRefused) {
    EXPECT_EQ(type->SetPosition(value.get(), 1), AAFRESULT_INVALID_PARAM);
    EXPECT_EQ(type->SetPosition(value.get(), -1), AAFRESULT_INVALID_PARAM);
    EXPECT_EQ(type->SetSize(value.get(), -1), AAFRESULT_BAD_SIZE);
    ASSERT_EQ(type->Write(value.get(), 4, data), AAFRESULT_SUCCESS);
    ASSERT_EQ(type->SetSize(value.get(), 1), AAFRESULT_SUCCESS);
    aafInt64 position = 0;
    EXPECT_EQ(type->GetPosition(value.get(), &position), AAFRESULT_SUCCESS);
    EXPECT_EQ(position, 1);
}

TEST_F(StreamTypes, ByteOrderIsOptional) {
    aafBoolean_t has = kAAFTrue;
    eAAFByteOrder_t order = 0;
    EXPECT_EQ(type->HasStoredByteOrder(value.get(), &has), AAFRESULT_SUCCESS);
    EXPECT_EQ(has, kAAFFalse);
    EXPECT_EQ(type->GetStoredByteOrder(value.get(), &order), AAFRESULT_NOBYTEORDER);
    EXPECT_EQ(type->SetStoredByteOrder(value.get(), 2), AAFRESULT_INVALID_ENUM_VALUE);
    EXPECT_EQ(type->SetStoredByteOrder(value.get(), kAAFByteOrderBig), AAFRESULT_SUCCESS);
    EXPECT_EQ(type->GetStoredByteOrder(value.get(), &order), AAFRESULT_SUCCESS);
    EXPECT_EQ(order, kAAFByteOrderBig);
    EXPECT_EQ(type->ClearStoredByteOrder(value.get()), AAFRESULT_SUCCESS);
}

TEST_F(StreamTypes, NullArgumentsAreRefused) {
    aafUInt32 count = 0;
    EXPECT_EQ(type->Read(nullptr, 1, data, &count), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->Read(value.get(), 1, nullptr, &count), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->Write(value.get(), 1, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->GetSize(value.get(), nullptr), AAFRESULT_NULL_PARAM);
}

}  // namespace
