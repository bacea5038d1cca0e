// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

class TaggedValue : public TransientFile {
protected:
    Ptr<IAAFTypeDef> Type(const aafUID_t& id) {
        Ptr<IAAFTypeDef> type = Get(dictionary_, &IAAFDictionary::LookupTypeDef, id);
        return type;
    }
    Ptr<IAAFTaggedValue> value_ = Make<IAAFTaggedValue>(AUID_AAFTaggedValue);
    aafInt32 number_ = -5;
    aafDataBuffer_t bytes_ = reinterpret_cast<aafDataBuffer_t>(&number_);
};

TEST_F(TaggedValue, HasNoValueBeforeItIsInitialized) {
    aafUInt32 size = 0;
    aafUInt32 read = 0;
    aafUInt8 buffer[4];
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, value_->GetValueBufLen(&size));
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, value_->GetValue(4, buffer, &read));
}

TEST_F(TaggedValue, InitializesOnce) {
    Ptr<IAAFTypeDef> type = Type(kAAFTypeID_Int32);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value_->Initialize(nullptr, type, 4, bytes_));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value_->Initialize(L"n", nullptr, 4, bytes_));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value_->Initialize(L"n", type, 4, nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, value_->Initialize(L"n", type, 4, bytes_));
    EXPECT_EQ(AAFRESULT_ALREADY_INITIALIZED, value_->Initialize(L"n", type, 4, bytes_));
}

TEST_F(TaggedValue, WantsASizeThatFitsItsType) {
    for (aafUInt32 size : {0u, 2u, 3u, 5u, 8u}) {
        aafUInt8 plenty[8] = {};
        EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE,
                  value_->Initialize(L"n", Type(kAAFTypeID_Int32), size, plenty))
            << size;
    }
    wchar_t text[] = L"ab";
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE,
              value_->Initialize(L"n", Type(kAAFTypeID_String), sizeof(wchar_t) + 1,
                                 reinterpret_cast<aafDataBuffer_t>(text)));
    EXPECT_EQ(AAFRESULT_SUCCESS, value_->Initialize(L"n", Type(kAAFTypeID_String), sizeof text,
                                                    reinterpret_cast<aafDataBuffer_t>(text)));
}

TEST_F(TaggedValue, TellsTheSizeOfTheCallersBufferAsRead) {
    ASSERT_EQ(AAFRESULT_SUCCESS, value_->Initialize(L"n", Type(kAAFTypeID_Int32), 4, bytes_));
    aafUInt32 size = 0;
    aafUInt32 read = 0;
    aafInt32 buffer[4] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, value_->GetValueBufLen(&size));
    EXPECT_EQ(4u, size);
    EXPECT_EQ(AAFRESULT_SMALLBUF,
              value_->GetValue(3, reinterpret_cast<aafDataBuffer_t>(buffer), &read));
    EXPECT_EQ(AAFRESULT_SUCCESS,
              value_->GetValue(16, reinterpret_cast<aafDataBuffer_t>(buffer), &read));
    EXPECT_EQ(-5, buffer[0]);
    EXPECT_EQ(16u, read);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value_->GetValue(4, nullptr, &read));
}

TEST_F(TaggedValue, TakesANewValueOfItsType) {
    aafInt32 other = 77;
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, value_->SetValue(4, bytes_));
    ASSERT_EQ(AAFRESULT_SUCCESS, value_->Initialize(L"n", Type(kAAFTypeID_Int32), 4, bytes_));
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, value_->SetValue(3, bytes_));
    EXPECT_EQ(AAFRESULT_SUCCESS, value_->SetValue(4, reinterpret_cast<aafDataBuffer_t>(&other)));
    aafInt32 back = 0;
    aafUInt32 read = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS,
              value_->GetValue(4, reinterpret_cast<aafDataBuffer_t>(&back), &read));
    EXPECT_EQ(77, back);
    Ptr<IAAFTypeDef> type;
    EXPECT_EQ(AAFRESULT_SUCCESS, value_->GetTypeDefinition(type.Out()));
    EXPECT_EQ(Type(kAAFTypeID_Int32).get(), type.get());
}

TEST_F(TaggedValue, OfRawDataKeepsKeyAndBytes) {
    Ptr<IAAFKLVData> data = Make<IAAFKLVData>(AUID_AAFKLVData);
    const aafUID_t key = ncfGuid("ABCDEF00-0000-0000-0000-000000000003");
    aafUInt8 bytes[] = {1, 2, 3};
    aafUInt8 back[3] = {};
    aafUInt32 size = 0;
    aafUID_t found{};
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, data->GetKey(&found));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, data->Initialize(key, 3, nullptr));
    ASSERT_EQ(AAFRESULT_SUCCESS, data->Initialize(key, 3, bytes));
    EXPECT_EQ(AAFRESULT_ALREADY_INITIALIZED, data->Initialize(key, 3, bytes));
    EXPECT_EQ(key, Get(data, &IAAFKLVData::GetKey));
    EXPECT_EQ(3u, Get(data, &IAAFKLVData::GetValueBufLen));
    EXPECT_EQ(AAFRESULT_SMALLBUF, data->GetValue(2, back, &size));
    EXPECT_EQ(AAFRESULT_SUCCESS, data->GetValue(3, back, &size));
    EXPECT_EQ(3, back[2]);
    EXPECT_EQ(AAFRESULT_SUCCESS, data->SetValue(1, bytes));
    EXPECT_EQ(1u, Get(data, &IAAFKLVData::GetValueBufLen));
}

}  // namespace aaf_test
