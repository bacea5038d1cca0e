// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FolderTree.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/Failure.h"
#include "tests/support/TestFiles.h"
#include "tests/unit/cliphost/TestFolder.h"

using namespace cliphost;
using namespace cliphost_tests;

namespace {

using Names = std::vector<std::string>;

class FolderTree : public testing::Test {
protected:
    void Make(const Names& folders) {
        for (const std::string& name : folders) {
            std::filesystem::create_directories(folder_ / name);
        }
    }
    void Link(const std::string& target, const std::string& name) {
        std::filesystem::create_symlink(target, folder_ / name);
    }
    Names Found() {
        Names names;
        for (const std::filesystem::path& found : FoldersIn(folder_.path())) {
            names.push_back(found.lexically_relative(folder_.path()).generic_u8string());
        }
        return names;
    }

    const TestFolder folder_;
};

TEST_F(FolderTree, HasAllFoldersByTheOrderOfNames) {
    EXPECT_EQ(Found(), Names{"."});
    Make({"b/c", "a/z/y", ".hidden/x", "a b"});
    WriteFile(folder_ / "file", "x");
    EXPECT_EQ(Found(),
              (Names{".", ".hidden", ".hidden/x", "a", "a/z", "a/z/y", "a b", "b", "b/c"}));
}

TEST_F(FolderTree, FollowsLinksAndEndsCircles) {
    Make({"a/b"});
    Link("..", "a/b/up");
    Link(".", "a/self");
    Link("loop", "loop");
    Link("nowhere", "broken");
    EXPECT_EQ(Found(), (Names{".", "a", "a/b"}));
    const TestFolder other;
    std::filesystem::create_directories(other / "far");
    std::filesystem::create_directory_symlink(folder_.path(), other / "back");
    Link(other.path().u8string(), "zz");
    EXPECT_EQ(Found(), (Names{".", "a", "a/b", "zz", "zz/far"}));
}

// Whatever its links are called: else the path of a movie would depend on them.
TEST_F(FolderTree, HasAFolderOnceAndByItsOwnName) {
    Make({"real/sub"});
    Link("real", "a-link");
    Link("real/sub", "another");
    EXPECT_EQ(Found(), (Names{".", "real", "real/sub"}));
}

TEST_F(FolderTree, HasManyFoldersThatLinkToEachOther) {
    constexpr int kFolders = 60;
    for (int i = 0; i < kFolders; ++i) {
        Make({std::to_string(i)});
        for (int j = 0; j < kFolders; ++j) {
            Link("../" + std::to_string(j), std::to_string(i) + "/to" + std::to_string(j));
        }
    }
    EXPECT_EQ(Found().size(), kFolders + 1u);
}

TEST_F(FolderTree, BeginsWithALinkToo) {
    Make({"real/sub"});
    Link("real", "link");
    EXPECT_EQ(FoldersIn(folder_ / "link"),
              (std::vector<std::filesystem::path>{folder_ / "link", folder_ / "link/sub"}));
}

TEST(Endings, AreReadInAnyForm) {
    EXPECT_EQ(EndingsIn("mp4"), Names{"mp4"});
    EXPECT_EQ(EndingsIn("mov,.MP4,Mxf"), (Names{"mov", "mp4", "mxf"}));
    EXPECT_EQ(EndingsIn("tar.gz"), Names{"tar.gz"});
    for (const char* const list :
         {"", ",", "mov,", ",mov", "mov,,mp4", ".", "mov, mp4", "*.mov", "a/b"}) {
        EXPECT_THROW(EndingsIn(list), Failure) << list;
    }
}

TEST_F(FolderTree, FindsFilesByTheirEndings) {
    Make({"folder.mp4"});
    for (const char* const name :
         {"b.MP4", "a.mp4", "c.mov", "mp4", ".mp4", ".x.mp4", "d.mp4.txt", "e-mp4", "f.m.Mxf"}) {
        WriteFile(folder_ / name, "x");
    }
    Link("a.mp4", "link.mp4");
    Link("nowhere", "broken.mp4");
    ASSERT_TRUE(MakePipe(folder_ / "pipe.mp4"));
    const EndingMatches found = FilesByEnding(folder_.path(), {"mp4", "mxf"});
    Names names;
    for (const std::filesystem::path& file : found.files) {
        names.push_back(file.filename().u8string());
    }
    EXPECT_EQ(names, (Names{".x.mp4", "a.mp4", "b.MP4", "f.m.Mxf", "link.mp4"}));
    ASSERT_EQ(found.noFiles.size(), 2u);
    EXPECT_EQ(found.noFiles[0].subject, folder_ / "broken.mp4");
    EXPECT_EQ(found.noFiles[1].subject, folder_ / "pipe.mp4");
    EXPECT_THROW(FilesByEnding(folder_ / "absent", {"mp4"}), Failure);
}

}  // namespace
