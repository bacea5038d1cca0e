// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FolderWatch.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cerrno>
#include <fstream>

#include "tests/support/TestFolder.h"

using namespace host::system;
using namespace std::chrono_literals;
using What = FolderChange::What;

namespace {

class FolderWatchTest : public testing::Test {
protected:
    // Systems tell in pieces what was done at a time.
    bool IsTold(What what, const std::filesystem::path& path = {}) {
        const auto isIt = [&](const FolderChange& change) {
            return change.what == what && change.path == path;
        };
        for (;;) {
            const auto changes = watch_.Wait(100ms);
            if (changes.empty() || std::any_of(changes.begin(), changes.end(), isIt)) {
                return !changes.empty();
            }
        }
    }
    std::filesystem::path Path(const std::string& name) { return folder_.path() / name; }
    TestFolder folder_;
    FolderWatch watch_;
};

TEST_F(FolderWatchTest, TellsOfFilesAndFolders) {
    ASSERT_EQ(watch_.Add(folder_.path()), 0);
    EXPECT_TRUE(watch_.Wait(1ms).empty());
    std::ofstream(Path("a")) << "x";
    EXPECT_TRUE(IsTold(What::File, Path("a")));
    std::filesystem::rename(Path("a"), Path("b"));
    EXPECT_TRUE(IsTold(What::File, Path("b")));
    std::filesystem::remove(Path("b"));
    EXPECT_TRUE(IsTold(What::File, Path("b")));
    std::filesystem::create_directory(Path("in"));
    EXPECT_TRUE(IsTold(What::Folder, Path("in")));
    std::ofstream(Path("in") / "c") << "x";
    EXPECT_FALSE(IsTold(What::File, Path("in") / "c"));
    ASSERT_EQ(watch_.Add(Path("in")), 0);
    std::ofstream(Path("in") / "d") << "x";
    EXPECT_TRUE(IsTold(What::File, Path("in") / "d"));
}

TEST_F(FolderWatchTest, TellsOfFoldersThatGo) {
    std::filesystem::create_directory(Path("in"));
    ASSERT_EQ(watch_.Add(Path("in")), 0);
    std::filesystem::rename(Path("in"), Path("moved"));
    EXPECT_TRUE(IsTold(What::Gone, Path("in")));
    std::ofstream(Path("moved") / "a") << "x";
    EXPECT_TRUE(watch_.Wait(10ms).empty());
    ASSERT_EQ(watch_.Add(Path("moved")), 0);
    std::filesystem::remove_all(Path("moved"));
    EXPECT_TRUE(IsTold(What::Gone, Path("moved")));
}

// That it was moved may be read after it was added by its new path: it has to be added again.
TEST_F(FolderWatchTest, TellsOfFoldersThatWereAddedAgainMeanwhile) {
    std::filesystem::create_directory(Path("in"));
    ASSERT_EQ(watch_.Add(Path("in")), 0);
    std::filesystem::rename(Path("in"), Path("moved"));
    ASSERT_EQ(watch_.Add(Path("moved")), 0);
    EXPECT_TRUE(IsTold(What::Gone, Path("moved")));
    ASSERT_EQ(watch_.Add(Path("moved")), 0);
    std::ofstream(Path("moved") / "a") << "x";
    EXPECT_TRUE(IsTold(What::File, Path("moved") / "a"));
}

TEST_F(FolderWatchTest, TellsThatItMissed) {
    std::size_t most = 0;
    std::ifstream("/proc/sys/fs/inotify/max_queued_events") >> most;
    if (most == 0 || most > 100'000) {
        GTEST_SKIP() << "so many changes take too long to make: " << most;
    }
    ASSERT_EQ(watch_.Add(folder_.path()), 0);
    for (std::size_t i = 0; i < most; ++i) {
        std::ofstream(Path(std::to_string(i)));
    }
    EXPECT_TRUE(IsTold(What::Missed));
}

TEST_F(FolderWatchTest, SaysWhatItCannotWatch) {
    EXPECT_EQ(watch_.Add(Path("none")), ENOENT);
    std::ofstream(Path("file")) << "x";
    EXPECT_EQ(watch_.Add(Path("file")), ENOTDIR);
    EXPECT_TRUE(watch_.Wait(1ms).empty());
}

}  // namespace
