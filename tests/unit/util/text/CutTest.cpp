// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/Cut.h"

#include <gtest/gtest.h>

#include <string>

namespace {

using host::text::StartOf;

TEST(StartOfText, IsTheWholeWhereThereIsRoom) {
    EXPECT_EQ(StartOf("", 0), "");
    EXPECT_EQ(StartOf("abc", 3), "abc");
    EXPECT_EQ(StartOf("abc", 100), "abc");
}

TEST(StartOfText, EndsBetweenCharacters) {
    const std::string text = "a\xC3\xA9\xE2\x82\xAC\xF0\x9F\x8E\xAC!";  // of 1, 2, 3, 4 and 1 bytes
    const std::size_t ends[] = {0, 1, 1, 3, 3, 3, 6, 6, 6, 6, 10, 11};
    for (std::size_t room = 0; room < std::size(ends); ++room) {
        EXPECT_EQ(StartOf(text, room).size(), ends[room]) << room;
    }
}

TEST(StartOfText, CutsWhatIsNoUtf8) {
    const std::string text(20, '\xBF');
    EXPECT_EQ(StartOf(text, 10).size(), 10u);
    EXPECT_EQ(StartOf(text, 2).size(), 2u);
}

}  // namespace
