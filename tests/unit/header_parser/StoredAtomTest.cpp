// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/StoredAtom.h"

#include <gtest/gtest.h>

#include "reference_host/movie_writer/Box.h"

namespace {

using header_parser::Code;
using header_parser::StoredAtom;
using header_parser::StoredAtoms;
using header_parser::StoredEntries;
using header_parser::StoredTable;
using movies::Box;
using movies::Bytes;

header_parser::UnpackedBytes SourceOf(const Bytes& bytes) {
    header_parser::HeaderBytes held;
    held.Append(bytes.data(), bytes.size());
    return header_parser::UnpackedBytes(std::move(held));
}

TEST(StoredAtoms, EndWithWhatHoldsThemWhereTheyClaimMoreOrNothing) {
    for (const Box& last : {Box("wxyz").U16(1).ClaimSize(99), Box("wxyz").U16(1).SizeToEnd()}) {
        Bytes bytes = Box("abcd").LargeSize().U8(7).ToBytes();
        const Bytes more = last.ToBytes();
        bytes.insert(bytes.end(), more.begin(), more.end());
        auto source = SourceOf(bytes);
        StoredAtoms atoms(source);
        StoredAtom atom;
        ASSERT_TRUE(atoms.Next(atom));
        EXPECT_EQ(atom.type, Code("abcd"));
        EXPECT_EQ(atom.begin, 16u);
        EXPECT_EQ(atom.end, 17u);
        EXPECT_FALSE(atom.isOpen || atom.isCutShort);
        ASSERT_TRUE(atoms.Next(atom));
        EXPECT_EQ(atom.type, Code("wxyz"));
        EXPECT_EQ(atom.Size(), 2u);
        EXPECT_NE(atom.isOpen, atom.isCutShort);
        EXPECT_FALSE(atoms.Next(atom));
    }
}

TEST(StoredAtoms, StopAtWhatIsNoAtom) {
    const Bytes longHead = Box("abcd").LargeSize().ToBytes();
    for (const Bytes& bytes :
         {Bytes(), Bytes(7), Bytes(longHead.begin(), longHead.end() - 1),
          Box("abcd").ClaimSize(7).ToBytes(), Box("abcd").LargeSize().ClaimSize(0).ToBytes(),
          Box("abcd").LargeSize().ClaimSize(15).ToBytes()}) {
        auto source = SourceOf(bytes);
        StoredAtom atom;
        EXPECT_FALSE(StoredAtoms(source).Next(atom));
    }
}

TEST(StoredEntries, GiveWhatTheAtomHoldsOfItsTable) {
    Box table("stts");
    table.Version(0).U32(99999);
    for (std::uint32_t i = 0; i < 5000; ++i) {
        table.U32(i).U32(i + 1);
    }
    const Bytes bytes = table.ToBytes();
    auto source = SourceOf(bytes);
    const StoredTable whole(source, 8, bytes.size(), 8);
    EXPECT_EQ(whole.count, 5000u);
    StoredEntries<2> entries(source, whole);
    std::uint32_t count = 0;
    for (StoredEntries<2>::Entry entry; entries.Next(entry); ++count) {
        ASSERT_EQ(entry[0], count);
        ASSERT_EQ(entry[1], count + 1);
    }
    EXPECT_EQ(count, 5000u);
    EXPECT_FALSE(entries.Failed());
}

TEST(StoredEntries, TellThatTheSourceEndsBeforeTheTable) {
    auto source = SourceOf(Bytes(20));
    StoredTable table;
    table.begin = 12;
    table.count = 2;
    StoredEntries<1> fits(source, table);
    StoredEntries<2> longer(source, table);
    StoredEntries<1>::Entry one;
    StoredEntries<2>::Entry two;
    EXPECT_TRUE(fits.Next(one) && fits.Next(one) && !fits.Next(one));
    EXPECT_FALSE(fits.Failed());
    EXPECT_FALSE(longer.Next(two));
    EXPECT_TRUE(longer.Failed());
    EXPECT_FALSE(longer.Next(two));
}

}  // namespace
