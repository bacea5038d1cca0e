// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Shard.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/Failure.h"

using namespace cliphost;

TEST(Shard, IsTheWholeListAtFirst) {
    EXPECT_TRUE(Shard().IsWhole());
    EXPECT_TRUE(Shard("1/1").IsWhole());
    EXPECT_TRUE(Shard("1/1").Holds("a"));
    EXPECT_FALSE(Shard("1/2").IsWhole());
}

// printf %s a.mov | sha256sum begins with 2783dce0e5b574bc.
TEST(Shard, FollowsFromAPathAlone) {
    constexpr std::uint64_t kNumber = 0x2783dce0e5b574bc;
    for (const std::uint64_t count : {2, 3, 16, 999'999}) {
        const std::uint64_t share = kNumber % count + 1;
        const std::string text = "/" + std::to_string(count);
        EXPECT_TRUE(Shard(std::to_string(share) + text).Holds("a.mov")) << count;
        EXPECT_FALSE(Shard(std::to_string(share % count + 1) + text).Holds("a.mov")) << count;
    }
}

TEST(Shard, GivesEachPathToOneShareAndAllSharesAboutAsMany) {
    constexpr int kShares = 8, kPaths = 8000;
    std::vector<int> counts(kShares);
    for (int i = 0; i < kPaths; ++i) {
        int holders = 0;
        for (int share = 1; share <= kShares; ++share) {
            const Shard shard(std::to_string(share) + "/8");
            if (shard.Holds("folder/" + std::to_string(i) + ".mov")) {
                ++holders;
                ++counts[share - 1];
            }
        }
        ASSERT_EQ(holders, 1) << i;
    }
    for (const int count : counts) {
        EXPECT_NEAR(count, kPaths / kShares, 120);
    }
}

TEST(Shard, RefusesWhatIsNoShare) {
    for (const char* const text : {"", "1", "/", "0/4", "5/4", "1/0", "0/0", "-1/4", "1/4x", "a/b",
                                   "1/2/3", " 1/2", "1/1000001", "1/99999999999999999999"}) {
        EXPECT_THROW(Shard{text}, Failure) << text;
    }
    try {
        Shard("5/4");
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), kExitCaller);
        EXPECT_EQ(failure.problem().subject, "--shard 5/4");
    }
}
