// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What processes of the program tell each other, whole and broken.

#include "reference_host/cliphost/Fields.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/MovieAnswer.h"

namespace {

using namespace cliphost;

TEST(Fields, ComeBackAsTheyWere) {
    const std::string odd("a\0\xFF\n", 4);
    const std::string bytes =
        FieldWriter().Add(odd).Add("").Add(std::uint64_t{0xFEDCBA9876543210}).bytes();
    FieldReader reader(bytes);
    EXPECT_EQ(reader.Text(), odd);
    EXPECT_EQ(reader.Text(), "");
    EXPECT_FALSE(reader.IsWhole());
    EXPECT_EQ(reader.Number(), 0xFEDCBA9876543210u);
    EXPECT_TRUE(reader.IsWhole());
}

TEST(Fields, AreNotWholeWhereAnyByteLacks) {
    const std::string bytes = FieldWriter().Add("text").Add(std::uint64_t{7}).bytes();
    for (std::size_t size = 0; size < bytes.size(); ++size) {
        FieldReader reader(std::string_view(bytes).substr(0, size));
        reader.Text();
        reader.Number();
        EXPECT_FALSE(reader.IsWhole()) << size;
    }
}

TEST(Fields, TakeNoLengthBeyondTheEnd) {
    const std::string bytes = FieldWriter().Add(~std::uint64_t{0}).bytes() + "text";
    FieldReader reader(bytes);
    EXPECT_EQ(reader.Text(), "");
    EXPECT_EQ(reader.Number(), 0u);  // nothing is read behind what is broken
    EXPECT_FALSE(reader.IsWhole());
}

TEST(MessageStream, PutsPiecesTogether) {
    const std::string bytes = FieldWriter().Add("one").Message() + FieldWriter().Message() +
                              FieldWriter().Add("three").Message();
    MessageStream stream;
    std::vector<std::string> messages;
    for (const char c : bytes) {
        stream.arrived() += c;
        while (const auto message = stream.Next()) {
            messages.push_back(*message);
        }
    }
    EXPECT_EQ(messages, (std::vector<std::string>{FieldWriter().Add("one").bytes(), "",
                                                  FieldWriter().Add("three").bytes()}));
    EXPECT_FALSE(stream.IsBroken());
}

TEST(MessageStream, WaitsForNoMessageThatIsTooLong) {
    MessageStream stream;
    stream.arrived() = FieldWriter().Add(kLongestMessage).bytes();
    EXPECT_FALSE(stream.IsBroken());
    EXPECT_FALSE(stream.Next());
    stream.arrived() = FieldWriter().Add(kLongestMessage + 1).bytes() + "text";
    EXPECT_TRUE(stream.IsBroken());
    EXPECT_FALSE(stream.Next());
}

MovieAnswer Described() {
    MovieAnswer answer;
    answer.problem = {"/a\xFF.mov", "a reason", "a hint", NCF_E_FAIL, "library", false};
    answer.route = "library";
    answer.routeReason = "it is fragmented";
    answer.description = "{\"class\": \"Header\"}";
    answer.isPartial = true;
    return answer;
}

const DescriptionForm kText{false, false};
const DescriptionForm kJson{true, false};

TEST(MovieAnswer, ComesBackAsItWas) {
    const MovieAnswer sent = Described();
    for (const DescriptionForm& form : {kText, kJson}) {
        MovieAnswer got;
        ASSERT_TRUE(FromBytes(ToBytes(sent), form, got));
        EXPECT_EQ(got.status, kExitFine);
        EXPECT_EQ(got.problem.subject, sent.problem.subject);
        EXPECT_EQ(got.problem.reason, sent.problem.reason);
        EXPECT_EQ(got.problem.hint, sent.problem.hint);
        EXPECT_EQ(got.problem.code, sent.problem.code);
        EXPECT_EQ(got.problem.route, sent.problem.route);
        EXPECT_EQ(got.route, sent.route);
        EXPECT_EQ(got.routeReason, sent.routeReason);
        EXPECT_EQ(got.description, sent.description);
        EXPECT_TRUE(got.isPartial);
    }
}

TEST(MovieAnswer, IsNoneWithABytePutOutOrIn) {
    const std::string bytes = ToBytes(Described());
    MovieAnswer got;
    for (std::size_t size = 0; size < bytes.size(); ++size) {
        EXPECT_FALSE(FromBytes(bytes.substr(0, size), kText, got)) << size;
    }
    EXPECT_FALSE(FromBytes(bytes + "x", kText, got));
}

TEST(MovieAnswer, IsNoneWithWhatNoProcessSays) {
    MovieAnswer got;
    MovieAnswer answer = Described();
    answer.status = kExitCaller + 1;
    EXPECT_FALSE(FromBytes(ToBytes(answer), kText, got));
    answer = Described();
    answer.status = kExitFile;
    EXPECT_TRUE(FromBytes(ToBytes(answer), kText, got));
    answer.problem.reason.clear();
    EXPECT_FALSE(FromBytes(ToBytes(answer), kText, got));
    answer = Described();
    answer.route = "another";
    EXPECT_FALSE(FromBytes(ToBytes(answer), kText, got));
}

TEST(MovieAnswer, HoldsOnlyJsonWhereJsonIsShown) {
    for (const char* const broken : {"", "{", "{}, {}", "\x1B[2J", "\"\xFF\"", "{\"a\": \"\n\"}"}) {
        MovieAnswer answer = Described();
        answer.description = broken;
        MovieAnswer got;
        EXPECT_FALSE(FromBytes(ToBytes(answer), kJson, got)) << broken;
    }
}

TEST(MovieAnswer, HoldsNothingThatControlsATerminal) {
    MovieAnswer answer = Described();
    answer.description = "one\n\x1B[2Jtwo\n";
    MovieAnswer got;
    ASSERT_TRUE(FromBytes(ToBytes(answer), kText, got));
    EXPECT_EQ(got.description, "one\n\\x1B[2Jtwo\n");
}

}  // namespace
