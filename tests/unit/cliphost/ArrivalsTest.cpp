// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Arrivals.h"

#include <gtest/gtest.h>

using namespace cliphost;
using namespace std::chrono_literals;

namespace {

using ArrivedPaths = std::vector<std::filesystem::path>;

class ArrivalsTest : public testing::Test {
protected:
    void Write(const std::string& file, std::uint64_t size, std::int64_t date = 1) {
        files_[file] = {size, date};
    }
    void Remove(const std::string& file) { files_.erase(file); }
    void See(const std::string& file) { arrivals_.See(file, now_); }
    ArrivedPaths TakeAfter(std::chrono::seconds time) { return arrivals_.Take(now_ += time); }
    Arrivals::Clock::time_point now_{};
    std::map<std::string, host::system::FileState> files_;
    Arrivals arrivals_{5s, [this](const std::filesystem::path& file) {
                           const auto found = files_.find(file.u8string());
                           return found == files_.end() ? std::nullopt
                                                        : std::optional(found->second);
                       }};
};

TEST_F(ArrivalsTest, WaitForRest) {
    Write("b", 1);
    Write("a", 1);
    See("b");
    See("a");
    EXPECT_EQ(TakeAfter(4s), ArrivedPaths{});
    EXPECT_EQ(arrivals_.Next(), Arrivals::Clock::time_point(5s));
    EXPECT_EQ(TakeAfter(1s), (ArrivedPaths{"a", "b"}));
    EXPECT_EQ(TakeAfter(100s), ArrivedPaths{});
    EXPECT_EQ(arrivals_.Next(), std::nullopt);
}

TEST_F(ArrivalsTest, BeginAgainWhileFilesGrow) {
    Write("a", 1);
    See("a");
    Write("a", 2);  // nobody tells
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{});
    Write("a", 2, 2);
    now_ += 3s;
    See("a");  // somebody tells
    EXPECT_EQ(TakeAfter(4s), ArrivedPaths{});
    See("a");  // nothing new
    EXPECT_EQ(TakeAfter(1s), ArrivedPaths{"a"});
}

TEST_F(ArrivalsTest, ComeAgainWhenTheyChange) {
    Write("a", 1);
    See("a");
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{"a"});
    See("a");
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{});
    Write("a", 1, 2);
    See("a");
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{"a"});
}

TEST_F(ArrivalsTest, MayGoAway) {
    Write("a", 1);
    See("a");
    Remove("a");
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{});
    See("a");
    EXPECT_EQ(arrivals_.Next(), std::nullopt);
    Write("a", 1);
    See("a");
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{"a"});
    Remove("a");
    See("a");
    Write("a", 1);  // as it was
    See("a");
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{"a"});
}

TEST_F(ArrivalsTest, ComeAgainAfterTheyWereRemovedAndNobodyTold) {
    const std::string here = (std::filesystem::temp_directory_path() / "a").u8string();
    for (const std::string& file : {here, std::string("/no/such/folder/b")}) {
        Write(file, 1);
        See(file);
    }
    EXPECT_EQ(TakeAfter(5s).size(), 2u);
    arrivals_.LookForRemoved();
    See(here);
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{});
    for (const std::string& file : {here, std::string("/no/such/folder/b")}) {
        Remove(file);
        arrivals_.LookForRemoved();
        Write(file, 1);
        See(file);
    }
    EXPECT_EQ(TakeAfter(5s), ArrivedPaths{here});
}

}  // namespace
