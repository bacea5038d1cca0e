// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"

#include <gtest/gtest.h>

TEST(Paths, TurnsBackslashesBackForTheSystem) {
    std::filesystem::path path;
    ASSERT_TRUE(host::system::ToSystemPath(U"\\home\\me/clip.mov", path));
    EXPECT_EQ("/home/me/clip.mov", path.generic_u8string());
}

TEST(Paths, GivesCarriedBytesBackToTheSystem) {
    std::filesystem::path path;
    ASSERT_TRUE(host::system::ToSystemPath(std::u32string{U'\\', U'a', 0xDCE9}, path));
    EXPECT_EQ("/a\xE9", path.generic_u8string());
    EXPECT_EQ((std::u32string{U'\\', U'a', 0xDCE9}), host::system::ToModulePath(path));
    EXPECT_EQ((std::u32string{U'/', U'a', 0xDCE9}), host::system::FromSystemPath(path));
}

TEST(Paths, RefusesWhatNoFileNameCanHold) {
    std::filesystem::path path = "as before";
    EXPECT_FALSE(host::system::ToSystemPath(std::u32string(U"a\0b", 3), path));
    EXPECT_FALSE(host::system::ToSystemPath(std::u32string{U'a', 0xD800}, path));
    EXPECT_EQ("as before", path.generic_u8string());
}

TEST(Paths, SeesABackslashThatIsPartOfAName) {
    EXPECT_TRUE(host::system::HoldsBackslash("/media/a\\b.mov"));
    EXPECT_FALSE(host::system::HoldsBackslash("/media/ab.mov"));
}
