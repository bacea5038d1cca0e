// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ComparisonReport.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

namespace {

using cliphost::ComparedObject;
using cliphost::TreeDifference;
using Kind = TreeDifference::Kind;

const ComparedObject kClip = {"MasterMob", "urn:a", "clip", ""};

std::string WordsOf(const ComparedObject& object, const TreeDifference& difference) {
    return ToJson(object, difference)["words"];
}

TreeDifference Whole(Kind kind) {
    TreeDifference difference;
    difference.kind = kind;
    return difference;
}

TEST(ComparisonInJson, NamesAnObjectThatIsGoneOrNewInItsWords) {
    EXPECT_EQ(WordsOf(kClip, Whole(Kind::Gone)), "master mob \"clip\" gone");
    EXPECT_EQ(WordsOf(kClip, Whole(Kind::New)), "master mob \"clip\" new");
    EXPECT_EQ(WordsOf({"SourceMob", "urn:b", "", "ImportDescriptor"}, Whole(Kind::Gone)),
              "source mob urn:b (ImportDescriptor) gone");
}

TEST(ComparisonInJson, LeavesTheNameOutOfWhatIsOtherInAnObject) {
    TreeDifference changed;
    changed.property = "Length";
    changed.before = "1";
    changed.after = "2";
    EXPECT_EQ(WordsOf(kClip, changed), "length 1 -> 2");
    TreeDifference gone = Whole(Kind::Gone);
    gone.place = {"picture slot 1"};
    EXPECT_EQ(WordsOf(kClip, gone), "picture slot 1 gone");
    TreeDifference reordered = Whole(Kind::Reordered);
    reordered.property = "Slots";
    EXPECT_EQ(WordsOf(kClip, reordered), "slots in another order");
}

}  // namespace
