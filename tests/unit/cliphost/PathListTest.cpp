// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/PathList.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/FolderClips.h"

namespace cliphost {
namespace {

const std::vector<std::filesystem::path> kPaths = {
    "/films/b.mov",   "/films/a b.mov", "/films/sub/c.mov", "/film/d.mov",
    "alone.mov",      "/films/",        "/films",           "",
    "/films/\xFF.mov"};

PathList ListOf(const std::vector<std::filesystem::path>& paths) {
    PathList list;
    for (const std::filesystem::path& path : paths) {
        list.Add(path.native());
    }
    return list;
}

TEST(PathList, GivesEachPathAsItWas) {
    PathList list = ListOf(kPaths);
    list.Close();
    ASSERT_EQ(list.size(), kPaths.size());
    for (std::size_t i = 0; i < kPaths.size(); ++i) {
        EXPECT_EQ(list[i], kPaths[i].native());
    }
}

TEST(PathList, TakesAFirstPathWithoutAFolder) {
    const std::vector<std::filesystem::path> paths = {"a.mov", "/films/b.mov", "c.mov"};
    const PathList list = ListOf(paths);
    for (std::size_t i = 0; i < paths.size(); ++i) {
        EXPECT_EQ(list[i], paths[i].native());
    }
}

TEST(PathList, ComparesPathsAsTheirTexts) {
    const PathList list = ListOf(kPaths);
    for (std::size_t one = 0; one < kPaths.size(); ++one) {
        for (std::size_t other = 0; other < kPaths.size(); ++other) {
            EXPECT_EQ(list.IsBefore(one, other), kPaths[one].native() < kPaths[other].native())
                << kPaths[one] << " and " << kPaths[other];
        }
    }
}

TEST(ClipsByName, ComeInTheOrderOfTheirPathsWithTheirIndices) {
    const ClipsByName clips(ListOf({"/films/c.mov", "/films/a.mov", "/films/b.mov"}), {0, 4, 7});
    std::vector<std::pair<std::filesystem::path, int>> seen;
    for (const FolderClip& clip : clips) {
        seen.emplace_back(clip.path, clip.index);
    }
    const std::vector<std::pair<std::filesystem::path, int>> wanted = {
        {"/films/a.mov", 4}, {"/films/b.mov", 7}, {"/films/c.mov", 0}};
    EXPECT_EQ(seen, wanted);
    EXPECT_EQ(clips[2].path, std::filesystem::path("/films/c.mov"));
    EXPECT_EQ(ClipsByName().size(), 0u);
}

}  // namespace
}  // namespace cliphost
