// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "reference_host/header_parser/SampleSizes.h"

namespace header_parser {

// Where a track's chunks lie and which samples they hold, out of stsc and stco
// or co64, read in place:
//
//     stsc   from chunk 1: 10 samples | from chunk 8: 3 samples
//     stco   place of chunk 1 | of chunk 2 | ...
//
// The first sample of every few stsc entries is marked, and one bit a chunk
// tells whether its bytes go on where the chunk before it ended. Samples and
// chunks count from zero here.
class ChunkMap {
public:
    struct Place {
        ncfUInt32 chunk;
        ncfUInt32 firstSample;  // of the chunk
        ncfUInt32 samples;      // of the chunk
        ncfUInt32 description;  // from 1
    };

    // Refuses tables that do not place exactly the samples that there are, and
    // chunks whose bytes cannot lie in a file. `isInFile[i]` tells whether
    // description i + 1 refers to this file.
    Verdict Read(const Atom& stsc, const Atom& stco, const Atom& co64, const SampleSizes& sizes,
                 const std::vector<bool>& isInFile);

    ncfUInt32 Count() const { return chunkCount_; }
    Place PlaceOfSample(ncfUInt32 sample) const;
    Place PlaceOfChunk(ncfUInt32 chunk) const;
    ncfUInt64 PositionOf(ncfUInt32 chunk) const {
        return isLarge_ ? LoadU64(positions_ + ncfUInt64{8} * chunk)
                        : LoadU32(positions_ + ncfUInt64{4} * chunk);
    }
    // First chunk behind `chunk` that begins a new run of bytes or another
    // description; Count() at the end.
    ncfUInt32 NextBreak(ncfUInt32 chunk) const;

private:
    Verdict OpenPositions(const Atom& stco, const Atom& co64);
    Verdict ReadRuns(const Atom& stsc, ncfUInt32 descriptions);
    Verdict WalkChunks(const Atom& offsets, const SampleSizes& sizes,
                       const std::vector<bool>& isInFile);

    ncfUInt32 FirstChunk(ncfUInt32 run) const { return Field(run, 0) - 1; }
    ncfUInt32 SamplesPerChunk(ncfUInt32 run) const { return Field(run, 4); }
    ncfUInt32 Description(ncfUInt32 run) const { return Field(run, 8); }
    ncfUInt32 EndChunk(ncfUInt32 run) const {
        return run + 1 < runCount_ ? FirstChunk(run + 1) : chunkCount_;
    }
    ncfUInt32 Field(ncfUInt32 run, ncfUInt32 at) const {
        return LoadU32(runs_ + ncfUInt64{12} * run + at);
    }
    Place PlaceIn(ncfUInt32 run, ncfUInt32 firstSampleOfRun, ncfUInt32 chunkInRun) const;

    ncfUInt32 sampleCount_ = 0;
    const ncfUInt8* runs_ = nullptr;
    ncfUInt32 runCount_ = 0;
    std::vector<ncfUInt32> marks_;  // first sample of every kStep-th run
    const ncfUInt8* positions_ = nullptr;
    ncfUInt32 chunkCount_ = 0;
    bool isLarge_ = false;
    std::vector<ncfUInt64> breaks_;  // one bit a chunk
};

}  // namespace header_parser
