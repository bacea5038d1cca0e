// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/UTF16Literal.h"

#include <gtest/gtest.h>

#include <string>

namespace {

template <class Body>
std::string Thrown(Body body) {
    try {
        body();
    } catch (const char* text) {
        return text;
    }
    return "nothing";
}

TEST(UTF16Literal, IsConvertedAtOnce) {
    const ncfUTF16LiteralToUTF16 literal(L"QuickTime");
    EXPECT_EQ(std::u16string(literal.GetUTF16()), u"QuickTime");
}

TEST(UTF16Literal, KeepsCharactersBeyondSixteenBits) {
    const ncfUTF16LiteralToUTF16 literal(L"a\U0001F3ACb");
    EXPECT_EQ(std::u16string(literal.GetUTF16()), u"a\U0001F3ACb");
}

TEST(UTF16Literal, MakesPairsFromTheFirstToTheLastCharacterBeyondSixteenBits) {
    const ncfUTF16LiteralToUTF16 literal(L"\xFFFF\x10000\x103FF\x10400\x10FFFF");
    const ncfUTF16 expected[] = {0xFFFF, 0xD800, 0xDC00, 0xD800, 0xDFFF,
                                 0xD801, 0xDC00, 0xDBFF, 0xDFFF, 0};
    EXPECT_EQ(std::u16string(literal.GetUTF16()), expected);
}

TEST(UTF16Literal, ThrowsTextForANullLiteral) {
    EXPECT_EQ(Thrown([] { ncfUTF16LiteralToUTF16 literal(nullptr); }),
              "ncfUTF16LiteralToUTF16::ncfUTF16LiteralToUTF16(ncfStringLiteralRef rhs) failed with "
              "rhs == 0!");
}

TEST(UTF16Literal, ThrowsTextWhenReadUnconverted) {
    const ncfUTF16LiteralToUTF16 literal(L"a", ncfUTF16LiteralToUTF16::Unconverted{});
    EXPECT_EQ(Thrown([&] { literal.GetUTF16(); }), "ncfUTF16LiteralToUTF16: mUTF16 was NULL!");
}

TEST(UTF16Literal, ThrowsTextWhenANullLiteralIsConverted) {
    ncfUTF16LiteralToUTF16 literal(nullptr, ncfUTF16LiteralToUTF16::Unconverted{});
    EXPECT_EQ(Thrown([&] { literal.ConvertStringRefToUTF16(); }),
              "ncfUTF16LiteralToUTF16::ConvertStringRefToUTF16 failed with mStrngRef == 0!");
}

}  // namespace
