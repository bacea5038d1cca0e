// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TreeDifferences.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "reference_host/cliphost/AafValue.h"

namespace {

using cliphost::PropertyWords;
using cliphost::TreeComparison;
using cliphost::TreeDifference;
using cliphost::TreeNode;
using Texts = std::vector<std::string>;

constexpr char kMob[] =
    "urn:smpte:umid:060a2b34.01010101.01010f00.13000000.00000001.00000002.00000003.00000004";
constexpr char kOtherMob[] =
    "urn:smpte:umid:060a2b34.01010101.01010f00.13000000.00000001.00000002.00000003.00000005";

TreeNode Node(const std::string& title, std::vector<TreeNode::Fact> facts,
              std::vector<TreeNode::Branch> branches = {}) {
    return {title, std::move(facts), std::move(branches)};
}

TreeNode Slot(const std::string& id, const aafUID_t& data, const std::string& length) {
    return Node("TimelineMobSlot", {{"EditRate", "25/1"}, {"SlotID", id}},
                {{"Segment",
                  {Node("SourceClip", {{"DataDefinition", "DataDef_X " + cliphost::ToText(data)},
                                       {"Length", length}})}}});
}
TreeNode Picture(const std::string& id, const std::string& length = "250") {
    return Slot(id, kAAFDataDef_LegacyPicture, length);
}
TreeNode Timecode(const std::string& id, const std::string& length = "250") {
    return Slot(id, kAAFDataDef_LegacyTimecode, length);
}
TreeNode Sound(const std::string& id, const std::string& length = "250") {
    return Slot(id, kAAFDataDef_LegacySound, length);
}
TreeNode Mob(std::vector<TreeNode> slots) {
    return Node("MasterMob", {}, {{"Slots", std::move(slots)}});
}
TreeNode Comment(const std::string& name, const std::string& value) {
    return Node("TaggedValue", {{"Name", '"' + name + '"'}, {"Value", '"' + value + '"'}});
}
TreeNode Comments(std::vector<TreeNode> all) {
    return Node("MasterMob", {}, {{"UserComments", std::move(all)}});
}
TreeNode Sequence(std::vector<TreeNode> parts) {
    return Node("Sequence", {}, {{"Components", std::move(parts)}});
}
TreeNode Part(const std::string& title, const std::string& length) {
    return Node(title, {{"Length", length}});
}

Texts Differences(const TreeNode& before, const TreeNode& after) {
    Texts texts;
    TreeComparison([&](const TreeDifference& one) {
        texts.push_back(InWords(one));
    }).Compare(before, after);
    return texts;
}

TEST(TreeDifferences, AreNoneBetweenEqualTrees) {
    const TreeNode tree = Mob({Picture("1"), Sound("2"), Timecode("3")});
    EXPECT_EQ(Differences(tree, tree), Texts{});
    EXPECT_EQ(Differences(TreeNode(), TreeNode()), Texts{});
}

TEST(TreeDifferences, TellAValueInWords) {
    EXPECT_EQ(Differences(Mob({Picture("1", "250")}), Mob({Picture("1", "251")})),
              Texts{"picture slot 1: length 250 -> 251"});
    EXPECT_EQ(Differences(Node("Mob", {{"Name", "\"a\""}}), Node("Mob", {{"Name", "\"b\""}})),
              Texts{"name \"a\" -> \"b\""});
}

TEST(TreeDifferences, TellWhatOneAloneHas) {
    EXPECT_EQ(Differences(Node("Mob", {{"AppCode", "7"}}), Node("Mob", {{"Usage", "1"}})),
              (Texts{"app code 7 -> none", "usage none -> 1"}));
}

TEST(TreeDifferences, TellAnInsertedSlotAloneAndNotThoseBehindIt) {
    EXPECT_EQ(
        Differences(Mob({Picture("1"), Sound("2")}), Mob({Picture("1"), Sound("5"), Sound("2")})),
        Texts{"first sound slot (5) new"});
}

TEST(TreeDifferences, CountSlotsOfOneKind) {
    EXPECT_EQ(Differences(Mob({Timecode("1"), Timecode("2", "9"), Picture("3")}),
                          Mob({Timecode("1"), Picture("3")})),
              Texts{"second timecode slot (2) gone"});
}

TEST(TreeDifferences, FindASlotThatHasAnotherNumberNow) {
    EXPECT_EQ(Differences(Mob({Picture("1", "250")}), Mob({Sound("1", "9"), Picture("2", "250")})),
              (Texts{"picture slot 1: slot id 1 -> 2", "sound slot 1 new"}));
}

// The slots behind it are numbered anew.
TEST(TreeDifferences, TellASlotThatWentAndAChangeInOneBehindIt) {
    EXPECT_EQ(Differences(Mob({Timecode("1"), Timecode("2", "9"), Picture("3", "250")}),
                          Mob({Timecode("1"), Picture("2", "251")})),
              (Texts{"second timecode slot (2) gone", "picture slot 3: slot id 3 -> 2",
                     "picture slot 3: length 250 -> 251"}));
}

TEST(TreeDifferences, KeepTheOrderOfSlotsThatAreNumberedAnew) {
    EXPECT_EQ(Differences(Mob({Sound("2", "8"), Sound("3", "9")}),
                          Mob({Picture("2"), Sound("3", "8"), Sound("4", "9")})),
              (Texts{"first sound slot (2): slot id 2 -> 3",
                     "second sound slot (3): slot id 3 -> 4", "picture slot 2 new"}));
}

// The mob that a slot leads to has other numbers, too.
TEST(TreeDifferences, FindASlotThatLeadsToAnotherNumber) {
    const auto leading = [](const std::string& id, const std::string& to,
                            const std::string& length) {
        TreeNode slot = Sound(id, length);
        slot.branches[0].nodes[0].facts.push_back({"SourceMobSlotID", to});
        return slot;
    };
    EXPECT_EQ(Differences(Mob({leading("4", "3", "8"), leading("5", "4", "9")}),
                          Mob({leading("3", "2", "9")})),
              (Texts{"first sound slot (4) gone", "second sound slot (5): slot id 5 -> 3",
                     "second sound slot (5): source mob slot id 4 -> 2"}));
}

TEST(TreeDifferences, TellASlotThatHoldsAnotherKindAsGoneAndNew) {
    EXPECT_EQ(Differences(Mob({Picture("1", "250")}), Mob({Sound("1", "7")})),
              (Texts{"picture slot 1 gone", "sound slot 1 new"}));
}

TEST(TreeDifferences, FindNamedThingsByTheirNames) {
    EXPECT_EQ(Differences(Comments({Comment("Video", "PNG"), Comment("Reel", "1")}),
                          Comments({Comment("Tape", "2"), Comment("Video", "mine")})),
              (Texts{"user comment \"Video\": value \"PNG\" -> \"mine\"",
                     "user comment \"Reel\" gone (value \"1\")",
                     "user comment \"Tape\" new (value \"2\")"}));
}

TEST(TreeDifferences, TellAnotherOrderOfAListAndNotOfASet) {
    TreeNode before = Comments({Comment("a", "1"), Comment("b", "2")});
    TreeNode after = Comments({Comment("b", "2"), Comment("a", "1")});
    EXPECT_EQ(Differences(before, after), Texts{"user comments in another order"});
    before.branches[0].isSet = true;
    EXPECT_EQ(Differences(before, after), Texts{});
}

TEST(TreeDifferences, FindTheRestByContentAndOrder) {
    const TreeNode before =
        Sequence({Part("Filler", "0"), Part("Timecode", "5"), Part("Filler", "95")});
    EXPECT_EQ(Differences(before, Sequence({Part("Filler", "0"), Part("Timecode", "6"),
                                            Part("Filler", "95")})),
              Texts{"second component (Timecode): length 5 -> 6"});
    EXPECT_EQ(Differences(before, Sequence({Part("Timecode", "5"), Part("Filler", "95")})),
              Texts{"first component (Filler) gone (length 0)"});
}

TEST(TreeDifferences, TellAnotherClassAndNotWhatIsInIt) {
    EXPECT_EQ(Differences(Node("Slot", {}, {{"Segment", {Part("SourceClip", "1")}}}),
                          Node("Slot", {}, {{"Segment", {Part("Filler", "2")}}})),
              Texts{"segment SourceClip -> Filler"});
}

TEST(TreeDifferences, AreNotWhatSaysWhenAFileWasWritten) {
    EXPECT_EQ(Differences(
                  Node("Mob", {{"CreationTime", "1"}, {"Generation", "2"}, {"LastModified", "3"}}),
                  Node("Mob", {{"CreationTime", "4"}, {"LastModified", "5"}})),
              Texts{});
    // Nor do they keep a part from being found.
    const auto part = [](const std::string& time) {
        return Node("Filler", {{"LastModified", time}, {"Length", "1"}});
    };
    EXPECT_EQ(Differences(Sequence({part("1"), Part("Filler", "2")}),
                          Sequence({Part("Filler", "9"), part("2"), Part("Filler", "2")})),
              Texts{"first component (Filler) new (length 9)"});
}

TEST(TreeDifferences, AreNotIdsThatAreKnownToBeTheSame) {
    Texts texts;
    TreeComparison comparison([&](const TreeDifference& one) { texts.push_back(InWords(one)); });
    comparison.AddSame(kMob, kOtherMob);
    comparison.Compare(Node("SourceClip", {{"SourceID", kMob}}),
                       Node("SourceClip", {{"SourceID", kOtherMob}}));
    EXPECT_EQ(texts, Texts{});
    comparison.Compare(Node("SourceClip", {{"SourceID", kOtherMob}}),
                       Node("SourceClip", {{"SourceID", kMob}}));
    EXPECT_EQ(texts.size(), 1u) << "not the other way round";
}

TEST(TreeDifferences, CountWhatNothingCanBeSaidOf) {
    TreeComparison comparison([](const TreeDifference&) {});
    TreeNode cut = Node("Filler", {{"A", "?"}, {"B", "[?, ?]"}, {"C", "\"?\""}});
    cut.isCut = true;
    comparison.Compare(cut, cut);
    EXPECT_EQ(comparison.unread(), 3u) << "a text that is a question mark was read";
}

TEST(TreeDifferences, TakePropertiesThatAreValuesInOneAndObjectsInTheOther) {
    EXPECT_EQ(
        Differences(Node("Mob", {{"X", "1"}}), Node("Mob", {}, {{"X", {Part("Filler", "1")}}})),
        (Texts{"x 1 -> none", "first x (Filler) new (length 1)"}));
}

TEST(TreeDifferences, TakeNamesThatAreThereTwice) {
    EXPECT_EQ(Differences(Node("Mob", {{"A", "1"}, {"A", "2"}}), Node("Mob", {{"A", "1"}})),
              Texts{"a 2 -> none"});
}

TEST(TreeDifferences, ShowLongValuesWhereTheyBeginToDiffer) {
    const std::string start(5000, 'x');
    const Texts texts = Differences(Node("Mob", {{"Name", start + "first" + start}}),
                                    Node("Mob", {{"Name", start + "second" + start}}));
    ASSERT_EQ(texts.size(), 1u);
    EXPECT_LT(texts[0].size(), 500u);
    EXPECT_NE(texts[0].find("..." + std::string(30, 'x') + "first"), std::string::npos) << texts[0];
    EXPECT_NE(texts[0].find("second"), std::string::npos) << texts[0];
}

TEST(TreeDifferences, CutLongNames) {
    const std::string name(1u << 20, 'x');
    TreeComparison([&](const TreeDifference& one) {
        ASSERT_EQ(one.place.size(), 1u);
        EXPECT_LT(one.place[0].size(), 500u);
    }).Compare(Comments({Comment(name, "1")}), Comments({Comment(name, "2")}));
    const auto longest = [](const Texts& texts) {
        std::size_t most = 0;
        for (const std::string& text : texts) {
            most = std::max(most, text.size());
        }
        return most;
    };
    EXPECT_LT(longest(Differences(Node("Mob", {{name, "1"}}), Node("Mob", {{name, "2"}}))), 500u);
    EXPECT_LT(longest(Differences(Sequence({Part(name, "1")}), Sequence({Part("Filler", "2")}))),
              500u);
    const auto slot = [&](const char* length) {
        TreeNode one = Sound("1", length);
        one.branches[0].nodes[0].facts[0].value = name;
        return one;
    };
    EXPECT_LT(longest(Differences(Mob({slot("1")}), Mob({slot("2")}))), 500u);
}

TEST(TreeDifferences, CutLongValuesBetweenCharacters) {
    std::string text;
    for (int i = 0; i < 300; ++i) {
        text += "\xC3\xA9";
    }
    for (const std::string before : {"", "x"}) {
        const Texts texts = Differences(Node("Mob", {{"Name", before + text + "\xC3\xA8"}}),
                                        Node("Mob", {{"Name", before + text + "\xC3\xAA"}}));
        ASSERT_EQ(texts.size(), 1u);
        const std::size_t dots = texts[0].find("...");
        ASSERT_NE(dots, std::string::npos);
        EXPECT_EQ(texts[0][dots + 3], '\xC3');
        EXPECT_NE(texts[0].find("\xC3\xA8 -> "), std::string::npos) << texts[0];
    }
}

TEST(PropertyWords, AreTheNameInSmallLetters) {
    EXPECT_EQ(PropertyWords("EditRate"), "edit rate");
    EXPECT_EQ(PropertyWords("SourceMobSlotID"), "source mob slot id");
    EXPECT_EQ(PropertyWords("URLString"), "url string");
    EXPECT_EQ(PropertyWords("FPS"), "fps");
    EXPECT_EQ(PropertyWords("CDCIDescriptor"), "cdci descriptor");
    EXPECT_EQ(PropertyWords(""), "");
    EXPECT_EQ(PropertyWords("odd name_1"), "odd name_1");
}

}  // namespace
