// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

// Counts how often it was told of a change.
class WatchedObject final : public aaf::Object {
public:
    int changes = 0;
    void OnValueChange(const aaf::PropertyValue&) override { ++changes; }
};
constexpr aaf::ClassEntry kWatched[] = {{AUID_AAFCDCIDescriptor, &aaf::CreateAs<WatchedObject>}};

class ObjectValues : public ModelFixture {
protected:
    aaf::RefPtr<aaf::Object> picture = model->NewObject<aaf::Object>(AUID_AAFCDCIDescriptor);
    aaf::RefPtr<aaf::Object> tagged = model->NewObject<aaf::Object>(AUID_AAFTaggedValue);
};

TEST_F(ObjectValues, IntegersTakeTheStoredSizeAndSignOfTheirType) {
    ASSERT_EQ(picture->PutInteger(aaf::prop::FileDescriptor_Length, -3), AAFRESULT_SUCCESS);
    aafInt64 length = 0;
    EXPECT_EQ(picture->ReadInteger(aaf::prop::FileDescriptor_Length, &length), AAFRESULT_SUCCESS);
    EXPECT_EQ(length, -3);
    ASSERT_EQ(picture->PutInteger(aaf::prop::CDCIDescriptor_ColorSiting, 255), AAFRESULT_SUCCESS);
    EXPECT_EQ(picture->FindValue(aaf::prop::CDCIDescriptor_ColorSiting)->bytes(), aaf::Bytes{255});
    aafColorSiting_t siting = 0;
    EXPECT_EQ(picture->ReadInteger(aaf::prop::CDCIDescriptor_ColorSiting, &siting),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(siting, 255);
    ASSERT_EQ(picture->PutInteger(aaf::prop::CDCIDescriptor_WhiteReferenceLevel, 0xFFFFFFFF),
              AAFRESULT_SUCCESS);
    aafUInt32 level = 0;
    EXPECT_EQ(picture->ReadInteger(aaf::prop::CDCIDescriptor_WhiteReferenceLevel, &level),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(level, 0xFFFFFFFFu);
}

TEST_F(ObjectValues, AbsentAndNullAreToldApart) {
    aafInt64 length = 0;
    aafInt64* none = nullptr;
    EXPECT_EQ(picture->ReadInteger(aaf::prop::FileDescriptor_Length, &length),
              AAFRESULT_PROP_NOT_PRESENT);
    EXPECT_EQ(picture->ReadInteger(aaf::prop::FileDescriptor_Length, none), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(picture->PutInteger(aaf::prop::Mob_MobID, 1), AAFRESULT_BAD_PROP);
    EXPECT_EQ(tagged->PutString(aaf::prop::TaggedValue_Name, nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(ObjectValues, StructuresArePackedWhenStored) {
    const aafRational_t rate{30000, 1001};
    ASSERT_EQ(picture->PutStruct(aaf::prop::FileDescriptor_SampleRate, rate), AAFRESULT_SUCCESS);
    EXPECT_EQ(picture->FindValue(aaf::prop::FileDescriptor_SampleRate)->bytes(),
              (aaf::Bytes{0x30, 0x75, 0, 0, 0xE9, 0x03, 0, 0}));
    aafRational_t read{};
    EXPECT_EQ(picture->ReadStruct(aaf::prop::FileDescriptor_SampleRate, &read), AAFRESULT_SUCCESS);
    EXPECT_EQ(read.numerator, 30000);
    EXPECT_EQ(read.denominator, 1001);
    const auto rgba = model->NewObject<aaf::Object>(AUID_AAFRGBADescriptor);
    aafRGBAComponent_t layout[8] = {{kAAFCompRed, 10}, {kAAFCompNone, 0}};
    ASSERT_EQ(rgba->PutNative(aaf::prop::RGBADescriptor_PixelLayout, layout, sizeof layout),
              AAFRESULT_SUCCESS);
    const aaf::Bytes& stored = rgba->FindValue(aaf::prop::RGBADescriptor_PixelLayout)->bytes();
    EXPECT_EQ(stored.size(), 16u);
    EXPECT_EQ(stored[0], 82);
    EXPECT_EQ(stored[1], 10);
    EXPECT_EQ(stored[2], 48);
}

TEST_F(ObjectValues, IdsAreStoredLittleEndianByField) {
    ASSERT_EQ(picture->PutStruct(aaf::prop::DigitalImageDescriptor_Compression,
                                 ncfGuid("0D010101-0203-0405-060E-2B3402060101")),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(picture->FindValue(aaf::prop::DigitalImageDescriptor_Compression)->bytes(),
              (aaf::Bytes{1, 1, 1, 13, 3, 2, 5, 4, 6, 14, 0x2B, 0x34, 2, 6, 1, 1}));
}

TEST_F(ObjectValues, StructureOfAnotherSizeIsRefusedAndNothingChanges) {
    const aafRational_t rate{25, 1};
    ASSERT_EQ(picture->PutStruct(aaf::prop::FileDescriptor_SampleRate, rate), AAFRESULT_SUCCESS);
    aafInt64 wrong[2] = {};
    EXPECT_EQ(picture->PutNative(aaf::prop::FileDescriptor_SampleRate, wrong, sizeof wrong),
              AAFRESULT_BAD_SIZE);
    aafRational_t read{};
    EXPECT_EQ(picture->ReadStruct(aaf::prop::FileDescriptor_SampleRate, &read), AAFRESULT_SUCCESS);
    EXPECT_EQ(read.numerator, 25);
}

TEST_F(ObjectValues, ArraysKeepTheirElements) {
    const aafInt32 lines[] = {23, -1, 335};
    ASSERT_EQ(
        picture->PutNative(aaf::prop::DigitalImageDescriptor_VideoLineMap, lines, sizeof lines),
        AAFRESULT_SUCCESS);
    aafUInt32 size = 0;
    EXPECT_EQ(picture->ReadNativeSize(aaf::prop::DigitalImageDescriptor_VideoLineMap, &size),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(size, sizeof lines);
    aafInt32 read[3] = {};
    EXPECT_EQ(
        picture->ReadNative(aaf::prop::DigitalImageDescriptor_VideoLineMap, read, sizeof read),
        AAFRESULT_SUCCESS);
    EXPECT_EQ(read[1], -1);
    EXPECT_EQ(picture->ReadNative(aaf::prop::DigitalImageDescriptor_VideoLineMap, read, 8),
              AAFRESULT_BAD_SIZE);
}

TEST_F(ObjectValues, TextsAreUtf16WithAZero) {
    ASSERT_EQ(tagged->PutString(aaf::prop::TaggedValue_Name, L"Aé"), AAFRESULT_SUCCESS);
    EXPECT_EQ(tagged->FindValue(aaf::prop::TaggedValue_Name)->bytes(),
              (aaf::Bytes{0x41, 0, 0xE9, 0, 0, 0}));
    wchar_t text[3] = {};
    EXPECT_EQ(tagged->ReadString(aaf::prop::TaggedValue_Name, text, sizeof text),
              AAFRESULT_SUCCESS);
    EXPECT_STREQ(text, L"Aé");
    EXPECT_EQ(tagged->ReadString(aaf::prop::TaggedValue_Name, text, sizeof text - 1),
              AAFRESULT_SMALLBUF);
    aafUInt32 size = 0;
    EXPECT_EQ(tagged->ReadStringLength(aaf::prop::TaggedValue_Name, &size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, sizeof text);
}

TEST_F(ObjectValues, TextThatNoFileCanHoldIsRefused) {
    const std::wstring fits(32766, L'x');
    const std::wstring tooLong(32767, L'x');
    EXPECT_EQ(tagged->PutString(aaf::prop::TaggedValue_Name, fits.c_str()), AAFRESULT_SUCCESS);
    EXPECT_EQ(tagged->PutString(aaf::prop::TaggedValue_Name, tooLong.c_str()), AAFRESULT_BAD_SIZE);
}

TEST_F(ObjectValues, IndirectValuesCarryTheirType) {
    aafInt32 number = 7;
    ASSERT_EQ(tagged->PutIndirect(aaf::prop::TaggedValue_Value, Type(kAAFTypeID_Int32).get(),
                                  &number, sizeof number),
              AAFRESULT_SUCCESS);
    // Mark, id of Int32, seven.
    EXPECT_EQ(
        tagged->FindValue(aaf::prop::TaggedValue_Value)->bytes(),
        (aaf::Bytes{0x4C, 0, 7, 1, 1, 0, 0, 0, 0, 6, 0x0E, 0x2B, 0x34, 1, 4, 1, 1, 7, 0, 0, 0}));
    aafUInt32 size = 0;
    EXPECT_EQ(tagged->ReadIndirectSize(aaf::prop::TaggedValue_Value, &size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, 4u);
    number = 0;
    EXPECT_EQ(tagged->ReadIndirect(aaf::prop::TaggedValue_Value, &number, 3), AAFRESULT_SMALLBUF);
    EXPECT_EQ(tagged->ReadIndirect(aaf::prop::TaggedValue_Value, &number, 4), AAFRESULT_SUCCESS);
    EXPECT_EQ(number, 7);
    EXPECT_EQ(Out<IAAFTypeDef>([&](IAAFTypeDef** out) {
                  return tagged->ReadIndirectType(aaf::prop::TaggedValue_Value, out);
              }).get(),
              Type(kAAFTypeID_Int32).get());
}

TEST_F(ObjectValues, IndirectTextKeepsTheCallersSize) {
    const wchar_t text[] = L"cell";
    ASSERT_EQ(tagged->PutIndirect(aaf::prop::TaggedValue_Value, Type(kAAFTypeID_String).get(), text,
                                  sizeof text),
              AAFRESULT_SUCCESS);
    aafUInt32 size = 0;
    EXPECT_EQ(tagged->ReadIndirectSize(aaf::prop::TaggedValue_Value, &size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, sizeof text);
    wchar_t read[5] = {};
    EXPECT_EQ(tagged->ReadIndirect(aaf::prop::TaggedValue_Value, read, sizeof read),
              AAFRESULT_SUCCESS);
    EXPECT_STREQ(read, text);
}

TEST_F(ObjectValues, IndirectValueOfAWrongSizeIsIllegal) {
    const wchar_t text[] = L"cell";
    EXPECT_EQ(
        tagged->PutIndirect(aaf::prop::TaggedValue_Value, Type(kAAFTypeID_Int32).get(), text, 3),
        AAFRESULT_ILLEGAL_VALUE);
    EXPECT_EQ(tagged->PutIndirect(aaf::prop::TaggedValue_Value, Type(kAAFTypeID_String).get(), text,
                                  sizeof(wchar_t) + 1),
              AAFRESULT_ILLEGAL_VALUE);
    EXPECT_FALSE(tagged->IsPresent(aaf::prop::TaggedValue_Value));
    EXPECT_EQ(tagged->PutIndirect(aaf::prop::TaggedValue_Value, nullptr, text, 4),
              AAFRESULT_NULL_PARAM);
    EXPECT_EQ(
        tagged->PutIndirect(aaf::prop::TaggedValue_Value, Type(kAAFTypeID_Int32).get(), nullptr, 4),
        AAFRESULT_NULL_PARAM);
}

TEST_F(ObjectValues, PropertiesWithoutAFixedNumberAreFoundById) {
    const auto mpeg = model->NewObject<aaf::Object>(AUID_AAFMPEGVideoDescriptor);
    ASSERT_EQ(mpeg->PutInteger(aaf::prop::MPEGVideoDescriptor_BitRate, 50000000),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(mpeg->IntegerOr(aaf::prop::MPEGVideoDescriptor_BitRate, 0), 50000000);
    EXPECT_GE(mpeg->values().begin()->first, 0x8000);
    // An object of another class has no such property, and none with the number 0.
    EXPECT_FALSE(picture->IsPresent(aaf::prop::MPEGVideoDescriptor_BitRate));
}

// A mob that is told of a change forgets where its slots lie, and looks for
// them anew.
TEST(WatchedValues, AreNotChangedByReadingThem) {
    aaf::ClassRegistry registry;
    registry.Add(kWatched);
    const auto model = aaf::Model::Create(registry);
    const auto object = model->NewObject<WatchedObject>(AUID_AAFCDCIDescriptor);
    ASSERT_TRUE(object);
    ASSERT_EQ(object->PutInteger(aaf::prop::FileDescriptor_Length, 7), AAFRESULT_SUCCESS);
    const int before = object->changes;
    EXPECT_GT(before, 0);

    aaf::PropertyValue* const value = object->FindValue(aaf::prop::FileDescriptor_Length);
    IAAFTypeDef* type = nullptr;
    ASSERT_EQ(value->GetType(&type), AAFRESULT_SUCCESS);
    const auto holder = aaf::RefPtr<IAAFTypeDef>::Adopt(type);
    void* found = nullptr;
    ASSERT_EQ(type->QueryInterface(aafIdOf(static_cast<const IAAFTypeDefRename*>(nullptr)), &found),
              AAFRESULT_SUCCESS);
    const auto rename =
        aaf::RefPtr<IAAFTypeDefRename>::Adopt(static_cast<IAAFTypeDefRename*>(found));
    IAAFPropertyValue* base = nullptr;
    ASSERT_EQ(rename->GetBaseValue(value, &base), AAFRESULT_SUCCESS);
    aaf::RefPtr<IAAFPropertyValue>::Adopt(base);
    aafInt64 length = 0;
    EXPECT_EQ(object->ReadInteger(aaf::prop::FileDescriptor_Length, &length), AAFRESULT_SUCCESS);
    EXPECT_EQ(object->changes, before);

    ASSERT_EQ(object->PutInteger(aaf::prop::FileDescriptor_Length, 8), AAFRESULT_SUCCESS);
    EXPECT_GT(object->changes, before);
}

}  // namespace
