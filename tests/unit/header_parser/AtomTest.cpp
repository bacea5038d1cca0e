// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Atom.h"

#include <gtest/gtest.h>

#include "reference_host/movie_writer/Box.h"

namespace {

using header_parser::Atom;
using header_parser::AtomList;
using header_parser::ByteReader;
using header_parser::Code;
using movies::Box;
using movies::Bytes;

struct Walk {
    std::vector<ncfUInt32> types;
    bool isBroken;
    bool isClosed;
};

Walk WalkThrough(const Bytes& bytes) {
    AtomList atoms(bytes.data(), bytes.data() + bytes.size());
    Walk walk{};
    Atom atom;
    while (atoms.Next(atom)) {
        walk.types.push_back(atom.type);
    }
    walk.isBroken = atoms.Broken();
    walk.isClosed = atoms.Closed();
    return walk;
}

Bytes Two(const Box& first, const Box& second) {
    Bytes bytes = first.ToBytes();
    const Bytes more = second.ToBytes();
    bytes.insert(bytes.end(), more.begin(), more.end());
    return bytes;
}

TEST(AtomList, GivesEachAtomItsOwnRange) {
    const Bytes bytes = Two(Box("abcd").U8(7), Box("efgh").LargeSize().U16(9));
    AtomList atoms(bytes.data(), bytes.data() + bytes.size());
    Atom atom;
    ASSERT_TRUE(atoms.Next(atom));
    EXPECT_EQ(atom.type, Code("abcd"));
    EXPECT_EQ(atom.Size(), 1u);
    ASSERT_TRUE(atoms.Next(atom));
    EXPECT_EQ(atom.type, Code("efgh"));
    EXPECT_EQ(atom.Size(), 2u);
    EXPECT_EQ(header_parser::LoadU16(atom.begin), 9);
    EXPECT_FALSE(atoms.Next(atom));
    EXPECT_FALSE(atoms.Broken());
    EXPECT_FALSE(atoms.Closed());
}

TEST(AtomList, EndsAtAClosingZero) {
    const Walk walk = WalkThrough(Two(Box("abcd"), Box("efgh").SizeToEnd()));
    EXPECT_EQ(walk.types, std::vector<ncfUInt32>{Code("abcd")});
    EXPECT_FALSE(walk.isBroken);
    EXPECT_TRUE(walk.isClosed);
}

TEST(AtomList, IsBrokenByAnAtomLargerThanWhatIsLeft) {
    EXPECT_TRUE(WalkThrough(Box("abcd").ClaimSize(9).ToBytes()).isBroken);
    EXPECT_TRUE(WalkThrough(Box("abcd").LargeSize().ClaimSize(17).ToBytes()).isBroken);
    EXPECT_TRUE(WalkThrough(Box("abcd").LargeSize().ClaimSize(~0ull).ToBytes()).isBroken);
}

TEST(AtomList, IsBrokenByAnAtomSmallerThanItsHeader) {
    EXPECT_TRUE(WalkThrough(Box("abcd").ClaimSize(7).ToBytes()).isBroken);
    EXPECT_TRUE(WalkThrough(Box("abcd").LargeSize().ClaimSize(15).ToBytes()).isBroken);
}

TEST(AtomList, IsBrokenByAHeaderThatIsCut) {
    const Bytes whole = Box("abcd").LargeSize().U8(1).ToBytes();
    for (std::size_t length = 1; length < whole.size(); ++length) {
        EXPECT_TRUE(WalkThrough(Bytes(whole.begin(), whole.begin() + length)).isBroken) << length;
    }
}

TEST(FindAtom, GivesTheFirstOfItsKindOrNone) {
    const Bytes bytes = Two(Box("abcd").U8(1), Box("abcd").U8(2));
    const ncfUInt8* end = bytes.data() + bytes.size();
    EXPECT_EQ(*header_parser::FindAtom(bytes.data(), end, Code("abcd")).begin, 1);
    EXPECT_FALSE(header_parser::FindAtom(bytes.data(), end, Code("wxyz")));
}

TEST(ByteReader, ReadsBigEndianFieldsStraightDown) {
    const Bytes bytes = {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 0xFF, 0xFF, 0xFF, 0xFE};
    ByteReader reader(bytes.data(), bytes.data() + bytes.size());
    EXPECT_EQ(reader.U8(), 0x01);
    EXPECT_EQ(reader.U16(), 0x0203);
    EXPECT_EQ(reader.U32(), 0x04050607u);
    EXPECT_EQ(reader.U64(), 0x08090A0B0C0D0E0Full);
    EXPECT_EQ(reader.S32(), -2);
    EXPECT_FALSE(reader.Failed());
    EXPECT_EQ(reader.Left(), 0u);
}

TEST(ByteReader, RemembersItsFirstFailureAndReadsZerosFromThen) {
    const Bytes bytes = {1, 2, 3};
    ByteReader reader(bytes.data(), bytes.data() + bytes.size());
    EXPECT_EQ(reader.U32(), 0u);
    EXPECT_TRUE(reader.Failed());
    EXPECT_EQ(reader.U8(), 0);
    EXPECT_TRUE(reader.Failed());
}

}  // namespace
