// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeFacts.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

// A box of four rationals, as a describing program registers it.
class RecordTypes : public ModelFixture {
protected:
    struct Box {
        aafRational_t x, y, width, height;
    };
    Ptr<IAAFTypeDefRecord> NewBox() {
        const auto record = NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord);
        const auto rational = Type(kAAFTypeID_Rational);
        IAAFTypeDef* types[] = {rational.get(), rational.get(), rational.get(), rational.get()};
        EXPECT_EQ(record->Initialize(kOwnId, types, names, 4, L"Box"), AAFRESULT_SUCCESS);
        return record;
    }
    HRESULT Create(const Ptr<IAAFTypeDefRecord>& record, aafUInt32 size,
                   Ptr<IAAFPropertyValue>* value) {
        Box box{{1, 2}, {-3, 4}, {1920, 1}, {1080, 1}};
        IAAFPropertyValue* out = nullptr;
        const HRESULT result =
            record->CreateValueFromStruct(reinterpret_cast<aafMemPtr_t>(&box), size, &out);
        *value = Ptr<IAAFPropertyValue>::Adopt(out);
        return result;
    }

    wchar_t x[2] = L"X", y[2] = L"Y", width[6] = L"Width", height[7] = L"Height";
    aafString_t names[4] = {x, y, width, height};
    aafUInt32 offsets[4] = {0, 8, 16, 24};
};

TEST_F(RecordTypes, ValuesNeedARegisteredLayout) {
    const auto record = NewBox();
    Ptr<IAAFPropertyValue> value;
    EXPECT_EQ(Create(record, 32, &value), AAFRESULT_NOT_REGISTERED);
    ASSERT_EQ(record->RegisterMembers(offsets, 4, 32), AAFRESULT_SUCCESS);
    EXPECT_EQ(Create(record, 31, &value), AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(Create(record, 32, &value), AAFRESULT_SUCCESS);
    Box box{};
    EXPECT_EQ(record->GetStruct(value.get(), reinterpret_cast<aafMemPtr_t>(&box), 32),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(box.y.numerator, -3);
    EXPECT_EQ(box.width.numerator, 1920);
    EXPECT_EQ(record->GetStruct(value.get(), reinterpret_cast<aafMemPtr_t>(&box), 16),
              AAFRESULT_ILLEGAL_VALUE);
}

TEST_F(RecordTypes, LayoutMayBeRegisteredAgainBeforeAndAfterTheType) {
    const auto record = NewBox();
    EXPECT_EQ(record->RegisterMembers(offsets, 3, 32), AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(record->RegisterMembers(offsets, 4, 32), AAFRESULT_SUCCESS);
    ASSERT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(record).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(record->RegisterMembers(offsets, 4, 32), AAFRESULT_SUCCESS);
    EXPECT_EQ(record->RegisterMembers(offsets, 4, 32), AAFRESULT_SUCCESS);
    EXPECT_EQ(record->RegisterMembers(nullptr, 4, 32), AAFRESULT_NULL_PARAM);
}

TEST_F(RecordTypes, MemberOutsideTheStructureIsRefused) {
    const auto record = NewBox();
    EXPECT_EQ(record->RegisterMembers(offsets, 4, 31), AAFRESULT_ILLEGAL_VALUE);
    aafUInt32 far[4] = {0, 8, 16, 0xFFFFFFF0};
    EXPECT_EQ(record->RegisterMembers(far, 4, 32), AAFRESULT_ILLEGAL_VALUE);
}

TEST_F(RecordTypes, LayoutsOfMembersAreRegisteredFirst) {
    const auto inner = NewBox();
    ASSERT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(inner).get()), AAFRESULT_SUCCESS);
    const auto outer = NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord);
    const auto member = As<IAAFTypeDef>(inner);
    IAAFTypeDef* types[] = {member.get()};
    ASSERT_EQ(outer->Initialize(kOtherOwnId, types, names, 1, L"Outer"), AAFRESULT_SUCCESS);
    aafUInt32 zero = 0;
    EXPECT_EQ(outer->RegisterMembers(&zero, 1, 32), AAFRESULT_NOT_REGISTERED);
    ASSERT_EQ(inner->RegisterMembers(offsets, 4, 32), AAFRESULT_SUCCESS);
    EXPECT_EQ(outer->RegisterMembers(&zero, 1, 32), AAFRESULT_SUCCESS);
}

