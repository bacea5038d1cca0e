// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Words.h"

#include <gtest/gtest.h>

using cliphost::Counted;
using cliphost::NumberedFromZero;

TEST(Words, CountInTheRightNumber) {
    EXPECT_EQ(Counted(0, "channel"), "no channels");
    EXPECT_EQ(Counted(1, "channel"), "1 channel");
    EXPECT_EQ(Counted(2, "channel"), "2 channels");
}

TEST(Words, NameWhatIsNumberedFromZero) {
    EXPECT_EQ(NumberedFromZero(0, "frame"), "it has no frames");
    EXPECT_EQ(NumberedFromZero(1, "frame"), "it has 1 frame, frame 0");
    EXPECT_EQ(NumberedFromZero(25, "frame"), "it has 25 frames, 0 to 24");
}
