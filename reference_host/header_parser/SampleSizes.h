// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/header_parser/Verdict.h"

namespace header_parser {

// How sound is really stored in its chunks when it comes in packets, or when the
// table counts frames with a size of 1.
struct PacketLayout {
    ncfUInt32 framesPerPacket = 1;
    ncfUInt32 bytesPerPacket = 0;  // 0: the table's sizes are true
};

// Sizes of a track's samples, out of stsz or stz2, read in place. For a table
// with an entry a sample the sum is marked every few samples, so the bytes of
// any range are two marks and two short walks. Samples count from zero here.
class SampleSizes {
public:
    Verdict Read(const Atom& stsz, const Atom& stz2);
    // Every sample is a frame of such packets, from the start of each chunk.
    void UsePackets(const PacketLayout& layout);

    ncfUInt32 Count() const { return count_; }
    bool AreEqual() const { return smallest_ == largest_; }
    ncfUInt32 Largest() const { return largest_; }
    // The table gives one size for all, and this is it; else 0.
    ncfUInt32 TableSize() const { return fixed_; }

    // Bytes of a sample; of its packet where packets hold several.
    ncfUInt32 SizeOf(ncfUInt32 sample) const;
    // Bytes from the start of a chunk, at sample `first`, to `sample`.
    ncfUInt64 BytesUpTo(ncfUInt32 first, ncfUInt32 sample) const;
    // Bytes of a chunk of `count` samples from `first`.
    ncfUInt64 BytesOf(ncfUInt32 first, ncfUInt32 count) const;

private:
    template <class EntryAt>
    void Mark(EntryAt entryAt);
    // Calls visit(entryAt), which reads entries of the table's width.
    template <class Visit>
    auto WithEntries(Visit visit) const;
    ncfUInt32 Entry(ncfUInt32 sample) const;
    ncfUInt64 Sum(ncfUInt32 from, ncfUInt32 to) const;

    ncfUInt32 count_ = 0;
    ncfUInt32 fixed_ = 0;
    unsigned entryBits_ = 0;
    const ncfUInt8* entries_ = nullptr;
    std::vector<ncfUInt64> marks_;  // bytes in front of every kStep-th sample
    ncfUInt32 smallest_ = 0;
    ncfUInt32 largest_ = 0;
    PacketLayout packets_;
};

}  // namespace header_parser
