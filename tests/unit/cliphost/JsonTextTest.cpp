// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/JsonText.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <random>

using cliphost::AppendJsonText;
using cliphost::IsJsonOfTexts;

namespace {

std::string InJson(std::string_view text) {
    std::string json;
    AppendJsonText(text, json);
    return json;
}

}  // namespace

TEST(JsonText, QuotesWhatJsonHasNoPlaceFor) {
    EXPECT_EQ(InJson(""), "\"\"");
    EXPECT_EQ(InJson("a clip's name"), "\"a clip's name\"");
    EXPECT_EQ(InJson("\"a\\b\""), "\"\\\"a\\\\b\\\"\"");
    EXPECT_EQ(InJson(std::string_view("a\n\x01\0", 4)), "\"a\\n\\u0001\\u0000\"");
    EXPECT_EQ(InJson("\xC3\xA9\xFF"), "\"\xC3\xA9\xEF\xBF\xBD\"");
}

TEST(JsonText, IsReadAsTheTextForEveryCharacterOfAscii) {
    for (int c = 0; c < 128; ++c) {
        const std::string text = {'a', static_cast<char>(c), 'b'};
        EXPECT_EQ(nlohmann::json::parse(InJson(text)), text) << c;
        EXPECT_TRUE(IsJsonOfTexts(InJson(text))) << c;
    }
}

TEST(JsonText, IsReadAsTheTextWhereverACharacterStands) {
    for (int c = 0; c < 128; ++c) {
        for (std::size_t place = 0; place < 17; ++place) {
            std::string text(17, 'a');
            text[place] = static_cast<char>(c);
            EXPECT_EQ(nlohmann::json::parse(InJson(text)), text) << c << ' ' << place;
            EXPECT_TRUE(IsJsonOfTexts(InJson(text))) << c << ' ' << place;
            EXPECT_EQ(IsJsonOfTexts('"' + text + '"'), nlohmann::json::accept('"' + text + '"'))
                << c << ' ' << place;
        }
    }
    for (std::size_t place = 0; place < 17; ++place) {
        std::string text(17, 'a');
        text[place] = '\xFF';
        EXPECT_EQ(InJson(text),
                  '"' + text.substr(0, place) + "\xEF\xBF\xBD" + text.substr(place + 1) + '"');
        EXPECT_FALSE(IsJsonOfTexts('"' + text + '"')) << place;
    }
}

TEST(JsonText, TakesObjectsListsAndTexts) {
    for (const char* const json :
         {R"("a")", R"([])", R"({})", R"( [ "a" , [ ] , { } ] )", R"({"a":"b","c":[{"d":[]},"e"]})",
          "{\n  \"a\": \"\xC3\xA9 \xF0\x9F\x8E\xAC\\n\\u001f\\/\"\n}\n", R"([[["a"],[]],"b"])"}) {
        EXPECT_TRUE(IsJsonOfTexts(json)) << json;
        EXPECT_TRUE(nlohmann::json::accept(json)) << json;
    }
}

TEST(JsonText, RefusesAllElse) {
    for (const char* const json : {"",
                                   " ",
                                   "a",
                                   "1",
                                   "null",
                                   "{",
                                   "[",
                                   "]",
                                   "\"",
                                   "\"a",
                                   "\"a\\",
                                   "\"a\\u00",
                                   "\"\\u00g0\"",
                                   "\"\\uD800\"",
                                   "\"\\x\"",
                                   "\"\n\"",
                                   "\"\xFF\"",
                                   "\"\xED\xA0\x80\"",
                                   "\"a\"\"b\"",
                                   "[,]",
                                   "[\"a\",]",
                                   "[\"a\" \"b\"]",
                                   "[\"a\"}",
                                   "[]]",
                                   "[[]",
                                   "{\"a\"}",
                                   "{\"a\":}",
                                   "{\"a\":\"b\",}",
                                   "{:\"a\"}",
                                   "{[]:\"a\"}",
                                   "{\"a\":\"b\" \"c\":\"d\"}",
                                   "{\"a\":\"b\"]",
                                   "[1]",
                                   "[\"a\":\"b\"]"}) {
        EXPECT_FALSE(IsJsonOfTexts(json)) << json;
    }
    EXPECT_FALSE(IsJsonOfTexts(std::string_view("\"a\0\"", 4)));
    EXPECT_FALSE(IsJsonOfTexts(std::string_view("[]\0", 3)));
    EXPECT_FALSE(IsJsonOfTexts(std::string(5000, '[') + std::string(5000, ']')));
}

// Whatever a process hands over that a movie has broken, a reader of JSON takes what passes.
TEST(JsonText, TakesNothingThatIsNoJson) {
    const std::string whole =
        "{\n  \"class\": \"Mob\",\n  \"Name\": \"\\\"\xC3\xA9\\\" \\u0007\",\n  \"Slots\": [\n"
        "    {\n      \"class\": \"Slot\"\n    },\n    {}\n  ],\n  \"None\": []\n}";
    constexpr char kBytes[] = "{}[]\":,\\u0n 1\n\x01\xC3\xA9\xFF";
    ASSERT_TRUE(IsJsonOfTexts(whole));
    std::minstd_rand random(3);
    int taken = 0;
    for (int i = 0; i < 20000; ++i) {
        std::string damaged = whole;
        for (unsigned changes = random() % 3 + 1; changes > 0; --changes) {
            const std::size_t place = random() % damaged.size();
            const char byte = kBytes[random() % (sizeof kBytes - 1)];
            switch (random() % 3) {
                case 0:
                    damaged[place] = byte;
                    break;
                case 1:
                    damaged.insert(place, 1, byte);
                    break;
                default:
                    damaged.erase(place, 1);
            }
        }
        if (IsJsonOfTexts(damaged)) {
            ++taken;
            ASSERT_TRUE(nlohmann::json::accept(damaged)) << damaged;
        }
    }
    EXPECT_GT(taken, 100);
}
