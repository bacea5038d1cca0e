// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/ByteSource.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <vector>

#include "tests/support/TestFolder.h"

namespace {

using header_parser::FileBytes;

constexpr ncfUInt64 kLength = 20000;

ncfUInt8 ByteAt(ncfUInt64 position) {
    return static_cast<ncfUInt8>(position * 7 % 251);
}

class ByteSourceOfAFile : public testing::Test {
protected:
    ByteSourceOfAFile() {
        std::ofstream out(path, std::ios::binary);
        for (ncfUInt64 i = 0; i < kLength; ++i) {
            out.put(static_cast<char>(ByteAt(i)));
        }
    }
    void ExpectRead(FileBytes& file, ncfUInt64 position, ncfUInt64 size) {
        std::vector<ncfUInt8> seen(size + 1, 0xEE);
        ASSERT_TRUE(file.Read(position, seen.data(), size)) << size << " at " << position;
        for (ncfUInt64 i = 0; i < size; ++i) {
            ASSERT_EQ(seen[i], ByteAt(position + i)) << size << " at " << position << ": " << i;
        }
        EXPECT_EQ(seen[size], 0xEE) << "nothing is written behind";
    }

    const TestFolder folder;
    const std::filesystem::path path = folder.path() / "bytes";
};

TEST_F(ByteSourceOfAFile, AreThoseOfAnyPlaceInAnyOrder) {
    FileBytes file(path);
    EXPECT_EQ(file.Length(), kLength);
    // Less, as much and more than what is kept; forward, backward and across its ends.
    for (const ncfUInt64 size : {1, 16, 4095, 4096, 4097, 9000}) {
        for (const ncfUInt64 position : {0, 900, 5, 4090, 100, 1000, 901}) {
            ExpectRead(file, position, size);
        }
        ExpectRead(file, kLength - size, size);
    }
    EXPECT_EQ(file.U32(40), header_parser::FileBytes(path).U32(40));
}

TEST_F(ByteSourceOfAFile, EndWithTheFile) {
    FileBytes file(path);
    ncfUInt8 bytes[8] = {};
    EXPECT_FALSE(file.Read(kLength - 7, bytes, 8));
    EXPECT_FALSE(file.Read(~ncfUInt64{0}, bytes, 8));
    EXPECT_EQ(file.U32(kLength - 3), 0u);
    EXPECT_TRUE(file.Read(kLength, bytes, 0));
    EXPECT_EQ(FileBytes(folder.path() / "absent").Length(), 0u);
}

TEST_F(ByteSourceOfAFile, MayEndEarlierThanWhenItWasOpened) {
    FileBytes file(path);
    std::filesystem::resize_file(path, 5000);
    ExpectRead(file, 4900, 100);
    ncfUInt8 bytes[8] = {};
    EXPECT_FALSE(file.Read(4996, bytes, 8));
    EXPECT_FALSE(file.Read(9000, bytes, 8));
    ExpectRead(file, 10, 8);
}

}  // namespace
