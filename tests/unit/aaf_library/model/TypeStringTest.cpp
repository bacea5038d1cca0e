// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class StringTypes : public ModelFixture {
protected:
    Ptr<IAAFTypeDefString> type = TypeAs<IAAFTypeDefString>(kAAFTypeID_String);
    Ptr<IAAFPropertyValue> Make(std::wstring text) {
        return Out(type, &IAAFTypeDefString::CreateValueFromCString,
                   reinterpret_cast<aafMemPtr_t>(&text[0]),
                   static_cast<aafUInt32>((text.size() + 1) * sizeof(wchar_t)));
    }
};

TEST_F(StringTypes, CountIncludesTheZero) {
    aafUInt32 count = 0;
    EXPECT_EQ(type->GetCount(Make(L"abc").get(), &count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 4u);
}

TEST_F(StringTypes, TextIsReadIntoALargeEnoughBuffer) {
    wchar_t buffer[4] = {};
    const auto value = Make(L"abc");
    EXPECT_EQ(type->GetElements(value.get(), reinterpret_cast<aafMemPtr_t>(buffer), sizeof buffer),
              AAFRESULT_SUCCESS);
    EXPECT_STREQ(buffer, L"abc");
    EXPECT_EQ(
        type->GetElements(value.get(), reinterpret_cast<aafMemPtr_t>(buffer), sizeof buffer - 1),
        AAFRESULT_SMALLBUF);
}

TEST_F(StringTypes, ElementsAreAppendedBeforeTheZero) {
    const auto value = Make(L"ab");
    wchar_t more[] = L"cd";
    ASSERT_EQ(type->AppendElements(value.get(), reinterpret_cast<aafMemPtr_t>(more)),
              AAFRESULT_SUCCESS);
    wchar_t buffer[5] = {};
    EXPECT_EQ(type->GetElements(value.get(), reinterpret_cast<aafMemPtr_t>(buffer), sizeof buffer),
              AAFRESULT_SUCCESS);
    EXPECT_STREQ(buffer, L"abcd");
}

TEST_F(StringTypes, HalfACharacterIsRefused) {
    IAAFPropertyValue* out = nullptr;
    wchar_t text[] = L"a";
    EXPECT_EQ(type->CreateValueFromCString(reinterpret_cast<aafMemPtr_t>(text), 5, &out),
              AAFRESULT_BAD_SIZE);
    EXPECT_EQ(type->CreateValueFromCString(nullptr, 4, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(type->SetCString(Make(L"a").get(), reinterpret_cast<aafMemPtr_t>(text), 3),
              AAFRESULT_BAD_SIZE);
    EXPECT_EQ(type->SetCString(nullptr, reinterpret_cast<aafMemPtr_t>(text), 4),
              AAFRESULT_NULL_PARAM);
}

TEST_F(StringTypes, CharactersAreValuesOfTheirOwn) {
    const auto character = TypeAs<IAAFTypeDefCharacter>(kAAFTypeID_Character);
    const auto value = Out(character, &IAAFTypeDefCharacter::CreateValueFromCharacter, L'x');
    aafCharacter read = 0;
    EXPECT_EQ(character->GetCharacter(value.get(), &read), AAFRESULT_SUCCESS);
    EXPECT_EQ(read, L'x');
    EXPECT_EQ(character->SetCharacter(value.get(), L'y'), AAFRESULT_SUCCESS);
    EXPECT_EQ(character->GetCharacter(value.get(), &read), AAFRESULT_SUCCESS);
    EXPECT_EQ(read, L'y');
    EXPECT_EQ(character->GetCharacter(value.get(), nullptr), AAFRESULT_NULL_PARAM);
}

}  // namespace
