// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MachinePath.h"

#include <gtest/gtest.h>

#include <filesystem>

#include "tests/support/TestFolder.h"

using cliphost::AbsolutePath;
using cliphost::MachinePath;

TEST(MachinePath, IsThePathItselfWhereItIsText) {
    const std::string text = "a b/caf\xC3\xA9.mov";
    EXPECT_EQ(MachinePath(std::filesystem::u8path(text)), text);
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
    EXPECT_NE(here.find("/file%3A/a.mov"), std::string::npos) << here;
}

TEST(MachinePath, GoesWhereALinkLeadsInUrlsToo) {
    const TestFolder folder;
    const std::filesystem::path root = std::filesystem::canonical(folder.path());
    std::filesystem::create_directories(root / "a/b");
    std::filesystem::create_directory_symlink("a/b", root / "link");
    EXPECT_EQ(MachinePath(root / "link/../caf\xE9.mov"), MachinePath(root / "a/caf\xE9.mov"));
}

TEST(AbsolutePath, GoesWhereALinkLeads) {
    const TestFolder folder;
    const std::filesystem::path root = std::filesystem::canonical(folder.path()) / "";
    std::filesystem::create_directories(root / "a/b");
    std::filesystem::create_directory_symlink("a/b", root / "link");
    std::filesystem::create_symlink("nowhere", root / "dead");
    const struct {
        const char* path;
        const char* absolute;
    } kPaths[] = {{"a/b/../x.mov", "a/x.mov"},
                  {"./a/./x.mov", "a/x.mov"},
                  {"link/../x.mov", "a/x.mov"},
                  {"link/../../x.mov", "x.mov"},
                  {"a/../link/x.mov", "link/x.mov"},
                  {"link/../b/../x.mov", "a/x.mov"},
                  {"none/../x.mov", "x.mov"},
                  {"dead/../x.mov", "dead/../x.mov"},
                  {"dead/../../x.mov", "dead/../../x.mov"},
                  {"a//b/", "a/b/"}};
    for (const auto& path : kPaths) {
        EXPECT_EQ(AbsolutePath(root / path.path).u8string(), (root / path.absolute).u8string());
    }
    EXPECT_EQ(AbsolutePath("x.mov"), std::filesystem::current_path() / "x.mov");
    EXPECT_EQ(AbsolutePath("/../x.mov"), "/x.mov");
}
