// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/CommandLine.h"

#include <gtest/gtest.h>

namespace {

using host::text::CommandLine;

TEST(CommandLine, PlainWordsStandAsTheyAre) {
    EXPECT_EQ(CommandLine({"cliphost.exe", "scan", "C:\\a\\b"}), "cliphost.exe scan C:\\a\\b");
}

TEST(CommandLine, WordsWithSpacesAreQuoted) {
    EXPECT_EQ(CommandLine({"C:\\Program Files\\x.exe", "a\tb"}),
              "\"C:\\Program Files\\x.exe\" \"a\tb\"");
}

TEST(CommandLine, EmptyWordsStay) {
    EXPECT_EQ(CommandLine({"x", "", "y"}), "x \"\" y");
}

TEST(CommandLine, QuotationMarksAreEscaped) {
    EXPECT_EQ(CommandLine({"x", "say \"a\""}), "x \"say \\\"a\\\"\"");
}

TEST(CommandLine, BackslashesAreDoubledBeforeQuotationMarksAlone) {
    EXPECT_EQ(CommandLine({"x", "a b\\"}), "x \"a b\\\\\"");
    EXPECT_EQ(CommandLine({"x", "a\\\"b"}), "x \"a\\\\\\\"b\"");
    EXPECT_EQ(CommandLine({"x", "a\\b c"}), "x \"a\\b c\"");
}

}  // namespace
