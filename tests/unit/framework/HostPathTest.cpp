// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/HostPath.h"

#include <gtest/gtest.h>

using host::MakeString;

TEST(HostPath, TurnsTheModulesFormBackForTheSystem) {
    std::filesystem::path path;
    EXPECT_EQ(NCF_OK, host::PathFrom(MakeString("\\media\\a b.mov").get(), path));
    EXPECT_EQ("/media/a b.mov", path.generic_u8string());
    EXPECT_EQ(NCF_OK, host::PathFrom(MakeString("/media/a.mov", kNCFUTF32).get(), path));
    EXPECT_EQ("/media/a.mov", path.generic_u8string());
}

TEST(HostPath, GoesBothWaysWithBytesThatAreNoUtf8) {
    const std::filesystem::path original = "/media/a\xE9\xFF.mov";
    const auto text = host::ModulePath(original);
    EXPECT_EQ(U'\\', text->Text()[0]);
    std::filesystem::path path;
    ASSERT_EQ(NCF_OK, host::PathFrom(text.get(), path));
    EXPECT_EQ(original, path);
    ASSERT_EQ(NCF_OK, text->ConvertTo(kNCFUTF16));
    ASSERT_EQ(NCF_OK, host::PathFrom(text.get(), path));
    EXPECT_EQ(original, path);
}

TEST(HostPath, IsShownInUtf8) {
    const std::string text = "/a b/caf\xC3\xA9.mov";
    EXPECT_EQ(text, host::DisplayPath(std::filesystem::u8path(text)));
}

TEST(HostPath, IsShownOnOneLineWithControlsAndForeignBytesEscaped) {
    EXPECT_EQ("a\\nb\\x1B[2J\\xFF.mov", host::DisplayPath("a\nb\x1B[2J\xFF.mov"));
}

TEST(HostPath, RefusesTextsThatNameNoFile) {
    std::filesystem::path path;
    EXPECT_EQ(NCF_E_POINTER, host::PathFrom(nullptr, path));
    EXPECT_EQ(NCF_E_INVALIDARG, host::PathFrom(MakeString("").get(), path));
    EXPECT_EQ(NCF_E_INVALIDARG,
              host::PathFrom(MakeString(std::u32string_view(U"/a\0b", 4)).get(), path));
}
