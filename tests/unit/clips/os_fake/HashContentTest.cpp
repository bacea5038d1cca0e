// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What reading a long range asks of the system, and holds besides the content.

#include "source/clips/HashContent.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "tests/support/fakes/FakeHost.h"
#include "tests/unit/clips/os_fake/FakeOs.h"

namespace {

constexpr std::size_t kLong = 20 * kHashChunkSize + 777;
// What one read may fetch, with the sectors at its two ends.
constexpr std::size_t kLargestPiece = kHashChunkSize + 2 * 2048;

// From a place and to a place where no sector begins, the system's reads pass
// through a buffer of the reader's: a long one would be the content once more.
TEST(LongHashContentReads, HoldAMebibyteBesideTheContent) {
    FakeOs& system = FakeOs::Get() = FakeOs();
    system.content.resize(kLong + 4096);
    for (std::size_t i = 0; i < system.content.size(); i += 1000) {
        system.content[i] = static_cast<ncfUInt8>(i / 1000 + 1);
    }
    INCFString* const path = MakeHostString("C:\\movies\\clip.mov");
    {
        NMA::Impl::SimpleFileIO reader(path);
        ByteVector content;
        ASSERT_EQ(AppendFileRange("Reader", "read it", reader, 1001, kLong, content), NCF_OK);
        ASSERT_EQ(content.size(), kLong);
        EXPECT_TRUE(std::equal(content.begin(), content.end(), system.content.begin() + 1001));
        EXPECT_GT(system.largestBuffer, 0u) << "the reads pass by the buffer";
        EXPECT_LE(system.largestBuffer, kLargestPiece);
        for (const FakeOs::Access& read : system.reads) {
            EXPECT_LE(read.size, kLargestPiece) << "at " << read.position;
        }
    }
    path->Release();
}

}  // namespace
