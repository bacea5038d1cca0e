// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The pictures beside a report's page.

#include "reference_host/cliphost/ReportFolder.h"

#include <gtest/gtest.h>

#include <map>
#include <nlohmann/json.hpp>

#include "tests/unit/cliphost/TestFolder.h"

namespace {

using cliphost::ReportFolder;
using cliphost_tests::ContentOf;

// The name that a picture gets.
std::string Take(ReportFolder& pictures, const char* base64) {
    nlohmann::ordered_json picture = {{"type", "image/webp"}, {"data", base64}};
    pictures.Take(picture, 0, "poster");
    EXPECT_FALSE(picture.contains("data"));
    return std::filesystem::path(picture["file"].get<std::string>()).filename().string();
}

std::map<std::string, std::string> FilesOf(const std::filesystem::path& folder) {
    std::map<std::string, std::string> files;
    for (const auto& entry : std::filesystem::directory_iterator(folder)) {
        files[entry.path().filename().string()] = ContentOf(entry.path());
    }
    return files;
}

void MakePage(const std::filesystem::path& folder, const char* base64) {
    ReportFolder pictures(folder);
    Take(pictures, base64);
    pictures.PutIntoPlace();
    pictures.PageIsInPlace();
}

TEST(PicturesOfReports, AreThoseOfTheEarlierPageUntilTheNewOneHasItsPlace) {
    const TestFolder folder;
    MakePage(folder / "r_files", "b2xk");
    const auto before = FilesOf(folder / "r_files");
    ASSERT_EQ(before.size(), 1u);
    EXPECT_EQ(before.begin()->second, "old");
    {
        ReportFolder pictures(folder / "r_files");
        const std::string file = Take(pictures, "bmV3");
        pictures.PutIntoPlace();
        EXPECT_EQ(ContentOf(folder / "r_files" / file), "new");
    }
    EXPECT_EQ(FilesOf(folder / "r_files"), before);
    MakePage(folder / "r_files", "bmV3");
    const auto after = FilesOf(folder / "r_files");
    ASSERT_EQ(after.size(), 1u);
    EXPECT_EQ(after.begin()->second, "new");
}

TEST(PicturesOfReports, StayWhereAPageThatFailsHasTheSameOnes) {
    const TestFolder folder;
    MakePage(folder / "r_files", "b2xk");
    const auto before = FilesOf(folder / "r_files");
    {
        ReportFolder pictures(folder / "r_files");
        Take(pictures, "b2xk");
        pictures.PutIntoPlace();
    }
    EXPECT_EQ(FilesOf(folder / "r_files"), before);
}

TEST(PicturesOfReports, LeaveNoFolderWhereTheFirstPageFails) {
    const TestFolder folder;
    {
        ReportFolder pictures(folder / "r_files");
        Take(pictures, "b2xk");
        pictures.PutIntoPlace();
    }
    EXPECT_FALSE(std::filesystem::exists(folder / "r_files"));
}

}  // namespace
