// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "reference_host/framework/String.h"

using host::MakeString;

namespace {

ncfSInt32 Find(INCFString* string, char32_t wanted, ncfSInt32 from, bool forward) {
    ncfSInt32 at = 77;
    EXPECT_EQ(NCF_OK, string->FindCharacter(wanted, from, forward ? 1 : 0, &at));
    return at;
}

ncfSInt32 FindWide(INCFString* string, const wchar_t* text, ncfUInt32 units, ncfUInt32 from) {
    ncfSInt32 at = 77;
    EXPECT_EQ(NCF_OK, string->FindWCHAR(text, units, from, &at));
    return at;
}

}  // namespace

TEST(StringSearch, FindsForwardFromAnElementOnwards) {
    for (const ncfUInt32 encoding : {kNCFUTF8, kNCFUTF16, kNCFUTF32, kNCFWCHAR}) {
        const auto string = MakeString("a.b.c", encoding);
        EXPECT_EQ(1, Find(string.get(), U'.', 0, true));
        EXPECT_EQ(1, Find(string.get(), U'.', 1, true)) << "the first element counts";
        EXPECT_EQ(3, Find(string.get(), U'.', 2, true));
        EXPECT_EQ(1, Find(string.get(), U'.', -1, true));
    }
}

TEST(StringSearch, FindsBackwardFromAnElementDown) {
    const auto string = MakeString("a.b.c", kNCFUTF32);
    EXPECT_EQ(3, Find(string.get(), U'.', 4, false));
    EXPECT_EQ(3, Find(string.get(), U'.', 3, false));
    EXPECT_EQ(1, Find(string.get(), U'.', 2, false));
    EXPECT_EQ(3, Find(string.get(), U'.', 1000, false));
    EXPECT_EQ(-1, Find(string.get(), U'.', 0, false));
    EXPECT_EQ(-1, Find(string.get(), U'.', -1, false));
}

TEST(StringSearch, NotFoundIsNoFailure) {
    const auto string = MakeString("abc", kNCFWCHAR);
    EXPECT_EQ(-1, Find(string.get(), U'x', 0, true));
    EXPECT_EQ(-1, Find(string.get(), U'a', 1, true));
    EXPECT_EQ(-1, Find(string.get(), U'a', 3, true)) << "behind the last element";
    EXPECT_EQ(-1, Find(string.get(), U'a', 1000, true));
    EXPECT_EQ(-1, Find(string.get(), 0x110000, 0, true));
    EXPECT_EQ(-1, FindWide(string.get(), L"Apple", 5, 0));
    EXPECT_EQ(-1, FindWide(string.get(), L"abc", 3, 1));
    EXPECT_EQ(-1, FindWide(string.get(), L"abc", 3, 1000));
    EXPECT_EQ(-1, FindWide(MakeString("", kNCFWCHAR).get(), L"a", 1, 0));
}

TEST(StringSearch, PlacesAreUnitsOfTheEncodingHeld) {
    EXPECT_EQ(3, Find(MakeString(U"\u20AC\u00E9", kNCFUTF8).get(), U'\u00E9', 0, true));
    EXPECT_EQ(2, Find(MakeString(U"\U0001F3ACx", kNCFUTF16).get(), U'x', 0, true));
    EXPECT_EQ(0, Find(MakeString(U"\U0001F3ACx", kNCFUTF16).get(), U'\U0001F3AC', 0, true));
}

TEST(StringSearch, FindsWideTextCountedOrTerminated) {
    const auto string = MakeString("Apple ProRes Apple", kNCFWCHAR);
    EXPECT_EQ(0, FindWide(string.get(), L"Apple", 5, 0));
    EXPECT_EQ(13, FindWide(string.get(), L"Apple", 5, 1));
    EXPECT_EQ(6, FindWide(string.get(), L"ProRes", kNCFZeroTerminated, 0));
    EXPECT_EQ(6, FindWide(string.get(), L"Pxx", 1, 0));
}

TEST(StringSearch, WideTextIsLookedForInWideStringsOnly) {
    ncfSInt32 at = 77;
    EXPECT_EQ(NCF_E_FAIL, MakeString("Apple", kNCFUTF8)->FindWCHAR(L"Apple", 5, 0, &at));
    EXPECT_EQ(77, at);
}

TEST(StringSearch, RefusesNulls) {
    const auto string = MakeString("abc", kNCFWCHAR);
    ncfSInt32 at = 0;
    EXPECT_EQ(NCF_E_POINTER, string->FindCharacter(U'a', 0, 1, nullptr));
    EXPECT_EQ(NCF_E_POINTER, string->FindWCHAR(nullptr, 1, 0, &at));
    EXPECT_EQ(NCF_E_POINTER, string->FindWCHAR(L"a", 1, 0, nullptr));
}
