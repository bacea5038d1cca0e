// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/Printable.h"

#include <gtest/gtest.h>

namespace {

using host::text::Printable;

TEST(Printable, LeavesOrdinaryTextAlone) {
    EXPECT_EQ(Printable(""), "");
    EXPECT_EQ(Printable("a b\\c"), "a b\\c");
    EXPECT_EQ(Printable("caf\xC3\xA9 \xE2\x82\xAC \xF0\x9F\x8E\xAC"),
              "caf\xC3\xA9 \xE2\x82\xAC \xF0\x9F\x8E\xAC");
    EXPECT_EQ(Printable(" ~\xC2\xA0"), " ~\xC2\xA0") << "the neighbours of controls";
}

TEST(Printable, EscapesControlsAsAShellReadsThem) {
    EXPECT_EQ(Printable("a\nb\r\tc"), "a\\nb\\r\\tc");
    EXPECT_EQ(Printable("\x1B[31m\x7F"), "\\x1B[31m\\x7F");
    EXPECT_EQ(Printable(std::string_view("\0", 1)), "\\x00");
    EXPECT_EQ(Printable("\xC2\x9B"
                        "2J"),
              "\\xC2\\x9B2J")
        << "the one character that begins a command";
}

TEST(Printable, EscapesEndsOfLinesAndTurnsOfDirection) {
    EXPECT_EQ(Printable("\xE2\x80\xA8"), "\\xE2\\x80\\xA8");
    EXPECT_EQ(Printable("gpj.\xE2\x80\xAEmov"), "gpj.\\xE2\\x80\\xAEmov");
    EXPECT_EQ(Printable("\xE2\x81\xA6"), "\\xE2\\x81\\xA6");
}

TEST(Printable, KeepsTheLinesOfATextOfSeveral) {
    EXPECT_EQ(host::text::PrintableLines("a\n b\x1B[2J\r\n"), "a\n b\\x1B[2J\\r\n");
}

TEST(Printable, EscapesBytesThatAreNoText) {
    EXPECT_EQ(Printable("caf\xE9.mov"), "caf\\xE9.mov");
    EXPECT_EQ(Printable("\x9B"
                        "2J"),
              "\\x9B2J");
}

}  // namespace
