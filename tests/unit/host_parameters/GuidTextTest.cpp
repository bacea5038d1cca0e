// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/GuidText.h"

#include <gtest/gtest.h>

namespace {

constexpr char kText[] = "0E74B673-0CA8-403B-A142-986D79508637";

TEST(GuidText, WritesCapitalsInGroups) {
    EXPECT_EQ(host::GuidText(ncfGuid("0e74b673-0ca8-403b-a142-986d79508637")), kText);
    EXPECT_EQ(host::GuidText({}), "00000000-0000-0000-0000-000000000000");
}

TEST(GuidText, ReadsLettersOfEitherCase) {
    for (const char* const text : {kText, "0e74b673-0ca8-403b-a142-986d79508637"}) {
        GUID id{};
        ASSERT_TRUE(host::ReadGuid(text, id));
        EXPECT_EQ(host::GuidText(id), kText);
    }
}

TEST(GuidText, LeavesTheIdAloneForAnythingElse) {
    const GUID before = ncfGuid("11111111-2222-3333-4444-555555555555");
    GUID id = before;
    for (std::size_t length = 0; length < sizeof kText - 1; ++length) {
        EXPECT_FALSE(host::ReadGuid(std::string(kText, length), id)) << length;
    }
    for (const char* const text :
         {"{0E74B673-0CA8-403B-A142-986D79508637}", "0E74B673-0CA8-403B-A142-986D795086370",
          "0E74B673 0CA8-403B-A142-986D79508637", "0E74B673-0CA8-403B-A142-986D7950863G",
          "0E74B67-30CA8-403B-A142-986D79508637", " E74B673-0CA8-403B-A142-986D79508637",
          "+E74B673-0CA8-403B-A142-986D79508637", "------------------------------------"}) {
        EXPECT_FALSE(host::ReadGuid(text, id)) << text;
    }
    EXPECT_FALSE(host::ReadGuid(std::string(36, '\0'), id));
    EXPECT_EQ(host::GuidText(id), host::GuidText(before));
}

}  // namespace
