// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/AafValue.h"

#include <gtest/gtest.h>

using cliphost::ToText;

namespace {

constexpr aafUID_t kId = ncfGuid("01234567-89AB-CDEF-0F1E-2D3C4B5A6978");

aafTimeStamp_t TimeOf(aafInt16 year) {
    aafTimeStamp_t time{};
    time.date = {year, 1, 31};
    time.time = {9, 5, 59, 7};
    return time;
}

}  // namespace

TEST(AafValueTexts, IdsAreInBracesAndUpperCase) {
    EXPECT_EQ(ToText(kId), "{01234567-89AB-CDEF-0F1E-2D3C4B5A6978}");
    EXPECT_EQ(ToText(aafUID_t{}), "{00000000-0000-0000-0000-000000000000}");
}

TEST(AafValueTexts, MobIdsAreEightGroupsOfFourBytes) {
    aafMobID_t id{};
    for (unsigned char i = 0; i < 12; ++i) {
        id.SMPTELabel[i] = static_cast<unsigned char>(0xA0 + i);
    }
    id.length = 0x13;
    id.instanceHigh = 0xB1;
    id.instanceMid = 0x02;
    id.instanceLow = 0x03;
    id.material = kId;
    EXPECT_EQ(ToText(id),
              "urn:smpte:umid:a0a1a2a3.a4a5a6a7.a8a9aaab.13b10203.01234567.89abcdef.0f1e2d3c."
              "4b5a6978");
}

TEST(AafValueTexts, TimesHaveTheSameWidthAndASignCounts) {
    EXPECT_EQ(ToText(TimeOf(2026)), "2026-01-31T09:05:59.07Z");
    EXPECT_EQ(ToText(TimeOf(7)), "0007-01-31T09:05:59.07Z");
    EXPECT_EQ(ToText(TimeOf(-7)), "-007-01-31T09:05:59.07Z");
    EXPECT_EQ(ToText(TimeOf(-32768)), "-32768-01-31T09:05:59.07Z");
}

TEST(AafValueTexts, VersionsAndRationalsAreNumbersWithAMark) {
    EXPECT_EQ(ToText(aafVersionType_t{1, -2}), "1.-2");
    EXPECT_EQ(ToText(aafRational_t{-30000, 1001}), "-30000/1001");
}
