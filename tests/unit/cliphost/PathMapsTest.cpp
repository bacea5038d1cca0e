// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PathMaps.h"

#include <gtest/gtest.h>

#include <filesystem>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/util/text/FileUrl.h"
#include "tests/support/TestFolder.h"

using cliphost::PathMaps;

namespace {

std::string ToOther(const std::string& rule, std::string url) {
    PathMaps maps;
    maps.Add(rule);
    return maps.MapToOther(url) ? url : "not " + url;
}

std::string ToThis(const std::string& rule, std::string url) {
    PathMaps maps;
    maps.Add(rule);
    return maps.MapToThis(url) ? url : "not " + url;
}

std::string WhyRefused(const std::string& rule) {
    try {
        PathMaps().Add(rule);
    } catch (const cliphost::Failure& failure) {
        EXPECT_EQ(failure.status(), cliphost::kExitCaller);
        return failure.problem().reason;
    }
    return "not refused";
}

}  // namespace

TEST(PathMaps, NameAFolderAShareOrADriveOfTheOtherMachine) {
    const std::string url = "file:///mnt/media/a%20b/c.mov";
    EXPECT_EQ(ToOther("/mnt/media=/Volumes/media", url), "file:///Volumes/media/a%20b/c.mov");
    EXPECT_EQ(ToOther("/mnt/media=//server/media", url), "file://server/media/a%20b/c.mov");
    EXPECT_EQ(ToOther("/mnt/media=M:", url), "file:///M:/a%20b/c.mov");
    EXPECT_EQ(ToOther("/mnt/media=M:/x y", url), "file:///M:/x%20y/a%20b/c.mov");
    EXPECT_EQ(ToOther("/mnt/media=/", url), "file:///a%20b/c.mov");
    EXPECT_EQ(ToOther("/=//server", url), "file://server/mnt/media/a%20b/c.mov");
}

TEST(PathMaps, TakeBackslashesOfWindowsAlone) {
    EXPECT_EQ(ToOther("/m=\\\\server\\share", "file:///m/c.mov"), "file://server/share/c.mov");
    EXPECT_EQ(ToOther("/m=M:\\x\\", "file:///m/c.mov"), "file:///M:/x/c.mov");
    EXPECT_EQ(ToOther("/m=/a\\b", "file:///m/c.mov"), "file:///a%5Cb/c.mov");
}

TEST(PathMaps, TakeFileUrls) {
    EXPECT_EQ(ToOther("file:///m%3D/=file://server/a%20b", "file:///m%3D/c.mov"),
              "file://server/a%20b/c.mov");
    EXPECT_EQ(ToOther("/m=file:///M:/x", "file://localhost/m/c.mov"), "file:///M:/x/c.mov");
}

TEST(PathMaps, TakeAFolderFromTheWorkingFolder) {
    const std::string here = std::filesystem::current_path().u8string();
    EXPECT_EQ(ToOther("a/../b=/x", "file://" + here + "/b/c.mov"), "file:///x/c.mov");
    EXPECT_EQ(ToOther(".=/x", "file://" + here + "/c.mov"), "file:///x/c.mov");
    // As the module is given it.
    const TestFolder folder;
    std::filesystem::create_directories(folder.path() / "a/b");
    std::filesystem::create_directory_symlink("a/b", folder.path() / "link");
    const auto fromHere = folder.path().lexically_relative(std::filesystem::current_path());
    EXPECT_EQ(ToOther((fromHere / "link/..").u8string() + "=/x",
                      host::text::FileUrl((folder.path() / "a/c.mov").u8string())),
              "file:///x/c.mov");
}

TEST(PathMaps, TakeFoldersHoweverTheyAreWritten) {
    const std::string url = "file:///mnt/media/c.mov";
    for (const char* const from :
         {"/mnt/media/.", "/mnt/x/../media", "/mnt//media", "/mnt/media///"}) {
        EXPECT_EQ(ToOther(std::string(from) + "=/x", url), "file:///x/c.mov") << from;
    }
    EXPECT_EQ(ToOther("/mnt/media=//server/a/../b", url), "file://server/b/c.mov");
    EXPECT_EQ(ToOther("/mnt/media=M:/a/./b", url), "file:///M:/a/b/c.mov");
    EXPECT_EQ(ToThis("/here=/x", "file:///y/../x/c.mov"), "file:///here/c.mov");
}

