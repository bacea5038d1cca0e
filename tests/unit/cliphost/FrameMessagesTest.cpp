// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What processes of the program tell each other of a range of frames.

#include "reference_host/cliphost/FrameMessages.h"

#include <gtest/gtest.h>

namespace {

using namespace cliphost;
using Kind = FrameRequest::Kind;

FrameRequest Request(Kind kind, std::uint64_t first, std::optional<std::uint64_t> end) {
    FrameRequest request;
    request.kind = kind;
    request.wanted.range = {first, end, 3};
    return request;
}

bool IsTaken(const FrameAnswer& answer, const FrameRequest& request) {
    FrameAnswer read;
    return read.Read(answer.ToBytes(), request);
}

bool IsTakenAsPlan(std::uint64_t count, std::vector<std::uint64_t> cuts) {
    FrameAnswer answer;
    answer.plan = {count, 8, "", std::move(cuts)};
    return IsTaken(answer, Request(Kind::Plan, 1, 31));  // ten frames
}

bool IsTakenAsPiece(const std::string& written, int status = kExitFine) {
    FrameAnswer answer;
    answer.written = written;
    answer.outcome.status = status;
    answer.outcome.problem.reason = status == kExitFine ? "" : "why";
    return IsTaken(answer, Request(Kind::Raw, 1, 10));  // three frames
}

TEST(FrameMessages, ComeBackAsTheyWere) {
    FrameRequest request = Request(Kind::Pictures, 5, 80);
    request.wanted.isOne = true;
    request.wanted.areBelieved = true;
    request.jobs = 7;
    const FrameRequest asked = FrameRequest::From(request.ToBytes());
    EXPECT_EQ(asked.kind, Kind::Pictures);
    EXPECT_EQ(asked.wanted.range.first, 5u);
    EXPECT_EQ(asked.wanted.range.end, 80u);
    EXPECT_EQ(asked.wanted.range.step, 3u);
    EXPECT_TRUE(asked.wanted.isOne);
    EXPECT_TRUE(asked.wanted.areBelieved);
    EXPECT_EQ(asked.jobs, 7u);
    EXPECT_EQ(FrameRequest::From(Request(Kind::Plan, 1, {}).ToBytes()).wanted.range.CountIn(10),
              3u);

    FrameAnswer answer;
    answer.plan = {20, 1000, "words", {5, 9}, true};
    answer.width = 64;
    answer.height = 48;
    FrameAnswer read;
    ASSERT_TRUE(read.Read(answer.ToBytes(), Request(Kind::Plan, 0, {})));
    EXPECT_EQ(read.plan.count, 20u);
    EXPECT_EQ(read.plan.frameBytes, 1000u);
    EXPECT_EQ(read.plan.rawWords, "words");
    EXPECT_TRUE(read.plan.leanOnEachOther);
    EXPECT_EQ(read.plan.cuts, (std::vector<std::uint64_t>{5, 9}));
    EXPECT_EQ(read.width, 64);
    EXPECT_EQ(read.height, 48);
    ASSERT_TRUE(read.Read(answer.ToBytes(), Request(Kind::Plan, 0, {})));
    EXPECT_EQ(read.plan.cuts, (std::vector<std::uint64_t>{5, 9}));
}

TEST(FrameMessages, ArePlansOfWhatWasAskedForAlone) {
    EXPECT_TRUE(IsTakenAsPlan(10, {}));
    EXPECT_TRUE(IsTakenAsPlan(10, {1, 9}));
    EXPECT_FALSE(IsTakenAsPlan(11, {}));
    EXPECT_FALSE(IsTakenAsPlan(0, {}));
    EXPECT_FALSE(IsTakenAsPlan(10, {0}));
    EXPECT_FALSE(IsTakenAsPlan(10, {5, 5}));
    EXPECT_FALSE(IsTakenAsPlan(10, {5, 4}));
    EXPECT_FALSE(IsTakenAsPlan(10, {10}));
}

TEST(FrameMessages, TellOfEachFrameOfThePiece) {
    EXPECT_TRUE(IsTakenAsPiece("wow"));
    EXPECT_FALSE(IsTakenAsPiece("wo"));
    EXPECT_FALSE(IsTakenAsPiece("woww"));
    EXPECT_FALSE(IsTakenAsPiece("wxw"));
    EXPECT_TRUE(IsTakenAsPiece("wo", kExitCaller));
    EXPECT_TRUE(IsTakenAsPiece("", kExitFile));
    EXPECT_FALSE(IsTakenAsPiece("wow", kExitFile));
}

TEST(FramePieces, AreFewWhateverAHeaderClaims) {
    for (const std::uint64_t bytes : {0ull, 1ull, 1ull << 20, 1ull << 40}) {
        const std::uint64_t claimed = std::uint64_t{1} << 40;
        const PieceLength length = PieceLengthFor(claimed, bytes, 8);
        EXPECT_LE(claimed / length.usual, 4096u);
        EXPECT_GE(length.most, length.usual);
        EXPECT_LE(length.most - length.usual, 4096u);
    }
    EXPECT_EQ(PieceLengthFor(96, 480 * 272 * 2, 2).usual, 13u);
    EXPECT_EQ(PieceLengthFor(96, 480 * 272 * 2, 2).most, 49u);
}

TEST(FramePieces, WaitByTheirBytes) {
    const std::uint64_t mebibyte = std::uint64_t{1} << 20;
    EXPECT_EQ(MostPiecesWaiting(12, 1000, 8), 32u);
    EXPECT_EQ(MostPiecesWaiting(128, mebibyte, 8), 16u);
    EXPECT_EQ(MostPiecesWaiting(1024, mebibyte, 8), 8u) << "one for each process";
}

TEST(FrameMessages, AreNoneWhereAnyByteLacksOrIsTooMuch) {
    FrameAnswer answer;
    answer.plan = {10, 8, "words", {5}};
    const FrameRequest request = Request(Kind::Plan, 1, 31);
    const std::string bytes = answer.ToBytes();
    ASSERT_TRUE(FrameAnswer().Read(bytes, request));
    for (std::size_t size = 0; size < bytes.size(); ++size) {
        EXPECT_FALSE(FrameAnswer().Read(bytes.substr(0, size), request)) << size;
    }
    EXPECT_FALSE(FrameAnswer().Read(bytes + "x", request));
    std::string many = bytes;
    many[bytes.size() - 9] = '\x7F';  // the highest byte of how many cuts there are
    EXPECT_FALSE(FrameAnswer().Read(many, request));
}

}  // namespace
