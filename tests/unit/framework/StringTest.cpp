// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/String.h"

#include <gtest/gtest.h>

using host::MakeRef;
using host::MakeString;
using host::String;

namespace {

constexpr ncfUInt32 kAll[] = {kNCFASCII, kNCFUTF8, kNCFUTF16, kNCFUTF32, kNCFWCHAR};
constexpr ncfUInt32 kBeyondAscii[] = {kNCFUTF8, kNCFUTF16, kNCFUTF32, kNCFWCHAR};
constexpr char32_t kMixed[] = U"A\u00E9\u20AC\U0001F3AC";

}  // namespace

TEST(String, StartsEmptyInUtf16) {
    const auto string = MakeRef<String>();
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF16), string->GetEncoding());
    EXPECT_EQ(0u, string->GetLength());
    EXPECT_EQ(1, string->IsEmpty());
    char16_t* units = nullptr;
    ASSERT_EQ(NCF_OK, string->GetRawUTF16(&units));
    EXPECT_EQ(u'\0', *units);
}

TEST(String, ConvertsBetweenEveryPairOfEncodings) {
    for (const ncfUInt32 from : kBeyondAscii) {
        for (const ncfUInt32 to : kBeyondAscii) {
            const auto string = MakeString(kMixed, from);
            EXPECT_EQ(NCF_OK, string->ConvertTo(to)) << from << " to " << to;
            EXPECT_EQ(to, string->GetEncoding());
            EXPECT_EQ(kMixed, string->Text()) << from << " to " << to;
        }
    }
    for (const ncfUInt32 from : kAll) {
        for (const ncfUInt32 to : kAll) {
            const auto string = MakeString(U"plain", from);
            EXPECT_EQ(NCF_OK, string->ConvertTo(to)) << from << " to " << to;
            EXPECT_EQ(U"plain", string->Text());
        }
    }
}

TEST(String, CountsItsLengthInUnitsOfTheEncodingHeld) {
    EXPECT_EQ(10u, MakeString(kMixed, kNCFUTF8)->GetLength());
    EXPECT_EQ(5u, MakeString(kMixed, kNCFUTF16)->GetLength());
    EXPECT_EQ(4u, MakeString(kMixed, kNCFUTF32)->GetLength());
    EXPECT_EQ(sizeof(wchar_t) == 2 ? 5u : 4u, MakeString(kMixed, kNCFWCHAR)->GetLength());
}

TEST(String, AnImpossibleConversionLeavesItUnchanged) {
    for (const ncfUInt32 from : kBeyondAscii) {
        const auto string = MakeString(kMixed, from);
        EXPECT_EQ(NCF_E_FAIL, string->ConvertTo(kNCFASCII));
        EXPECT_EQ(from, string->GetEncoding());
        EXPECT_EQ(kMixed, string->Text());
    }
    const auto lone = MakeRef<String>();
    const char16_t units[] = {u'a', 0xD800};
    ASSERT_EQ(NCF_OK, lone->AssignUTF16(kNCFUTF16, units, 2));
    EXPECT_EQ(NCF_E_FAIL, lone->ConvertTo(kNCFUTF8));
    EXPECT_EQ(2u, lone->GetLength());
    EXPECT_EQ(NCF_E_INVALIDARG, lone->ConvertTo(5));
}

TEST(String, CarriesStrayBytesThroughEveryEncoding) {
    const auto string = MakeRef<String>();
    ASSERT_EQ(NCF_OK, string->AssignUTF8(kNCFUTF8, "a\xFF\xE9z", 4));
    for (const ncfUInt32 encoding : {kNCFUTF16, kNCFUTF32, kNCFWCHAR, kNCFUTF8}) {
        ASSERT_EQ(NCF_OK, string->ConvertTo(encoding));
    }
    char* bytes = nullptr;
    ASSERT_EQ(NCF_OK, string->GetRawUTF8(&bytes));
    EXPECT_STREQ("a\xFF\xE9z", bytes);
}

TEST(String, AssignsCountedAndTerminatedText) {
    const auto string = MakeRef<String>();
    EXPECT_EQ(NCF_OK, string->AssignUTF8(kNCFUTF32, "abcdef", 3));
    EXPECT_EQ(U"abc", string->Text());
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF32), string->GetEncoding());
    EXPECT_EQ(NCF_OK, string->AssignUTF16(kNCFUTF8, u"wide", kNCFZeroTerminated));
    EXPECT_EQ(U"wide", string->Text());
    EXPECT_EQ(NCF_OK, string->AssignWCHAR(kNCFWCHAR, L"wider", 4));
    EXPECT_EQ(U"wide", string->Text());
    EXPECT_EQ(NCF_OK, string->AssignUTF8(kNCFUTF16, "a\0b", 3));
    EXPECT_EQ(3u, string->GetLength());
}

