// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ComparisonReport.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <nlohmann/json.hpp>

namespace {

using cliphost::ComparedObject;
using cliphost::ComparisonCounts;
using cliphost::ComparisonJson;
using cliphost::TreeDifference;
using Json = nlohmann::ordered_json;
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

TEST(ComparisonInJson, SaysOfAnObjectThatNothingIsKnownAndWhy) {
    TreeDifference unknown = Whole(Kind::Unknown);
    unknown.reason = "no movie";
    EXPECT_EQ(WordsOf(kClip, unknown), "master mob \"clip\" not described: no movie");
    EXPECT_EQ(ToJson(kClip, unknown)["kind"], "notDescribed");
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

// What is printed.
template <class Print>
std::string Printed(const Print& print) {
    testing::internal::CaptureStdout();
    print();
    std::fflush(stdout);
    return testing::internal::GetCapturedStdout();
}

TEST(ComparisonInJson, IsOneObjectInLinesOrInOne) {
    using Form = ComparisonJson::Form;
    const Json head = {{"schema", "s"}, {"file", "}"}};
    for (const std::size_t count : {0u, 1u, 2u}) {
        const auto print = [&](Form form, std::size_t spaces) {
            return Printed([&] {
                ComparisonJson json(head, form, spaces);
                for (std::size_t i = 0; i < count; ++i) {
                    json.Take(kClip, Whole(Kind::Gone));
                }
                json.Finish(ComparisonCounts());
            });
        };
        const std::string line = print(Form::OneLine, 0);
        EXPECT_EQ(line.find('\n'), line.size() - 1);
        const std::string inside = print(Form::Lines, 2);
        EXPECT_EQ(inside.substr(0, 3), "  {");
        EXPECT_EQ(inside.substr(inside.size() - 4), "\n  }");
        for (const std::string& text : {line, inside, print(Form::Lines, 0)}) {
            const Json json = Json::parse(text);
            EXPECT_EQ(json["file"], "}");
            EXPECT_EQ(json["differences"].size(), count);
            EXPECT_EQ(json["counts"]["gone"], 0);
            EXPECT_EQ(json.size(), 4u);
        }
    }
}

TEST(ComparisonInJson, IsNoneUntilItIsFinished) {
    const std::string text = Printed([] {
        ComparisonJson json({{"schema", "s"}}, ComparisonJson::Form::Lines);
        json.Take(kClip, Whole(Kind::Gone));
    });
    EXPECT_FALSE(Json::accept(text)) << text;
}

// A file may have a name of megabytes, and as many differences as it likes.
TEST(ComparisonInJson, CutsLongNames) {
    const std::string name(1u << 20, 'x');
    const ComparedObject clip = {name, "urn:a", name, name};
    TreeDifference changed = Whole(Kind::Changed);
    changed.property = name;
    for (const TreeDifference& difference : {Whole(Kind::Gone), changed}) {
        EXPECT_LT(ToJson(clip, difference).dump().size(), 2000u);
    }
    EXPECT_LT(InWords(clip).size(), 1000u);
}

}  // namespace
