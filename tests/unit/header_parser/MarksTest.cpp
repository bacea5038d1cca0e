// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Marks.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <vector>

namespace {

ncfUInt32 Find(const std::vector<ncfUInt64>& keys, ncfUInt64 value) {
    return header_parser::LastNotAbove(static_cast<ncfUInt32>(keys.size()), value,
                                       [&](ncfUInt32 i) { return keys[i]; });
}

TEST(Marks, AreFoundAtBothEndsAndBetween) {
    EXPECT_EQ(Find({5}, 5), 0u);
    EXPECT_EQ(Find({5}, 9), 0u);
    EXPECT_EQ(Find({0, 10, 20}, 0), 0u);
    EXPECT_EQ(Find({0, 10, 20}, 9), 0u);
    EXPECT_EQ(Find({0, 10, 20}, 10), 1u);
    EXPECT_EQ(Find({0, 10, 20}, 19), 1u);
    EXPECT_EQ(Find({0, 10, 20}, ~ncfUInt64{0}), 2u);
}

TEST(Marks, OfEqualKeysTheLastIsFound) {
    EXPECT_EQ(Find({0, 0, 0}, 0), 2u);
    EXPECT_EQ(Find({0, 7, 7, 7, 9}, 7), 3u);
    EXPECT_EQ(Find({0, 7, 7, 7, 9}, 8), 3u);
    EXPECT_EQ(Find({0, 0, 0, 5}, 4), 2u);
}

TEST(Marks, AreFoundInLogarithmicTimeHoweverUnevenTheyAre) {
    std::mt19937_64 random(3);
    std::vector<ncfUInt64> keys = {0};
    for (int i = 0; i < 100000; ++i) {
        keys.push_back(keys.back() + (i % 1000 == 0 ? random() >> 20 : random() % 3));
    }
    for (int i = 0; i < 20000; ++i) {
        const ncfUInt64 value = i % 2 == 0 ? keys[random() % keys.size()] : random() % keys.back();
        int asked = 0;
        const ncfUInt32 found = header_parser::LastNotAbove(static_cast<ncfUInt32>(keys.size()),
                                                            value, [&](ncfUInt32 k) {
                                                                ++asked;
                                                                return keys[k];
                                                            });
        const auto expected = std::upper_bound(keys.begin(), keys.end(), value) - keys.begin() - 1;
        ASSERT_EQ(found, static_cast<ncfUInt32>(expected)) << value;
        ASSERT_LE(asked, 40);
    }
}

}  // namespace