TEST(String, AFailedAssignmentLeavesItUnchanged) {
    const auto string = MakeString("before");
    EXPECT_EQ(NCF_E_FAIL, string->AssignUTF8(kNCFASCII, "caf\xC3\xA9", kNCFZeroTerminated));
    EXPECT_EQ(NCF_E_POINTER, string->AssignUTF8(kNCFUTF8, nullptr, 3));
    EXPECT_EQ(NCF_E_POINTER, string->AssignUTF16(kNCFUTF8, nullptr, kNCFZeroTerminated));
    EXPECT_EQ(NCF_E_INVALIDARG, string->AssignWCHAR(5, L"x", 1));
    EXPECT_EQ(NCF_E_POINTER, string->Assign(nullptr));
    EXPECT_EQ(U"before", string->Text());
    EXPECT_EQ(NCF_OK, string->AssignUTF8(kNCFUTF8, nullptr, 0));
    EXPECT_EQ(1, string->IsEmpty());
}

TEST(String, MayBeAssignedAPartOfItself) {
    const auto string = MakeString("one \xFF two", kNCFUTF8);
    char* units = nullptr;
    ASSERT_EQ(NCF_OK, string->GetRawUTF8(&units));
    EXPECT_EQ(NCF_OK, string->AssignUTF8(kNCFUTF8, units + 4, 5));
    ASSERT_EQ(NCF_OK, string->GetRawUTF8(&units));
    EXPECT_STREQ("\xFF two", units);
    EXPECT_EQ(U"\xDCFF two", string->Text());
}

TEST(String, AssignTakesTextAndEncoding) {
    const auto source = MakeString(kMixed, kNCFUTF32);
    const auto string = MakeString("before", kNCFUTF8);
    EXPECT_EQ(NCF_OK, string->Assign(source.get()));
    EXPECT_EQ(kMixed, string->Text());
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF32), string->GetEncoding());
    EXPECT_EQ(NCF_OK, string->Assign(string.get()));
    EXPECT_EQ(kMixed, string->Text());
}

TEST(String, ConvertCopyLeavesTheOriginal) {
    const auto string = MakeString(kMixed, kNCFUTF8);
    host::Ref<INCFString> copy;
    ASSERT_EQ(NCF_OK, string->ConvertCopy(kNCFWCHAR, copy.Out()));
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFWCHAR), copy->GetEncoding());
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF8), string->GetEncoding());
    INCFString* none = string.get();
    EXPECT_EQ(NCF_E_FAIL, string->ConvertCopy(kNCFASCII, &none));
    EXPECT_EQ(nullptr, none);
    EXPECT_EQ(NCF_E_POINTER, string->ConvertCopy(kNCFUTF8, nullptr));
}

TEST(String, ShowsItsBufferInTheEncodingHeldOnly) {
    for (const ncfUInt32 encoding : kAll) {
        const auto string = MakeString("text", encoding);
        char* utf8 = reinterpret_cast<char*>(1);
        char16_t* utf16 = reinterpret_cast<char16_t*>(2);
        char32_t* utf32 = reinterpret_cast<char32_t*>(4);
        wchar_t* wide = reinterpret_cast<wchar_t*>(4);
        const bool bytes = encoding == kNCFASCII || encoding == kNCFUTF8;
        EXPECT_EQ(bytes ? NCF_OK : NCF_E_FAIL, string->GetRawUTF8(&utf8));
        EXPECT_EQ(encoding == kNCFUTF16 ? NCF_OK : NCF_E_FAIL, string->GetRawUTF16(&utf16));
        EXPECT_EQ(encoding == kNCFUTF32 ? NCF_OK : NCF_E_FAIL, string->GetRawUTF32(&utf32));
        EXPECT_EQ(encoding == kNCFWCHAR ? NCF_OK : NCF_E_FAIL, string->GetRawWCHAR(&wide));
        EXPECT_EQ(bytes, utf8 != nullptr);
        EXPECT_EQ(encoding == kNCFUTF16, utf16 != nullptr);
        EXPECT_EQ(encoding == kNCFUTF32, utf32 != nullptr);
        EXPECT_EQ(encoding == kNCFWCHAR, wide != nullptr);
    }
    EXPECT_EQ(NCF_E_POINTER, MakeString("text", kNCFUTF8)->GetRawUTF8(nullptr));
}

TEST(String, ItsBufferIsLiveAndWritable) {
    const auto string = MakeString("a/b", kNCFUTF32);
    char32_t* units = nullptr;
    ASSERT_EQ(NCF_OK, string->GetRawUTF32(&units));
    EXPECT_EQ(U'\0', units[3]);
    units[1] = U'\\';
    EXPECT_EQ(U"a\\b", string->Text());
    units[1] = 0x110000;
    EXPECT_EQ(NCF_E_FAIL, string->ConvertTo(kNCFUTF16)) << "what was written is no character";
}
