// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieEntry.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/JsonText.h"

using namespace cliphost;

TEST(MovieEntry, TravelsAsJsonOfTexts) {
    catalog::Entry entry = {
        {"movies", {{{"name", "a \"b\"\n"}, {"length", "5"}}}},
        {"tracks", {{{"number", "0"}, {"kind", "picture"}}, {{"number", "1"}, {"kind", "sound"}}}},
        {"warnings", {}}};
    const std::string json = ToJson(entry);
    EXPECT_TRUE(IsJsonOfTexts(json)) << json;
    EXPECT_EQ(EntryFrom(json), entry);
    EXPECT_EQ(ToJson({}), "{}");
}

TEST(MovieEntry, KeepsAPicture) {
    catalog::Entry entry;
    AddThumbnail({2, 1, 3, 8, {1, 2, 3, 4, 5, 6}}, entry);
    const std::string json = ToJson(entry);
    EXPECT_TRUE(IsJsonOfTexts(json)) << json;
    const catalog::Entry back = EntryFrom(json);
    const std::string& picture = back.at("thumbnails").at(0).at("picture");
    EXPECT_EQ(picture.compare(0, 4, "\x89PNG"), 0);
    EXPECT_EQ(back.at("thumbnails").at(0).at("width"), "2");
}

// A process that a movie has broken may answer anything.
TEST(MovieEntry, TakesWhatATableCanHold) {
    for (const char* const json : {"", "[]", "\"x\"", "{", "{\"other\":[{}]}", "{\"movies\":[]}"}) {
        const catalog::Entry entry = EntryFrom(json);
        EXPECT_EQ(entry.size(), 1u) << json;
        EXPECT_EQ(entry.at("movies").size(), 1u) << json;
    }
    const catalog::Entry entry = EntryFrom(
        "{\"movies\":[{\"name\":\"a\"},{\"name\":\"b\"}],\"tracks\":[\"x\",{\"number\":\"7\","
        "\"kind\":"
        "[]}],\"columns\":\"text\",\"thumbnails\":[{\"picture\":\"xyz!\"}]}");
    EXPECT_EQ(entry.at("movies"), (std::vector<catalog::Row>{{{"name", "a"}}}));
    EXPECT_EQ(entry.at("tracks"), (std::vector<catalog::Row>{{{"kind", ""}, {"number", "0"}},
                                                             {{"kind", ""}, {"number", "1"}}}));
    EXPECT_EQ(entry.at("columns"),
              (std::vector<catalog::Row>{{{"name", ""}, {"place", "0"}, {"value", ""}}}));
    EXPECT_EQ(entry.count("thumbnails"), 0u);
}
