// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/Number.h"

#include <gtest/gtest.h>

#include <cstdint>

TEST(ReadNumber, TakesATextThatHoldsNothingElse) {
    std::uint32_t whole = 7;
    EXPECT_TRUE(host::text::ReadNumber("4294967295", whole));
    EXPECT_EQ(whole, 4294967295u);
    double real = 0.0;
    EXPECT_TRUE(host::text::ReadNumber("23.5", real));
    EXPECT_EQ(real, 23.5);
    for (const char* const text : {"", " 1", "1 ", "1x", "-1", "4294967296"}) {
        EXPECT_FALSE(host::text::ReadNumber(text, whole)) << text;
    }
}
