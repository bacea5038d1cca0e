// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/files/NamePattern.h"

#include <gtest/gtest.h>

#include <string>

using host::files::MatchesPattern;

TEST(NamePattern, StarStandsForAnyRun) {
    EXPECT_TRUE(MatchesPattern(U"a.mov", U"*.mov"));
    EXPECT_TRUE(MatchesPattern(U".mov", U"*.mov"));
    EXPECT_TRUE(MatchesPattern(U"a.mov.mov", U"*.mov"));
    EXPECT_TRUE(MatchesPattern(U"anything", U"*"));
    EXPECT_TRUE(MatchesPattern(U"", U"*"));
    EXPECT_TRUE(MatchesPattern(U"abcbd", U"a*b*d"));
}

TEST(NamePattern, LooksAtTheWholeName) {
    EXPECT_FALSE(MatchesPattern(U"a.movie", U"*.mov"));
    EXPECT_FALSE(MatchesPattern(U"a.mo", U"*.mov"));
    EXPECT_FALSE(MatchesPattern(U"xa", U"a"));
    EXPECT_FALSE(MatchesPattern(U"", U"?"));
}

TEST(NamePattern, QuestionMarkStandsForOneCharacter) {
    EXPECT_TRUE(MatchesPattern(U"a1", U"a?"));
    EXPECT_FALSE(MatchesPattern(U"a", U"a?"));
    EXPECT_FALSE(MatchesPattern(U"a12", U"a?"));
}

TEST(NamePattern, CaseCountsOnThisSystem) {
    EXPECT_FALSE(MatchesPattern(U"A.MOV", U"*.mov"));
}

TEST(NamePattern, ManyStarsTakeNoLongTime) {
    const std::u32string name(2000, U'a');
    EXPECT_FALSE(MatchesPattern(name, U"*a*a*a*a*a*a*a*a*a*a*b"));
}
