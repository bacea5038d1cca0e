// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PrivateFile.h"

#include <gtest/gtest.h>

#include <fstream>
#include <set>

#include "reference_host/cliphost/Failure.h"
#include "tests/support/TestFolder.h"

namespace {

using namespace cliphost;

class PrivateFiles : public testing::Test {
protected:
    std::filesystem::path Write(const std::string& name, const std::string& text) {
        std::ofstream(folder_.path() / name) << text;
        return folder_.path() / name;
    }
    static std::string Read(const std::filesystem::path& file) {
        std::ifstream stream(file);
        return {std::istreambuf_iterator<char>(stream), {}};
    }
    std::filesystem::path folder() const { return folder_.path(); }

private:
    const TestFolder folder_;
};

TEST_F(PrivateFiles, TakeTheirPlace) {
    const auto file = Write("0.aaf", "new");
    const auto place = Write("place", "old");
    PutIntoPlace(file, place);
    EXPECT_EQ(Read(place), "new");
    EXPECT_FALSE(std::filesystem::exists(file));
}

TEST_F(PrivateFiles, StayBehindALinkOfTheUsers) {
    const auto file = Write("0.aaf", "new");
    const auto target = Write("target", "old");
    std::filesystem::create_symlink("target", folder() / "place");
    PutIntoPlace(file, folder() / "place");
    EXPECT_TRUE(std::filesystem::is_symlink(folder() / "place"));
    EXPECT_EQ(Read(target), "new");
}

TEST_F(PrivateFiles, AreFilesOfTheirOwn) {
    const auto secret = Write("secret", "text");
    const auto place = Write("place", "old");
    std::filesystem::create_symlink(secret, folder() / "link");
    std::filesystem::create_hard_link(secret, folder() / "second name");
    std::filesystem::create_directory(folder() / "folder");
    OutputFile whole(folder() / "whole");
    for (const char* const name : {"link", "second name", "folder", "absent"}) {
        EXPECT_THROW(PutIntoPlace(folder() / name, place), Failure) << name;
        EXPECT_THROW(AppendTo(whole, folder() / name, 4, place), Failure) << name;
        EXPECT_EQ(Read(place), "old") << name;
    }
    EXPECT_EQ(Read(secret), "text");
    whole.Finish();
    EXPECT_EQ(Read(folder() / "whole"), "");
}

TEST_F(PrivateFiles, AreAppendedToOne) {
    OutputFile whole(folder() / "whole");
    AppendTo(whole, Write("0", "first, "), 7, folder() / "whole");
    AppendTo(whole, Write("1", "second"), 6, folder() / "whole");
    whole.Finish();
    EXPECT_EQ(Read(folder() / "whole"), "first, second");
    EXPECT_FALSE(std::filesystem::exists(folder() / "0"));
    EXPECT_FALSE(std::filesystem::exists(folder() / "1"));
}

TEST_F(PrivateFiles, AreAppendedWholeOrNotAtAll) {
    OutputFile whole(folder() / "whole");
    for (const std::uint64_t bytes : {0, 5, 7}) {
        EXPECT_THROW(AppendTo(whole, Write("0", "second"), bytes, folder() / "whole"), Failure);
    }
    whole.Finish();
    EXPECT_EQ(Read(folder() / "whole"), "");
    EXPECT_TRUE(IsOwnFile(folder() / "0", 6));
    EXPECT_FALSE(IsOwnFile(folder() / "0", 5));
}

TEST_F(PrivateFiles, GoWithTheRequestTheyWereMadeFor) {
    for (const char* const name : {"1", "1_30", "1_30.77.part", "12", "12_1", "0"}) {
        Write(name, "x");
    }
    RemovePrivateFiles(folder(), 1);
    std::set<std::string> left;
    for (const auto& entry : std::filesystem::directory_iterator(folder())) {
        left.insert(entry.path().filename().u8string());
    }
    EXPECT_EQ(left, (std::set<std::string>{"0", "12", "12_1"}));
}

TEST_F(PrivateFiles, AreCopiedFromAnotherFileSystem) {
    const std::filesystem::path memory = "/dev/shm/cliphost-private-file-test";
    std::ofstream(memory) << "new";
    if (!std::filesystem::exists(memory)) {
        GTEST_SKIP() << "no other file system to write to";
    }
    PutIntoPlace(memory, folder() / "place");
    EXPECT_EQ(Read(folder() / "place"), "new");
    EXPECT_FALSE(std::filesystem::exists(memory));
}

}  // namespace
