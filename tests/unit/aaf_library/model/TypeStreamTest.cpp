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

// A product version takes nine bytes in a file, twelve as a structure.
TEST_F(StreamTypes, ElementsAreStoredAsTheirTypeStoresThem) {
    Ptr<IAAFTypeDef> versions = TypeAs<IAAFTypeDef>(kAAFTypeID_ProductVersion);
    aafProductVersion_t two[2] = {{1, 2, 3, 4, kAAFVersionBeta}, {5, 6, 7, 8, kAAFVersionDebug}};
    const auto bytes = reinterpret_cast<aafMemPtr_t>(two);
    ASSERT_EQ(type->WriteElements(value.get(), versions.get(), sizeof two, bytes),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(value->bytes().size(), 18u);
    EXPECT_EQ(value->bytes()[9], 5);
    ASSERT_EQ(type->AppendElements(value.get(), versions.get(), sizeof *two, bytes),
              AAFRESULT_SUCCESS);
    ASSERT_EQ(type->SetPosition(value.get(), 9), AAFRESULT_SUCCESS);
    aafProductVersion_t read[4] = {};
    const auto out = reinterpret_cast<aafMemPtr_t>(read);
    aafUInt32 count = 0;
    ASSERT_EQ(type->ReadElements(value.get(), versions.get(), sizeof read, out, &count),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 2 * sizeof *read);
    EXPECT_EQ(read[0].patchLevel, 8);
    EXPECT_EQ(read[0].type, kAAFVersionDebug);
    EXPECT_EQ(read[1].tertiary, 3);
    EXPECT_EQ(type->ReadElements(value.get(), versions.get(), sizeof read, out, &count),
              AAFRESULT_END_OF_DATA);
    // What is left of an element isn't one.
    ASSERT_EQ(type->SetPosition(value.get(), 20), AAFRESULT_SUCCESS);
    EXPECT_EQ(type->ReadElements(value.get(), versions.get(), sizeof read, out, &count),
              AAFRESULT_END_OF_DATA);
    EXPECT_EQ(count, 0u);
}

TEST_F(StreamTypes, ElementsAreWholeAndOfAFixedSize) {
    Ptr<IAAFTypeDef> numbers = TypeAs<IAAFTypeDef>(kAAFTypeID_Int16);
    Ptr<IAAFTypeDef> texts = TypeAs<IAAFTypeDef>(kAAFTypeID_String);
    aafUInt32 count = 0;
    EXPECT_EQ(type->WriteElements(value.get(), numbers.get(), 3, data), AAFRESULT_BAD_SIZE);
    EXPECT_EQ(type->AppendElements(value.get(), numbers.get(), 3, data), AAFRESULT_BAD_SIZE);
    EXPECT_EQ(type->ReadElements(value.get(), numbers.get(), 3, data, &count), AAFRESULT_BAD_SIZE);
    EXPECT_EQ(type->WriteElements(value.get(), texts.get(), 4, data), AAFRESULT_BAD_TYPE);
    EXPECT_EQ(type->ReadElements(value.get(), texts.get(), 4, data, &count), AAFRESULT_BAD_TYPE);
    EXPECT_EQ(type->WriteElements(value.get(), numbers.get(), 0, data), AAFRESULT_SUCCESS);
    EXPECT_TRUE(value->bytes().empty());
    EXPECT_EQ(type->WriteElements(value.get(), nullptr, 4, data), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->WriteElements(value.get(), numbers.get(), 4, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->AppendElements(value.get(), numbers.get(), 4, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->ReadElements(value.get(), numbers.get(), 4, nullptr, &count),
              AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->ReadElements(value.get(), numbers.get(), 4, data, nullptr),
              AAFRESULT_NULL_PARAM);
    ASSERT_EQ(type->SetStoredByteOrder(value.get(), kAAFByteOrderBig), AAFRESULT_SUCCESS);
    EXPECT_EQ(type->WriteElements(value.get(), numbers.get(), 4, data),
              AAFRESULT_INVALID_BYTEORDER);
    EXPECT_EQ(type->ReadElements(value.get(), numbers.get(), 4, data, &count),
              AAFRESULT_INVALID_BYTEORDER);
}

TEST_F(StreamTypes, NullArgumentsAreRefused) {
    aafUInt32 count = 0;
    EXPECT_EQ(type->Read(nullptr, 1, data, &count), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->Read(value.get(), 1, nullptr, &count), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->Write(value.get(), 1, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->GetSize(value.get(), nullptr), AAFRESULT_NULL_PARAM);
}

}  // namespace
