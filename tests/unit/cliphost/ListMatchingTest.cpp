// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ListMatching.h"

#include <gtest/gtest.h>

namespace {

using cliphost::ListElement;
using cliphost::MatchLists;
using Places = std::vector<std::optional<std::size_t>>;

constexpr auto kNone = std::nullopt;

ListElement Keyed(const std::string& key, std::size_t content = 0, bool mayChangeKey = false) {
    return {key, content, "kind", mayChangeKey};
}
ListElement Loose(std::size_t content, const std::string& kind = "kind") {
    return {"", content, kind, false};
}

TEST(ListMatching, FindsElementsByTheirKeysWhereverTheyAre) {
    EXPECT_EQ(MatchLists({Keyed("a", 1), Keyed("b", 2), Keyed("c", 3)},
                         {Keyed("c", 9), Keyed("new", 2), Keyed("a", 1)}, false),
              (Places{2, kNone, 0}));
}

TEST(ListMatching, TakesTheNthOfAKeyForTheNth) {
    EXPECT_EQ(MatchLists({Keyed("a"), Keyed("a"), Keyed("a")}, {Keyed("a"), Keyed("a")}, false),
              (Places{0, 1, kNone}));
}

TEST(ListMatching, FindsOneOfAnotherKeyByItsContentWhereThatMayBe) {
    EXPECT_EQ(MatchLists({Keyed("3", 7, true)}, {Keyed("3x", 8, true), Keyed("4", 7, true)}, false),
              Places{1});
    EXPECT_EQ(MatchLists({Keyed("3", 7)}, {Keyed("4", 7)}, false), Places{kNone});
}

// "2" is that of another one now.
TEST(ListMatching, TakesAsManyWithOtherKeysInTheirOrderWhereKeysMayChange) {
    EXPECT_EQ(MatchLists({Keyed("1", 7, true), Keyed("2", 7, true)},
                         {Keyed("2", 7, true), Keyed("3", 7, true)}, false),
              (Places{0, 1}));
    EXPECT_EQ(MatchLists({Keyed("1", 7, true)}, {Keyed("3", 9, true)}, false), Places{0});
    EXPECT_EQ(MatchLists({Keyed("1")}, {Keyed("3")}, false), Places{kNone});
}

TEST(ListMatching, GoesByKeysWhereTheyAreTheSameOrMoreOrFewer) {
    EXPECT_EQ(MatchLists({Keyed("1", 7, true), Keyed("2", 8, true)},
                         {Keyed("2", 9, true), Keyed("1", 9, true)}, false),
              (Places{1, 0}));
    EXPECT_EQ(MatchLists({Keyed("2", 8, true)}, {Keyed("1", 9, true), Keyed("2", 9, true)}, false),
              Places{1});
    EXPECT_EQ(MatchLists({Keyed("2", 8, true)}, {Keyed("3", 9, true), Keyed("4", 9, true)}, false),
              Places{kNone})
        << "of two, nobody knows which";
}

TEST(ListMatching, NeverTakesOneKindForAnother) {
    EXPECT_EQ(MatchLists({Loose(1, "clip")}, {Loose(1, "gap")}, false), Places{kNone});
    EXPECT_EQ(MatchLists({{"1", 0, "picture", true}}, {{"1", 0, "sound", true}}, false),
              Places{kNone});
    EXPECT_EQ(MatchLists({Loose(1)}, {Keyed("a", 1, true)}, false), Places{kNone});
}

TEST(ListMatching, LeavesTheRestAsItIsWhereOneWasPutIn) {
    EXPECT_EQ(
        MatchLists({Loose(1), Loose(2), Loose(3)}, {Loose(1), Loose(9), Loose(2), Loose(3)}, false),
        (Places{0, 2, 3}));
    EXPECT_EQ(MatchLists({Loose(1), Loose(2), Loose(3)}, {Loose(1), Loose(3)}, false),
              (Places{0, kNone, 1}));
}

TEST(ListMatching, TakesAChangedOneForThatBetweenTheSameNeighbours) {
    EXPECT_EQ(MatchLists({Loose(1), Loose(2), Loose(3)}, {Loose(1), Loose(9), Loose(3)}, false),
              (Places{0, 1, 2}));
}

TEST(ListMatching, KeepsTheOrderOfAListWithAsFewExceptionsAsCanBe) {
    // The first went to the end.
    EXPECT_EQ(MatchLists({Loose(1), Loose(2), Loose(3), Loose(4)},
                         {Loose(2), Loose(3), Loose(4), Loose(1)}, false),
              (Places{kNone, 0, 1, 2}));
    EXPECT_EQ(MatchLists({Loose(1), Loose(2), Loose(3), Loose(4)},
                         {Loose(2), Loose(3), Loose(4), Loose(1)}, true),
              (Places{3, 0, 1, 2}))
        << "a set has none";
}

TEST(ListMatching, FindsNothingInAnEmptyList) {
    EXPECT_EQ(MatchLists({}, {Loose(1)}, false), Places{});
    EXPECT_EQ(MatchLists({Loose(1), Keyed("a")}, {}, false), (Places{kNone, kNone}));
    EXPECT_EQ(MatchLists({Loose(1), Keyed("a")}, {}, true), (Places{kNone, kNone}));
}

// A hostile file has as many as it likes.
TEST(ListMatching, TakesManyElements) {
    std::vector<ListElement> before;
    std::vector<ListElement> after;
    constexpr std::size_t kMany = 200'000;
    for (std::size_t i = 0; i < kMany; ++i) {
        before.push_back(Loose(i % 7));
        after.push_back(Loose(kMany - i));
    }
    const Places found = MatchLists(before, after, false);
    EXPECT_EQ(found.size(), kMany);
}

}  // namespace
