// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportShape.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

using cliphost::ClipFrom;

namespace {

std::string Kept(const std::string& json) {
    return ClipFrom(json).dump();
}

constexpr char kNothing[] = R"({"facts":{},"details":{}})";

TEST(ClipsOfReports, KeepWhatHasItsKind) {
    const std::string clip =
        R"({"facts":{"name":"a","length":3,"seconds":0.5,"alpha":true,"traits":[{"id":"x","words":"y"}]},)"
        R"("details":{"waves":[{"track":1,"peaks":[1,2]}]}})";
    EXPECT_EQ(Kept(clip), clip);
}

TEST(ClipsOfReports, LeaveOutValuesOfAnotherKind) {
    EXPECT_EQ(
        Kept(R"({"facts":{"name":1,"length":"3","seconds":"x","alpha":0,"traits":{},"poster":[],)"
             R"("rate":null,"width":1.5}})"),
        kNothing);
}

TEST(ClipsOfReports, LeaveOutMembersThatNobodyKnows) {
    EXPECT_EQ(Kept(R"({"facts":{"onload":"x","__proto__":{"a":1}},"details":{"x":1},"more":[]})"),
              kNothing);
}

TEST(ClipsOfReports, LeaveOutItemsOfAnotherKindAndKeepTheOthers) {
    EXPECT_EQ(Kept(R"({"details":{"waves":[1,{"peaks":[1,"a",null,2]},[]]}})"),
              R"({"facts":{},"details":{"waves":[{"peaks":[1,2]}]}})");
}

TEST(ClipsOfReports, LeaveOutPicturesThatAreNoBase64) {
    EXPECT_EQ(Kept(R"({"facts":{"poster":{"width":1,"data":"\"><script>"}}})"),
              R"({"facts":{"poster":{"width":1}},"details":{}})");
}

TEST(ClipsOfReports, AreEmptyOfWhatIsNoJson) {
    for (const char* const text : {"", "{", "[]", "1", "null", "{\"facts\":[],\"details\":1}"}) {
        EXPECT_EQ(Kept(text), kNothing) << text;
    }
}

TEST(ClipsOfReports, KeepTreesOfTextsAlone) {
    const std::string tree =
        R"({"facts":{},"details":{"description":{"class":"a","Mobs":[{"class":"b"}]}}})";
    EXPECT_EQ(Kept(tree), tree);
    EXPECT_EQ(Kept(R"({"details":{"description":{"class":"a","Mobs":[1]}}})"), kNothing);
}

TEST(ClipsOfReports, LeaveOutTreesThatAreTooDeep) {
    const auto nested = [](int depth) {
        return "{\"details\":{\"description\":" + std::string(depth, '[') +
               std::string(depth, ']') + "}}";
    };
    EXPECT_NE(Kept(nested(60)), kNothing);
    EXPECT_EQ(Kept(nested(70)), kNothing);
    EXPECT_EQ(Kept(nested(1'000'000)), kNothing);
}

}  // namespace
