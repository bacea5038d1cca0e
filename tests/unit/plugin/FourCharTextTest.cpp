// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/FourCharText.h"

#include <gtest/gtest.h>

TEST(FourCharText, ReadsFromTheTopByteDown) {
    EXPECT_EQ(FourCharText(0x61766331), "avc1");
    EXPECT_EQ(FourCharText(0x72617720), "raw ");
}

TEST(FourCharText, MasksWhatIsNotPrintable) {
    EXPECT_EQ(FourCharText(0), "????");
    EXPECT_EQ(FourCharText(0x00414200), "?AB?");
    EXPECT_EQ(FourCharText(0xFF7F1F7E), "???~");
}
