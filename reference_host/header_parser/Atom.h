// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "reference_host/header_parser/ByteReader.h"

namespace header_parser {

// A type for people, in quotes: characters that are not plain letters are shown as
// numbers.
std::string NameOf(ncfUInt32 type);
std::string PlainNameOf(ncfUInt32 type);  // without the quotes
// Whether each of the four is a plain character, or the further one.
bool IsText(ncfUInt32 type, ncfUInt32 further = ' ');

// What an atom begins with: size and type, and behind a size of 1 the true one in
// 64 bits.
struct AtomHead {
    explicit AtomHead(ByteReader& reader);

    bool isWhole = false;  // no less was left
    ncfUInt32 type = 0;
    ncfUInt64 length = 8;  // its own
    ncfUInt64 size = 0;    // that the atom claims

    // The atom ends where what holds it does.
    bool IsOpen() const { return size == 0 && length == 8; }
};

// An atom within the header: its type and the bytes behind its own header.
struct Atom {
    ncfUInt32 type = 0;
    const ncfUInt8* begin = nullptr;
    const ncfUInt8* end = nullptr;
    const ncfUInt8* start = nullptr;  // of its own header; null for a part of another

    ncfUInt64 Size() const { return static_cast<ncfUInt64>(end - begin); }
    explicit operator bool() const { return begin != nullptr; }
};

// Walks the atoms that fill a range. Each is given its own sub-range, so a
// child cannot read its neighbour.
//
// The list ends at the end of the range or at four zero bytes that close it,
// as user data and sample descriptions do. What is neither makes it broken:
// Next then answers false, and Broken tells why it stopped.
class AtomList {
public:
    AtomList(const ncfUInt8* begin, const ncfUInt8* end) : reader_(begin, end) {}
    explicit AtomList(const Atom& parent) : AtomList(parent.begin, parent.end) {}

    bool Next(Atom& atom);
    bool Broken() const { return broken_; }
    // Stopped at a zero where an atom could have stood.
    bool Closed() const { return closed_; }

    // Where it stopped early, and what stood there.
    const ncfUInt8* StoppedAt() const { return stoppedAt_; }
    ncfUInt64 BytesLeft() const { return left_; }
    ncfUInt32 StoppedType() const { return stoppedType_; }
    ncfUInt64 ClaimedSize() const { return claimed_; }

private:
    bool Stop(bool broken);

    ByteReader reader_;
    bool broken_ = false;
    bool closed_ = false;
    const ncfUInt8* stoppedAt_ = nullptr;
    ncfUInt64 left_ = 0;
    ncfUInt32 stoppedType_ = 0;
    ncfUInt64 claimed_ = 0;
};

// The first child of that type, or an empty atom.
Atom FindAtom(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt32 type);

}  // namespace header_parser
