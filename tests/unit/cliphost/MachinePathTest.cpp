// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MachinePath.h"

#include <gtest/gtest.h>

using cliphost::MachinePath;

TEST(MachinePath, IsThePathItselfWhereItIsText) {
    EXPECT_EQ(MachinePath("a b/caf\xC3\xA9.mov"), "a b/caf\xC3\xA9.mov");
    EXPECT_EQ(MachinePath("/a\nb\\c.mov"), "/a\nb\\c.mov") << "JSON escapes these itself";
}

TEST(MachinePath, IsAUrlWhereBytesAreNoText) {
    EXPECT_EQ(MachinePath("/a b/caf\xE9.mov"), "file:///a%20b/caf%E9.mov");
    const std::string here = MachinePath("caf\xE9.mov");
    EXPECT_EQ(here.rfind("file:///", 0), 0u) << here;
    EXPECT_EQ(here.substr(here.size() - 11), "/caf%E9.mov") << "absolute";
}

TEST(MachinePath, IsAUrlWhereThePathLooksLikeOne) {
    const std::string here = MachinePath("file:///a.mov");
    EXPECT_NE(here.find("/file%3A///a.mov"), std::string::npos) << here;
}
