// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "text/Encodings.h"

#include <gtest/gtest.h>

namespace {

// One, two, three and four bytes of UTF-8: A, é, €, and a character beyond the
// first plane.
const std::string kUtf8 = "A\xC3\xA9\xE2\x82\xAC\xF0\x9F\x8E\xAC";
const std::u16string kUtf16 = u"A\u00E9\u20AC\U0001F3AC";
const std::u32string kUtf32 = U"A\u00E9\u20AC\U0001F3AC";
const std::wstring kWide = L"A\u00E9\u20AC\U0001F3AC";

std::u32string Carried(std::initializer_list<unsigned> bytes) {
    std::u32string out;
    for (const unsigned byte : bytes) {
        out.push_back(0xDC00 + byte);
    }
    return out;
}

}  // namespace

TEST(Encodings, DecodesSequencesOfEveryLength) {
    EXPECT_EQ(kUtf32, encodings::FromUtf8(kUtf8));
    EXPECT_EQ(kUtf32, encodings::FromUtf16(kUtf16));
    EXPECT_EQ(kUtf32, encodings::FromWide(kWide));
}

TEST(Encodings, EncodesSequencesOfEveryLength) {
    std::string utf8;
    std::u16string utf16;
    std::u32string utf32;
    std::wstring wide;
    EXPECT_TRUE(encodings::ToUtf8(kUtf32, utf8));
    EXPECT_TRUE(encodings::ToUtf16(kUtf32, utf16));
    EXPECT_TRUE(encodings::ToUtf32(kUtf32, utf32));
    EXPECT_TRUE(encodings::ToWide(kUtf32, wide));
    EXPECT_EQ(kUtf8, utf8);
    EXPECT_EQ(kUtf16, utf16);
    EXPECT_EQ(kUtf32, utf32);
    EXPECT_EQ(kWide, wide);
}

TEST(Encodings, HoldsTheEdgesOfEachLength) {
    for (const char32_t c : {0x7F, 0x80, 0x7FF, 0x800, 0xD7FF, 0xE000, 0xFFFF, 0x10000, 0x10FFFF}) {
        const std::u32string one(1, c);
        std::string utf8;
        std::u16string utf16;
        ASSERT_TRUE(encodings::ToUtf8(one, utf8));
        ASSERT_TRUE(encodings::ToUtf16(one, utf16));
        EXPECT_EQ(one, encodings::FromUtf8(utf8)) << std::hex << static_cast<unsigned>(c);
        EXPECT_EQ(one, encodings::FromUtf16(utf16)) << std::hex << static_cast<unsigned>(c);
    }
}

TEST(Encodings, CarriesEveryStrayByteAndGivesItBack) {
    for (unsigned byte = 0x80; byte <= 0xFF; ++byte) {
        const std::string bytes = {'a', static_cast<char>(byte), 'b'};
        const std::u32string decoded = encodings::FromUtf8(bytes);
        EXPECT_EQ(U"a" + Carried({byte}) + U"b", decoded);
        std::string back;
        ASSERT_TRUE(encodings::ToUtf8(decoded, back));
        EXPECT_EQ(bytes, back);
    }
}

TEST(Encodings, CarriesBytesThroughTheWideEncodings) {
    const std::string bytes = "x\xFF\xC3y";
    std::u16string utf16;
    std::wstring wide;
    ASSERT_TRUE(encodings::ToUtf16(encodings::FromUtf8(bytes), utf16));
    ASSERT_TRUE(encodings::ToWide(encodings::FromUtf8(bytes), wide));
    EXPECT_EQ(0xDCFF, utf16[1]);
    std::string back;
    ASSERT_TRUE(encodings::ToUtf8(encodings::FromUtf16(utf16), back));
    EXPECT_EQ(bytes, back);
    ASSERT_TRUE(encodings::ToUtf8(encodings::FromWide(wide), back));
    EXPECT_EQ(bytes, back);
}

TEST(Encodings, TakesNoSequenceThatIsTooLongForItsCharacter) {
    EXPECT_EQ(Carried({0xC0, 0xAF}), encodings::FromUtf8("\xC0\xAF"));
    EXPECT_EQ(Carried({0xE0, 0x80, 0xAF}), encodings::FromUtf8("\xE0\x80\xAF"));
    EXPECT_EQ(Carried({0xF0, 0x80, 0x80, 0xAF}), encodings::FromUtf8("\xF0\x80\x80\xAF"));
}

TEST(Encodings, TakesNoSurrogateAndNothingBeyondTheLastCharacterFromUtf8) {
    EXPECT_EQ(Carried({0xED, 0xA0, 0x80}), encodings::FromUtf8("\xED\xA0\x80"));
    EXPECT_EQ(Carried({0xF4, 0x90, 0x80, 0x80}), encodings::FromUtf8("\xF4\x90\x80\x80"));
}

TEST(Encodings, CarriesASequenceThatIsCutOff) {
    EXPECT_EQ(U"a" + Carried({0xE2, 0x82}), encodings::FromUtf8("a\xE2\x82"));
    EXPECT_EQ(Carried({0xE2}) + U"a", encodings::FromUtf8("\xE2"
                                                          "a"));
}

TEST(Encodings, KeepsLoneSurrogatesInTheWideEncodingsOnly) {
    const std::u16string lone = {u'a', 0xD800, u'b'};
    const std::u32string decoded = encodings::FromUtf16(lone);
    ASSERT_EQ(3u, decoded.size());
    std::u16string back;
    ASSERT_TRUE(encodings::ToUtf16(decoded, back));
    EXPECT_EQ(lone, back);
    std::string utf8 = "as before";
    EXPECT_FALSE(encodings::ToUtf8(decoded, utf8));
    EXPECT_EQ("as before", utf8);
}

TEST(Encodings, RefusesWhatIsNoCharacter) {
    const std::u32string beyond(1, 0x110000);
    std::string utf8;
    std::u16string utf16;
    std::u32string utf32;
    std::wstring wide;
    EXPECT_FALSE(encodings::ToUtf8(beyond, utf8));
    EXPECT_FALSE(encodings::ToUtf16(beyond, utf16));
    EXPECT_FALSE(encodings::ToUtf32(beyond, utf32));
    EXPECT_FALSE(encodings::ToWide(beyond, wide));
}

TEST(Encodings, HasNoPlaceForAccentsInAscii) {
    std::string out = "as before";
    EXPECT_FALSE(encodings::ToAscii(U"caf\u00E9", out));
    EXPECT_EQ("as before", out);
    EXPECT_TRUE(encodings::ToAscii(U"cafe", out));
    EXPECT_EQ("cafe", out);
}

TEST(Encodings, ReplacesWhatHasNoPlaceWhereOutputMayNotFail) {
    const std::u32string lone = {U'a', 0xD800};
    EXPECT_EQ("a\xEF\xBF\xBD", encodings::ToUtf8Lossy(lone));
    EXPECT_EQ(u"a\uFFFD", encodings::ToUtf16Lossy(std::u32string{U'a', 0x110000}));
    EXPECT_EQ(L"a\uFFFD", encodings::ToWideLossy(std::u32string{U'a', 0x110000}));
}
