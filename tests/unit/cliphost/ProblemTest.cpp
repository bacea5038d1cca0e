// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Problem.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/JsonAnswer.h"

using namespace cliphost;
using Json = nlohmann::ordered_json;

namespace {

const Problem kWhole{"a.mov", "it is broken at byte 12", "copy it again", NMA_E_NODATA,
                     route::kLibrary};

}  // namespace

TEST(Problem, IsOneLineThatNamesTheFileTheReasonAndWhatHelps) {
    EXPECT_EQ(LineOf(kWhole), "a.mov: it is broken at byte 12; copy it again");
    EXPECT_EQ(LineOf({"a.mov", "it is broken"}), "a.mov: it is broken");
    EXPECT_EQ(LineOf({{}, "no memory"}), "no memory");
}

TEST(Problem, KeepsTheModulesAnswerAndTheRouteBehindTheLine) {
    EXPECT_EQ(DetailsOf(kWhole),
              "  the module's answer: NMA_E_NODATA (0xA000006F): there is no data\n"
              "  the route: library\n");
    EXPECT_EQ(DetailsOf({"a.mov", "it is broken"}), "");
}

TEST(Problem, GivesJsonAllItsPartsAndNullForWhatIsNotKnown) {
    Json json = {{"movie", "a.mov"}};
    AddProblem(kWhole, json);
    EXPECT_EQ(json.dump(),
              R"({"movie":"a.mov","reason":"it is broken at byte 12","hint":"copy it again",)"
              R"("code":"NMA_E_NODATA","route":"library"})");
    AddProblem({{}, "it is broken"}, json);
    EXPECT_EQ(json.dump(),
              R"({"movie":"a.mov","reason":"it is broken","hint":null,"code":null,"route":null})");
}

TEST(Problem, TravelsInAFailure) {
    const Failure failure(kExitFile, kWhole);
    EXPECT_STREQ(failure.what(), "a.mov: it is broken at byte 12; copy it again");
    EXPECT_EQ(failure.problem().code, NMA_E_NODATA);
    EXPECT_STREQ(Failure(kExitCaller, "--range x", "this is not a range").what(),
                 "--range x: this is not a range");
    EXPECT_STREQ(Failure(kExitCaller, "no memory").what(), "no memory");
}

TEST(JsonAnswer, TellsAFailureOnStandardOutputWhereJsonIsAsked) {
    const auto fail = [] { throw Failure(kExitFile, kWhole); };
    testing::internal::CaptureStdout();
    EXPECT_THROW(AnswerFailureToo(true, "params/1.0", {{"movie", "a.mov"}}, fail), Failure);
    const Json told = Json::parse(testing::internal::GetCapturedStdout());
    EXPECT_EQ(told.begin().key(), "schema");
    EXPECT_EQ(told["schema"], "params/1.0");
    EXPECT_EQ(told["movie"], "a.mov");
    EXPECT_EQ(told["reason"], kWhole.reason);
    testing::internal::CaptureStdout();
    EXPECT_THROW(AnswerFailureToo(false, "params/1.0", {{"movie", "a.mov"}}, fail), Failure);
    AnswerFailureToo(true, "params/1.0", {{"movie", "a.mov"}}, [] {});
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "");
}

TEST(JsonAnswer, EachEntryOfAListTellsItsSchema) {
    testing::internal::CaptureStdout();
    PrintJson("types/1.0", Json::array({{{"index", 0}}, {{"index", 1}}}));
    EXPECT_EQ(Json::parse(testing::internal::GetCapturedStdout()).dump(),
              R"([{"schema":"types/1.0","index":0},{"schema":"types/1.0","index":1}])");
    testing::internal::CaptureStdout();
    PrintJson("types/1.0", Json::array());
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "[]\n");
}