TEST(PathMaps, LeaveWhatDoesNotLieInTheFolder) {
    EXPECT_EQ(ToOther("/mnt/media=/x", "file:///mnt/media2/c.mov"), "not file:///mnt/media2/c.mov");
    EXPECT_EQ(ToOther("/mnt/media=/x", "file:///mnt/Media/c.mov"), "not file:///mnt/Media/c.mov");
    EXPECT_EQ(ToOther("/mnt/media=/x", "file:///mnt/media"), "not file:///mnt/media")
        << "a folder is no movie in it";
    EXPECT_EQ(ToOther("/m=/x", "file://server/m/c.mov"), "not file://server/m/c.mov");
    EXPECT_EQ(ToOther("/m=/x", "http://m/c.mov"), "not http://m/c.mov");
    EXPECT_EQ(ToOther("/m=/x", "/m/c.mov"), "not /m/c.mov");
    EXPECT_EQ(ToOther("/m=/x", "file:///m/%zz.mov"), "not file:///m/%zz.mov");
}

TEST(PathMaps, ReadWhatTheOtherMachineSees) {
    EXPECT_EQ(ToThis("/mnt/media=//server/media", "file://server/media/a%20b.mov"),
              "file:///mnt/media/a%20b.mov");
    EXPECT_EQ(ToThis("/mnt/media=M:", "file:///M:/a.mov"), "file:///mnt/media/a.mov");
}

TEST(PathMaps, ReadASharesOtherForm) {
    EXPECT_EQ(ToThis("/mnt/media=//server/media", "file:////server/media/a.mov"),
              "file:///mnt/media/a.mov");
}

TEST(PathMaps, IgnoreCaseWhereWindowsDoes) {
    EXPECT_EQ(ToThis("/mnt=//Server/Media", "file://SERVER/media/A.mov"), "file:///mnt/A.mov");
    EXPECT_EQ(ToThis("/mnt=m:/X", "file:///M:/x/A.mov"), "file:///mnt/A.mov");
    EXPECT_EQ(ToThis("/mnt=/Volumes/x", "file:///volumes/x/A.mov"), "not file:///volumes/x/A.mov");
}

TEST(PathMaps, PreferTheLongestFolder) {
    PathMaps maps;
    maps.Add("/m=/one");
    maps.Add("/m/n=/two");
    maps.Add("/=/three");
    std::string url = "file:///m/n/c.mov";
    EXPECT_TRUE(maps.MapToOther(url));
    EXPECT_EQ(url, "file:///two/c.mov");
}

TEST(PathMaps, TellWhichRulesWereNotUsed) {
    PathMaps maps;
    maps.Add("/a=/x");
    maps.Add("/b=/y");
    EXPECT_EQ(maps.Unused(), (std::vector<std::string>{"/a=/x", "/b=/y"}));
    std::string url = "file:///b/c.mov";
    maps.MapToOther(url);
    EXPECT_EQ(maps.used(), 2u);
    EXPECT_EQ(maps.Unused(), std::vector<std::string>{"/a=/x"});
    maps.AddUsed(1);
    EXPECT_TRUE(maps.Unused().empty()) << "what other processes used counts too";
}

TEST(PathMaps, RefuseWhatIsNoRule) {
    for (const char* const rule : {"", "=", "/a", "/a=", "=/a"}) {
        EXPECT_EQ(WhyRefused(rule), "is not FROM=TO") << rule;
    }
    for (const char* const rule : {"/a=b", "/a=M:b", "/a=http://b", "/a=file://b"}) {
        EXPECT_EQ(WhyRefused(rule), "TO is no absolute path") << rule;
    }
}

TEST(PathMaps, AreBounded) {
    PathMaps maps;
    for (std::size_t i = 0; i < PathMaps::kMost; ++i) {
        maps.Add("/a=/b");
    }
    EXPECT_THROW(maps.Add("/a=/b"), cliphost::Failure);
}
