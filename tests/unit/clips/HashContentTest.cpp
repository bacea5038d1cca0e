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
    ByteVector content{1, 2, 3};
};

}  // namespace

TEST_F(HashContent, ReadsARangeBehindWhatIsThere) {
    EXPECT_EQ(Append(250, 4), NCF_OK);
    EXPECT_EQ(content, (ByteVector{1, 2, 3, 250, 0, 1, 2}));
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
    EXPECT_EQ(content, (ByteVector{1, 2, 3}));
}

TEST_F(HashContent, AddsNothingForAnEmptyRangeWhereverItIs) {
    EXPECT_EQ(Append(ncfUInt64{1} << 63, 0), NCF_OK);
    EXPECT_EQ(content, (ByteVector{1, 2, 3}));
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

namespace {

// A file of many mebibytes, with a mark in each.
class LongHashContent : public ClipTest {
protected:
    static constexpr ncfUInt64 kMebibyte = 1 << 20;
    static std::vector<ncfUInt8> Marked(std::size_t mebibytes) {
        std::vector<ncfUInt8> bytes(mebibytes * kMebibyte);
        for (std::size_t i = 0; i < mebibytes; ++i) {
            bytes[i * kMebibyte] = bytes[(i + 1) * kMebibyte - 1] = static_cast<ncfUInt8>(i + 1);
        }
        return bytes;
    }
    LongHashContent() : ClipTest(Marked(24)) {}
    NCFRESULT Append(ncfUInt64 offset, ncfUInt64 size) {
        return AppendFileRange("Reader", "read it", reader, offset, size, content);
    }

    NMA::Impl::SimpleFileIO reader{HostText(file.path()).inArg()};
    ByteVector content;
};

TEST_F(LongHashContent, ComesOutWholeWhereverItBegins) {
    const std::vector<ncfUInt8> whole = Marked(24);
    EXPECT_EQ(Append(0, whole.size()), NCF_OK);
    EXPECT_TRUE(std::equal(content.begin(), content.end(), whole.begin(), whole.end()));
    content.clear();
    EXPECT_EQ(Append(777, whole.size() - 1777), NCF_OK);
    EXPECT_TRUE(std::equal(content.begin(), content.end(), whole.begin() + 777));
    EXPECT_EQ(content.size(), whole.size() - 1777);
}

// As short as any other read, wherever the file ends.
TEST_F(LongHashContent, LeavesNothingOfARangeThatTheFileCannotFill) {
    RecordingNMALog lines(1);
    for (const ncfUInt64 offset : {kMebibyte, 8 * kMebibyte, 16 * kMebibyte}) {
        EXPECT_EQ(Append(offset, 24 * kMebibyte), NCF_E_FAIL) << offset;
    }
    EXPECT_TRUE(content.empty());
    EXPECT_TRUE(log->records().empty());
    EXPECT_TRUE(lines.lines().empty());
}

// Tracks add a mebibyte each. A move would hold the header twice.
TEST_F(LongHashContent, IsNotMovedUntilTracksHaveAddedAsMuchAgain) {
    EXPECT_EQ(Append(0, 24 * kMebibyte), NCF_OK);
    const ncfUInt8* const former = content.data();
    for (int i = 0; i < 24; ++i) {
        ASSERT_EQ(Append(0, kMebibyte), NCF_OK);
        ASSERT_EQ(content.data(), former) << "moved for track " << i + 1;
    }
}

}  // namespace
