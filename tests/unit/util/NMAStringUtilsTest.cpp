// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAStringUtils.h"

#include "tests/unit/util/UtilFixture.h"

class NMAStringUtilsTest : public UtilTest {};

TEST_F(NMAStringUtilsTest, TakesCountedAndTerminatedWideText) {
    EXPECT_STREQ("wide", NMAStringUtils::CreateWCharNMAString(L"wide", -1).GetUTF8String());
    EXPECT_STREQ("wi", NMAStringUtils::CreateWCharNMAString(L"wide", 2).GetUTF8String());
    EXPECT_TRUE(NMAStringUtils::CreateWCharNMAString(L"wide", 0).IsEmpty());
    EXPECT_TRUE(NMAStringUtils::CreateWCharNMAString(nullptr, -1).IsEmpty());
    EXPECT_TRUE(NMAStringUtils::CreateWCharNMAString(L"wide", -2).IsEmpty());
}

TEST_F(NMAStringUtilsTest, WideTextIsShownWide) {
    const NMAString string = NMAStringUtils::CreateWCharNMAString(L"wide", -1);
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFWCHAR), string.InArg()->GetEncoding());
}

TEST_F(NMAStringUtilsTest, ParentFolderEndsInItsSeparator) {
    const auto parent = [](const char* path) {
        return std::string(NMAStringUtils::GetParentFolder(NMAString(path)).GetUTF8String());
    };
    EXPECT_EQ("C:\\media\\", parent("C:\\media\\a.mov"));
    EXPECT_EQ("/media/", parent("/media/a.mov"));
    EXPECT_EQ("/a\\", parent("/a\\b"));
    EXPECT_EQ("/media/", parent("/media/"));
    EXPECT_EQ("", parent("a.mov"));
    EXPECT_EQ("", parent(""));
}

TEST_F(NMAStringUtilsTest, CombinesFolderAndNameWithOneSeparator) {
    const auto combined = [](const char* folder, const char* name) {
        return std::string(
            NMAStringUtils::CombinePath(NMAString(folder), NMAString(name)).GetUTF8String());
    };
    EXPECT_EQ("C:\\media\\a.mov", combined("C:\\media", "a.mov"));
    EXPECT_EQ("C:\\media\\a.mov", combined("C:\\media\\", "a.mov"));
    EXPECT_EQ("/media/a.mov", combined("/media/", "a.mov"));
    EXPECT_EQ("/media\\a.mov", combined("/media", "a.mov"));
    EXPECT_EQ("a.mov", combined("", "a.mov"));
}

TEST_F(NMAStringUtilsTest, SeesHowATextStarts) {
    EXPECT_TRUE(NMAStringUtils::IsStartWith(NMAString(".hidden.mov"), "."));
    EXPECT_FALSE(NMAStringUtils::IsStartWith(NMAString("a.mov"), "."));
    EXPECT_FALSE(NMAStringUtils::IsStartWith(NMAString(""), "."));
    EXPECT_TRUE(NMAStringUtils::IsStartWith(NMAString("a"), ""));
    EXPECT_FALSE(NMAStringUtils::IsStartWith(NMAString("a"), "ab"));
    EXPECT_FALSE(NMAStringUtils::IsStartWith(NMAString("a"), nullptr));
}
