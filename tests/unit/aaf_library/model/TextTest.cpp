// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Text.h"

#include <gtest/gtest.h>

#include "host_interfaces/aaf/AAFResultCodes.h"

namespace {

TEST(StoredTexts, CharactersBeyondTheBasicPlaneBecomePairsAndComeBack) {
    const std::wstring text = L"a\U0001F3AC";
    const aaf::Bytes stored = aaf::StoredText(text);
    EXPECT_EQ(stored, (aaf::Bytes{0x61, 0, 0x3C, 0xD8, 0xAC, 0xDF, 0, 0}));
    EXPECT_EQ(aaf::TextOfStored(stored), text);
}

TEST(StoredTexts, FirstAndLastPairComeBackAndTheirNeighboursAreNoPair) {
    const std::wstring text = L"\U00010000\U0010FFFF";
    const aaf::Bytes stored = aaf::StoredText(text);
    EXPECT_EQ(stored, (aaf::Bytes{0, 0xD8, 0, 0xDC, 0xFF, 0xDB, 0xFF, 0xDF, 0, 0}));
    EXPECT_EQ(aaf::TextOfStored(stored), text);
    for (const aaf::Bytes& lone : {aaf::Bytes{0, 0xD8, 0xFF, 0xDB}, aaf::Bytes{0, 0xD8, 0, 0xE0},
                                   aaf::Bytes{0xFF, 0xD7, 0, 0xDC}, aaf::Bytes{0, 0xDC, 0, 0xDC}}) {
        EXPECT_EQ(aaf::FromUtf16(lone.data(), lone.size()).size(), 2u);
    }
}

TEST(StoredTexts, LoneSurrogatesPassBothWays) {
    const std::wstring text(1, static_cast<wchar_t>(0xDC80));
    EXPECT_EQ(aaf::StoredText(text), (aaf::Bytes{0x80, 0xDC, 0, 0}));
    EXPECT_EQ(aaf::TextOfStored(aaf::StoredText(text)), text);
    EXPECT_EQ(aaf::FromUtf16(aaf::Bytes{0x3C, 0xD8}.data(), 2).size(), 1u);
}

TEST(StoredTexts, AreCountedAndCopiedAsTheyAreRead) {
    for (const aaf::Bytes& stored :
         {aaf::Bytes{}, aaf::Bytes{0x61}, aaf::Bytes{0x61, 0, 0x7F, 0}, aaf::Bytes{0x61, 0, 0x62},
          aaf::Bytes{0x80, 0}, aaf::Bytes{0x61, 1}, aaf::Bytes{0x61, 0, 0x3C, 0xD8, 0xAC, 0xDF}}) {
        const std::wstring text = aaf::FromUtf16(stored.data(), stored.size());
        EXPECT_EQ(aaf::CountOfUtf16(stored.data(), stored.size()), text.size());
        wchar_t buffer[8] = {};
        const std::size_t bytes = text.size() * sizeof(wchar_t);
        EXPECT_EQ(aaf::CopyUtf16(stored.data(), stored.size(), buffer, bytes), AAFRESULT_SUCCESS);
        EXPECT_EQ(std::wstring(buffer, text.size()), text);
        EXPECT_EQ(buffer[text.size()], L'\0');
        if (bytes > 0) {
            EXPECT_EQ(aaf::CopyUtf16(stored.data(), stored.size(), buffer, bytes - 1),
                      AAFRESULT_SMALLBUF);
        }
    }
}

TEST(StoredTexts, OddByteAtTheEndIsDropped) {
    const aaf::Bytes stored{0x61, 0, 0x62};
    EXPECT_EQ(aaf::TextOfStored(stored), L"a");
}

TEST(StoredTexts, WhatIsNoCharacterIsReplaced) {
    if (sizeof(wchar_t) == 4) {
        const std::wstring text(1, static_cast<wchar_t>(0x6E556E6B));
        EXPECT_EQ(aaf::StoredText(text), (aaf::Bytes{0xFD, 0xFF, 0, 0}));
    }
}

TEST(StoredTexts, TextEndsAtItsZero) {
    EXPECT_EQ(aaf::TextOfStored({0x61, 0, 0, 0, 0x62, 0}), L"a");
    EXPECT_EQ(aaf::TextOfStored({}), L"");
}

TEST(StoredTexts, CopyTellsNullFromTooSmall) {
    wchar_t buffer[2] = {};
    EXPECT_EQ(aaf::CopyText(L"a", nullptr, 100), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(aaf::CopyText(L"ab", buffer, sizeof buffer), AAFRESULT_SMALLBUF);
    EXPECT_EQ(aaf::CopyText(L"a", buffer, sizeof buffer), AAFRESULT_SUCCESS);
    EXPECT_EQ(aaf::TextSize(L"a", nullptr), AAFRESULT_NULL_PARAM);
}

}  // namespace
