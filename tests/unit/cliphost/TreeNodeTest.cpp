// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TreeNode.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

using cliphost::ToJson;
using cliphost::ToText;
using cliphost::TreeNode;

namespace {

TreeNode Mob() {
    return {"Mob",
            {{"Name", "\"clip\""}, {"Length", "5"}},
            {{"Slots", {{"Slot", {{"Id", "1"}}, {}}, {"Slot", {{"Id", "2"}}, {}}}},
             {"Descriptor", {{"Picture", {}, {}}}}}};
}

}  // namespace

TEST(TreeNode, ShowsEachFactOnItsLineAndPartsBelow) {
    EXPECT_EQ(ToText(Mob()),
              "Mob\n"
              "  Name = \"clip\"\n"
              "  Length = 5\n"
              "  Slots:\n"
              "    Slot\n"
              "      Id = 1\n"
              "    Slot\n"
              "      Id = 2\n"
              "  Descriptor: Picture\n");
}

TEST(TreeNode, BreaksNoLineForTheLengthOfAFact) {
    const TreeNode node{"Mob", {{"A", std::string(800, 'x')}, {"Long", "y"}}, {}};
    EXPECT_EQ(ToText(node, 1), "  Mob\n    A = " + std::string(800, 'x') + "\n    Long = y\n");
}

TEST(TreeNode, KeepsAFactOnOneLineThatHoldsLineEnds) {
    const TreeNode node{"Mob", {{"Name", "\"a\nb\x1B[2J\""}}, {}};
    EXPECT_EQ(ToText(node), "Mob\n  Name = \"a\\nb\\x1B[2J\"\n");
}

TEST(TreeNode, IsJsonWithTheSameNames) {
    const auto json = nlohmann::json::parse(ToJson(Mob()));
    EXPECT_EQ(json["class"], "Mob");
    EXPECT_EQ(json["Name"], "\"clip\"");
    EXPECT_EQ(json["Slots"].size(), 2u);
    EXPECT_EQ(json["Slots"][1]["Id"], "2");
    EXPECT_EQ(json["Descriptor"][0]["class"], "Picture");
}

TEST(TreeNode, IsLaidOutAsOtherJsonIsInWhichItStands) {
    EXPECT_EQ(ToJson({"Mob", {{"Name", "a"}}, {{"Slots", {}}, {"Parts", {{"Part", {}, {}}}}}}),
              R"({
  "class": "Mob",
  "Name": "a",
  "Slots": [],
  "Parts": [
    {
      "class": "Part"
    }
  ]
})");
    for (const int level : {0, 1, 3}) {
        nlohmann::ordered_json around = nlohmann::ordered_json::parse(ToJson(Mob()));
        for (int i = 0; i < level; ++i) {
            around = nlohmann::ordered_json::array({around});
        }
        EXPECT_NE(around.dump(2).find(ToJson(Mob(), level)), std::string::npos) << level;
    }
}

TEST(TreeNode, IsJsonAlsoWithBytesThatAreNoText) {
    const TreeNode node{"Mob", {{"Name", "\xFF\xFE"}}, {}};
    EXPECT_TRUE(nlohmann::json::accept(ToJson(node)));
}
