// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ShownText.h"

#include <gtest/gtest.h>

namespace {

using host::ShownText;

TEST(ShownText, LeavesOrdinaryTextAlone) {
    EXPECT_EQ(ShownText("", 5), "");
    EXPECT_EQ(ShownText("Schn\xC3\xBCrsenkel", 60), "Schn\xC3\xBCrsenkel");
    EXPECT_EQ(ShownText(" ~\xC2\xA0", 60), " ~\xC2\xA0") << "the neighbours of controls";
}

TEST(ShownText, PutsSpacesInPlaceOfControls) {
    EXPECT_EQ(ShownText("a\nb\r\tc\x1B[31m\x7F", 60), "a b  c [31m ");
    EXPECT_EQ(ShownText("\xC2\x80\xC2\x9B"
                        "2J\xC2\x9F",
                        60),
              "  2J ");
    EXPECT_EQ(ShownText("a\xE2\x80\xA8"
                        "b\xE2\x80\xA9"
                        "c",
                        60),
              "a b c")
        << "ends of lines and paragraphs";
}

TEST(ShownText, CutsBetweenCharacters) {
    EXPECT_EQ(ShownText("\xE2\x82\xAC\xE2\x82\xAC", 2), "\xE2\x82\xAC\xE2\x82\xAC");
    EXPECT_EQ(ShownText("\xE2\x82\xAC\xE2\x82\xAC\xE2\x82\xAC", 2), "\xE2\x82\xAC\xE2\x82\xAC...");
    EXPECT_EQ(ShownText("abc", 0), "...");
}

}  // namespace
