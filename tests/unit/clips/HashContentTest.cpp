// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/HashContent.h"

#include "tests/unit/clips/ClipFixture.h"

namespace {

class HashContent : public ClipTest {
protected:
    NCFRESULT Append(ncfUInt64 offset, ncfUInt64 size) {
        return AppendFileRange("Reader", "read it", reader, offset, size, content);
    }

    NMA::Impl::SimpleFileIO reader{HostText(file.path()).inArg()};
    std::vector<ncfUInt8> content{1, 2, 3};
};

}  // namespace

TEST_F(HashContent, ReadsARangeBehindWhatIsThere) {
    EXPECT_EQ(Append(250, 4), NCF_OK);
    EXPECT_EQ(content, (std::vector<ncfUInt8>{1, 2, 3, 250, 0, 1, 2}));
    EXPECT_EQ(Append(0, 1), NCF_OK);
    EXPECT_EQ(content.size(), 8u);
    EXPECT_EQ(content.back(), 0);
}

TEST_F(HashContent, LeavesNothingOfARangeThatTheFileCannotFill) {
    RecordingNMALog lines(1);
    EXPECT_EQ(Append(0, 9001), NCF_E_FAIL);
    EXPECT_TRUE(log->records().empty()) << "short, but read";
    EXPECT_EQ(Append(1 << 20, 5), NMA_E_NODATA);
    EXPECT_EQ(log->records().back().text, ReturnRecord("a000006f", "read it", "Reader"));
    EXPECT_EQ(Append(0, ncfUInt64{1} << 32), NCF_E_FAIL);
    EXPECT_EQ(content, (std::vector<ncfUInt8>{1, 2, 3}));
}

TEST_F(HashContent, AddsNothingForAnEmptyRangeWhereverItIs) {
    EXPECT_EQ(Append(ncfUInt64{1} << 63, 0), NCF_OK);
    EXPECT_EQ(content, (std::vector<ncfUInt8>{1, 2, 3}));
}

// A movie may have a thousand tracks, each with a range of its own.
TEST_F(HashContent, MovesItsContentSeldom) {
    int moves = 0;
    for (int i = 0; i < 1000; ++i) {
        const ncfUInt8* const former = content.data();
        ASSERT_EQ(Append(0, 1000), NCF_OK);
        moves += content.data() != former;
    }
    EXPECT_EQ(content.size(), 1000003u);
    EXPECT_LE(moves, 20);
}
