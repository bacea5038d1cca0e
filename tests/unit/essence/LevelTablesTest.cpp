// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/LevelTables.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

// The tables against their rules in double precision, entry by entry.

TEST(LevelTables, EightBitEntriesFollowTheirRules) {
    const LevelTables& tables = LevelTables::Get();
    for (int x = 0; x < 256; ++x) {
        const double expanded = std::round((x - 16) * 255.0 / 219.0);
        EXPECT_EQ(tables.expand8[static_cast<std::size_t>(x)], std::clamp(expanded, 0.0, 255.0))
            << x;
        EXPECT_EQ(tables.compress8[static_cast<std::size_t>(x)],
                  std::round(x * 219.0 / 255.0) + 16.0)
            << x;
    }
}

TEST(LevelTables, SixteenBitEntriesFollowTheirRules) {
    const LevelTables& tables = LevelTables::Get();
    int wrong = 0;
    for (int x = 0; x < 65536; ++x) {
        const double expanded = std::clamp(std::floor((x - 4096) * 1.1688453), 0.0, 65535.0);
        wrong += tables.expand16[static_cast<std::size_t>(x)] != expanded;
        wrong += tables.compress16[static_cast<std::size_t>(x)] != std::floor(x * 0.8554818) + 4096;
    }
    EXPECT_EQ(wrong, 0);
}

TEST(LevelTables, TellingEntriesOfTheEightBitTables) {
    const LevelTables& tables = LevelTables::Get();
    const int rows[][3] = {{0, 0, 16},      {16, 0, 30},     {17, 1, 31},
                           {128, 130, 126}, {235, 255, 218}, {255, 255, 235}};
    for (const auto& row : rows) {
        EXPECT_EQ(tables.expand8[static_cast<std::size_t>(row[0])], row[1]);
        EXPECT_EQ(tables.compress8[static_cast<std::size_t>(row[0])], row[2]);
    }
}

TEST(LevelTables, TellingEntriesOfTheSixteenBitTables) {
    const LevelTables& tables = LevelTables::Get();
    const int rows[][3] = {{0, 0, 4096},          {4096, 0, 7600},       {4097, 1, 7600},
                           {32768, 33513, 32128}, {60160, 65530, 55561}, {60164, 65534, 55565},
                           {60165, 65535, 55566}, {65535, 65535, 60159}};
    for (const auto& row : rows) {
        EXPECT_EQ(tables.expand16[static_cast<std::size_t>(row[0])], row[1]);
        EXPECT_EQ(tables.compress16[static_cast<std::size_t>(row[0])], row[2]);
    }
}