TEST_F(RecordTypes, LayoutOfAMemberThatGrewIsNoticed) {
    const auto inner = NewBox();
    ASSERT_EQ(inner->RegisterMembers(offsets, 4, 32), AAFRESULT_SUCCESS);
    ASSERT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(inner).get()), AAFRESULT_SUCCESS);
    const auto outer = NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord);
    const auto member = As<IAAFTypeDef>(inner);
    IAAFTypeDef* types[] = {member.get()};
    ASSERT_EQ(outer->Initialize(kOtherOwnId, types, names, 1, L"Outer"), AAFRESULT_SUCCESS);
    aafUInt32 zero = 0;
    ASSERT_EQ(outer->RegisterMembers(&zero, 1, 32), AAFRESULT_SUCCESS);
    ASSERT_EQ(inner->RegisterMembers(offsets, 4, 64), AAFRESULT_SUCCESS);
    Ptr<IAAFPropertyValue> value;
    EXPECT_EQ(Create(outer, 32, &value), AAFRESULT_ILLEGAL_VALUE);
    const auto* const type =
        aaf::ImplementationAs<aaf::TypeDefinition>(As<IAAFTypeDef>(outer).get());
    std::uint8_t bytes[32] = {};
    aaf::Bytes stored;
    EXPECT_EQ(type->Encode(bytes, sizeof bytes, stored), AAFRESULT_BAD_SIZE);
    EXPECT_EQ(type->Decode(bytes, sizeof bytes, bytes, sizeof bytes), AAFRESULT_BAD_SIZE);
}

TEST_F(RecordTypes, ArraysOfThoseWithoutALayoutAreNotRead) {
    const auto box = NewBox();
    const auto array = NewMeta<IAAFTypeDefVariableArray>(AUID_AAFTypeDefVariableArray);
    ASSERT_EQ(array->Initialize(kOtherOwnId, As<IAAFTypeDef>(box).get(), L"Boxes"),
              AAFRESULT_SUCCESS);
    const auto* const type =
        aaf::ImplementationAs<aaf::TypeDefinition>(As<IAAFTypeDef>(array).get());
    std::uint8_t bytes[32] = {};
    EXPECT_EQ(type->Decode(bytes, sizeof bytes, bytes, sizeof bytes), AAFRESULT_BAD_SIZE);
    EXPECT_EQ(type->Decode(bytes, 0, bytes, 0), AAFRESULT_SUCCESS);
}

TEST_F(RecordTypes, ARenameNeverComesToMeanWhatItIsPartOf) {
    const auto rename = NewMeta<IAAFTypeDefRename>(AUID_AAFTypeDefRename);
    const auto rational = Type(kAAFTypeID_Rational);
    ASSERT_EQ(rename->Initialize(kOtherOwnId, rational.get(), L"Other"), AAFRESULT_SUCCESS);
    const auto member = As<IAAFTypeDef>(rename);
    ASSERT_EQ(dictionary->RegisterTypeDef(member.get()), AAFRESULT_SUCCESS);
    const auto outer = NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord);
    IAAFTypeDef* types[] = {member.get()};
    ASSERT_EQ(outer->Initialize(kOwnId, types, names, 1, L"Outer"), AAFRESULT_SUCCESS);
    ASSERT_EQ(dictionary->RegisterTypeDef(As<IAAFTypeDef>(outer).get()), AAFRESULT_SUCCESS);
    aaf::TypeDefinition& type = *model->FindType(kOtherOwnId);
    aaf::TypeFacts facts = aaf::FactsOf(type);
    facts.target = kOwnId;
    EXPECT_TRUE(aaf::Redefine(type, *model, facts));
    EXPECT_EQ(type.element()->id(), kAAFTypeID_Rational);
}

