// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "reference_host/header_parser/ChunkMap.h"
#include "reference_host/header_parser/SampleSizes.h"
#include "reference_host/header_parser/SampleTimes.h"

namespace header_parser {

// Atoms of a sample table, wherever they stood within it.
struct SampleTableAtoms {
    Atom stts, ctts, stsc, stsz, stz2, stco, co64, stss, stps, sdtp;
};

// All that is known of a track's samples. Nothing here costs memory for each
// sample: the tables stay in the header's bytes. Samples count from zero.
class SampleTable {
public:
    Verdict Read(const SampleTableAtoms& atoms, const PacketLayout& oldSound,
                 const std::vector<bool>& isInFile);

    ncfUInt32 Count() const { return sizes_.Count(); }
    const SampleSizes& Sizes() const { return sizes_; }
    const SampleTimes& Times() const { return times_; }
    const ChunkMap& Chunks() const { return chunks_; }

    ncfUInt64 PositionOf(ncfUInt32 sample) const;
    bool IsSync(ncfUInt32 sample) const;
    bool IsDisposable(ncfUInt32 sample) const;
    // First sample behind `sample` whose bytes do not follow; Count() at the end.
    ncfUInt32 NextBreak(ncfUInt32 sample) const;

private:
    // A rising list of sample numbers, as stss and stps hold it.
    struct NumberList {
        const ncfUInt8* numbers = nullptr;
        ncfUInt32 count = 0;

        Verdict Read(const Atom& atom, ncfUInt32 sampleCount);
        bool Holds(ncfUInt32 number) const;
    };

    SampleSizes sizes_;
    SampleTimes times_;
    ChunkMap chunks_;
    bool allAreSync_ = true;
    NumberList sync_;
    NumberList partialSync_;                  // those decode by themselves too
    const ncfUInt8* dependencies_ = nullptr;  // one byte a sample, or null
};

}  // namespace header_parser
