// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportOdd.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

using cliphost::OddThings;
using Json = nlohmann::ordered_json;

namespace {

Json Clip(Json facts) {
    for (const char* const list : {"traits", "warnings"}) {
        facts.emplace(list, Json::array());
    }
    return facts;
}

// "rates: 24/1 0 2, 25/1 1" for each finding.
std::string Told(const Json& clips) {
    std::string text;
    for (const Json& finding : OddThings(clips)) {
        text += (text.empty() ? "" : "; ") + finding["id"].get<std::string>() + ":";
        for (const Json& group : finding["groups"]) {
            text +=
                (&group == &finding["groups"][0] ? " " : ", ") + group["label"].get<std::string>();
            for (const Json& number : group["clips"]) {
                text += " " + std::to_string(number.get<int>());
            }
        }
    }
    return text;
}

TEST(OddThingsOfClips, AreNoneWhereAllAreAlike) {
    const Json clip = Clip({{"rate", "25/1"},
                            {"width", 16},
                            {"colors", "Rec. 709 (1-1-1)"},
                            {"hasTimecode", true},
                            {"drop", false}});
    EXPECT_EQ(Told(Json::array({clip, clip, clip})), "");
    EXPECT_EQ(Told(Json::array()), "");
}

TEST(OddThingsOfClips, TellMixedRatesWithTheClipsOfEach) {
    const auto clip = [](const char* rate) { return Clip({{"rate", rate}, {"width", 16}}); };
    EXPECT_EQ(Told({clip("24/1"), clip("25/1"), clip("24/1"), Clip({{"name", "without"}})}),
              "rates: 24/1 0 2, 25/1 1");
}

TEST(OddThingsOfClips, TellNoRateOfSoundAlone) {
    EXPECT_EQ(
        Told({Clip({{"rate", "24/1"}, {"width", 16}}), Clip({{"rate", "25/1"}, {"channels", 2}})}),
        "");
}

TEST(OddThingsOfClips, TellMixedColoursOfPicturesAlone) {
    EXPECT_EQ(Told({Clip({{"width", 1}, {"hasTimecode", false}, {"colors", "a"}}),
                    Clip({{"width", 1}, {"hasTimecode", false}}),
                    Clip({{"channels", 2}, {"hasTimecode", false}})}),
              "colors: a 0, not told 1");
}

TEST(OddThingsOfClips, TellNoColoursWhereTheHeaderIsNotUnderstood) {
    EXPECT_EQ(
        Told({Clip({{"width", 1}, {"hasTimecode", true}, {"colors", "a"}}), Clip({{"width", 1}})}),
        "");
}

Json Counting(const char* rate, bool drop, bool hasTimecode = true) {
    return Clip({{"rate", rate}, {"hasTimecode", hasTimecode}, {"drop", drop}});
}

TEST(OddThingsOfClips, TellDropBesideNonDropOfThoseWithTimecode) {
    EXPECT_EQ(Told({Counting("30000/1001", true), Counting("30000/1001", false)}),
              "drop: drop-frame 0, non-drop 1");
    EXPECT_EQ(Told({Counting("30000/1001", true), Counting("30000/1001", false, false)}), "");
}

TEST(OddThingsOfClips, TellDropBesideNonDropOfRatesThatCanDropAlone) {
    for (const char* const rate :
         {"24/1", "25/1", "24000/1001", "50/1", "1/2", "0/1", "30/0", "x"}) {
        EXPECT_EQ(Told({Counting("30000/1001", true), Counting(rate, false)}).find("drop:"),
                  std::string::npos)
            << rate;
    }
    EXPECT_NE(Told({Counting("30000/1001", true), Counting("60000/1001", false)}).find("drop:"),
              std::string::npos);
}

TEST(OddThingsOfClips, TellCopiesByTheirContent) {
    const auto clip = [](const char* id, const char* path) {
        return Clip({{"id", id}, {"path", path}});
    };
    EXPECT_EQ(Told({clip("x", "/a"), clip("y", "/b"), clip("x", "/c")}), "copies: x 0 2");
    EXPECT_EQ(Told({clip("x", "/a"), clip("y", "/b")}), "");
    EXPECT_EQ(Told({clip("x", "/a"), clip("x", "/a")}), "");
    EXPECT_EQ(Told({clip("x", "/a"), clip("x", "/a"), clip("x", "/c")}), "copies: x 0 2");
}

TEST(OddThingsOfClips, TellTraitsByTheirWordsAndEachClipOnce) {
    const auto edits = [](const char* words) { return Json{{"id", "edits"}, {"words", words}}; };
    const Json two = {edits("a"), edits("b"), edits("a")};
    EXPECT_EQ(Told({Clip({{"traits", two}}), Clip({{"traits", Json::array({edits("b")})}})}),
              "edits: a 0, b 0 1");
}

TEST(OddThingsOfClips, TellFailuresAndDoubtsApart) {
    const auto told = [](const char* kind) {
        return Json::array({{{"kind", kind}, {"reason", "r"}}});
    };
    EXPECT_EQ(Told({Clip({{"failed", true}, {"warnings", told("failure")}}),
                    Clip({{"failed", false}, {"warnings", told("doubt")}}),
                    Clip({{"failed", false}, {"warnings", told("sound")}})}),
              "failed: not described 0; doubt: a part can't be read 2, the header tells something "
              "wrong 1");
}

}  // namespace