TEST_F(RecordTypes, BuiltInRecordsAreRegisteredFromTheStart) {
    const auto rational = TypeAs<IAAFTypeDefRecord>(kAAFTypeID_Rational);
    aafRational_t number{25, 1};
    const auto value = Out(rational, &IAAFTypeDefRecord::CreateValueFromStruct,
                           reinterpret_cast<aafMemPtr_t>(&number), sizeof number);
    const auto numerator = Out(rational, &IAAFTypeDefRecord::GetValue, value.get(), 0);
    EXPECT_EQ(NumberOf(numerator), 25);
    ASSERT_EQ(rational->SetValue(value.get(), 1, Int32Value(2).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(rational->GetStruct(value.get(), reinterpret_cast<aafMemPtr_t>(&number), 8),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(number.denominator, 2);
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(rational->GetValue(value.get(), 2, &out), AAFRESULT_ILLEGAL_VALUE);
}

TEST_F(RecordTypes, PaddingOfStructuresIsNotStored) {
    const auto type = TypeAs<IAAFTypeDefRecord>(kAAFTypeID_ProductVersion);
    aafProductVersion_t version{1, 2, 3, 4, kAAFVersionBeta};
    const auto value = Out(type, &IAAFTypeDefRecord::CreateValueFromStruct,
                           reinterpret_cast<aafMemPtr_t>(&version), sizeof version);
    EXPECT_EQ(aaf::ImplementationAs<aaf::PropertyValue>(value.get())->bytes(),
              (aaf::Bytes{1, 0, 2, 0, 3, 0, 4, 0, 4}));
    aafProductVersion_t read{};
    EXPECT_EQ(type->GetStruct(value.get(), reinterpret_cast<aafMemPtr_t>(&read), sizeof read),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(read.type, kAAFVersionBeta);
}

TEST_F(RecordTypes, OnlyFixedSizesFromTheDictionaryMayBeMembers) {
    const auto record = NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord);
    const auto text = Type(kAAFTypeID_String);
    IAAFTypeDef* types[] = {text.get()};
    EXPECT_EQ(record->Initialize(kOwnId, types, names, 1, L"Bad"), AAFRESULT_BAD_TYPE);
    const auto stray = NewMeta<IAAFTypeDefInt>(AUID_AAFTypeDefInt);
    ASSERT_EQ(stray->Initialize(kOtherOwnId, 4, kAAFTrue, L"Stray"), AAFRESULT_SUCCESS);
    const auto strayType = As<IAAFTypeDef>(stray);
    types[0] = strayType.get();
    EXPECT_EQ(record->Initialize(kOwnId, types, names, 1, L"Bad"), AAFRESULT_TYPE_NOT_FOUND);
    for (const aafUID_t& good : {kAAFTypeID_Int64, kAAFTypeID_LengthType, kAAFTypeID_Boolean,
                                 kAAFTypeID_TimeStamp, kAAFTypeID_UInt8Array8, kAAFTypeID_AUID}) {
        const auto fine = NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord);
        const auto member = Type(good);
        types[0] = member.get();
        EXPECT_EQ(fine->Initialize(kOwnId, types, names, 1, L"Good"), AAFRESULT_SUCCESS);
    }
}

TEST_F(RecordTypes, OperationsBeforeInitializeAreRefused) {
    const auto record = NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord);
    aafUInt32 count = 0;
    aafUInt8 data[8] = {};
    IAAFPropertyValue* out = nullptr;
    IAAFTypeDef* type = nullptr;
    EXPECT_EQ(record->GetCount(&count), AAFRESULT_NOT_INITIALIZED);
    EXPECT_EQ(record->GetMemberType(0, &type), AAFRESULT_NOT_INITIALIZED);
    EXPECT_EQ(record->CreateValueFromStruct(data, 8, &out), AAFRESULT_NOT_INITIALIZED);
    EXPECT_EQ(record->RegisterMembers(offsets, 4, 32), AAFRESULT_NOT_INITIALIZED);
}

TEST_F(RecordTypes, InitializeWorksOnceAndTellsItsMembers) {
    const auto record = NewBox();
    const auto rational = Type(kAAFTypeID_Rational);
    IAAFTypeDef* types[] = {rational.get()};
    EXPECT_EQ(record->Initialize(kOwnId, types, names, 1, L"Box"), AAFRESULT_ALREADY_INITIALIZED);
    aafUInt32 count = 0;
    EXPECT_EQ(record->GetCount(&count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 4u);
    wchar_t name[8] = {};
    EXPECT_EQ(record->GetMemberName(2, name, sizeof name), AAFRESULT_SUCCESS);
    EXPECT_STREQ(name, L"Width");
    EXPECT_EQ(Out(record, &IAAFTypeDefRecord::GetMemberType, 3).get(), rational.get());
}

TEST_F(RecordTypes, NullArgumentsAreRefused) {
    const auto record = NewBox();
    aafUInt8 data[32] = {};
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(record->CreateValueFromStruct(nullptr, 32, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(record->CreateValueFromStruct(data, 32, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(record->CreateValueFromValues(nullptr, 4, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(record->GetStruct(nullptr, data, 32), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(record->SetStruct(nullptr, data, 32), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(record->GetCount(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(record->GetMemberName(0, nullptr, 0), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(NewMeta<IAAFTypeDefRecord>(AUID_AAFTypeDefRecord)
                  ->Initialize(kOwnId, nullptr, names, 1, L"Box"),
              AAFRESULT_NULL_PARAM);
}

}  // namespace
