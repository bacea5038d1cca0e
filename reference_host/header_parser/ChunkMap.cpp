// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/ChunkMap.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/header_parser/Marks.h"
#include "reference_host/header_parser/NumberLimits.h"

namespace header_parser {

namespace {

constexpr ncfUInt32 kStep = 16;

unsigned LowestBit(ncfUInt64 bits) {
    unsigned place = 0;
    for (unsigned width = 32; width != 0; width /= 2) {
        if ((bits & ((ncfUInt64{1} << width) - 1)) == 0) {
            bits >>= width;
            place += width;
        }
    }
    return place;
}

}  // namespace

Verdict ChunkMap::Read(const Atom& stsc, const Atom& stco, const Atom& co64,
                       const SampleSizes& sizes, const std::vector<bool>& isInFile) {
    sampleCount_ = sizes.Count();
    if (sampleCount_ == 0) {
        return Fine();
    }
    Verdict verdict = OpenPositions(stco, co64);
    if (!verdict.Refused()) {
        verdict = ReadRuns(stsc, static_cast<ncfUInt32>(isInFile.size()));
    }
    return verdict.Refused() ? verdict : WalkChunks(isLarge_ ? co64 : stco, sizes, isInFile);
}

Verdict ChunkMap::OpenPositions(const Atom& stco, const Atom& co64) {
    if (!stco && !co64) {
        return Broken("it lacks 'stco', the places of its chunks");
    }
    isLarge_ = !stco;
    const Atom& atom = isLarge_ ? co64 : stco;
    const Verdict verdict = OpenTable(atom, isLarge_ ? 8 : 4, positions_, chunkCount_);
    return verdict.Refused() ? verdict
           : chunkCount_ > 0
               ? Fine()
               : Broken(atom, fmt::format("{} holds no chunk, the track has {}", NameOf(atom.type),
                                          Counted(sampleCount_, "sample")));
}

Verdict ChunkMap::ReadRuns(const Atom& stsc, ncfUInt32 descriptions) {
    if (!stsc) {
        return Broken("it lacks 'stsc', the samples of its chunks");
    }
    if (Verdict verdict = OpenTable(stsc, 12, runs_, runCount_); verdict.Refused()) {
        return verdict;
    }
    if (runCount_ == 0) {
        return Broken(stsc, fmt::format("'stsc' is empty, the track has {}",
                                        Counted(sampleCount_, "sample")));
    }
    if (Field(0, 0) != 1) {
        return Broken(stsc, fmt::format("'stsc' begins with chunk {}, not with 1", Field(0, 0)));
    }
    marks_.reserve(runCount_ / kStep + 1);
    ncfUInt64 sample = 0;
    for (ncfUInt32 run = 0; run < runCount_; ++run) {
        if (run % kStep == 0) {
            marks_.push_back(static_cast<ncfUInt32>(sample));
        }
        const bool isLast = run + 1 == runCount_;
        const ncfUInt32 next = isLast ? run : run + 1;
        if (FirstChunk(next) >= chunkCount_) {
            return Broken(stsc,
                          fmt::format("entry {} of 'stsc' begins with chunk {}, the track has {}",
                                      next + 1, Field(next, 0), chunkCount_));
        }
        if (FirstChunk(run) >= EndChunk(run)) {
            return Broken(stsc,
                          fmt::format("entry {} of 'stsc' begins with chunk {}, entry {} with {}",
                                      run + 1, Field(run, 0), next + 1, Field(next, 0)));
        }
        if (SamplesPerChunk(run) == 0) {
            return Broken(stsc,
                          fmt::format("entry {} of 'stsc' puts no sample in a chunk", run + 1));
        }
        if (Description(run) == 0 || Description(run) > descriptions) {
            return Broken(stsc, fmt::format("entry {} of 'stsc' names sample description {}, the "
                                            "track has {}",
                                            run + 1, Description(run), descriptions));
        }
        // The last chunk may be filled in part.
        const ncfUInt64 chunks = EndChunk(run) - FirstChunk(run);
        const ncfUInt64 needed =
            sample + (chunks - (isLast ? 1 : 0)) * SamplesPerChunk(run) + (isLast ? 1 : 0);
        if (needed > sampleCount_) {
            return Broken(stsc, fmt::format("'stsc' places {} or more samples, the track has {}",
                                            needed, sampleCount_));
        }
        sample += chunks * SamplesPerChunk(run);
    }
    return sample >= sampleCount_
               ? Fine()
               : Broken(stsc, fmt::format("'stsc' places {} in {}, the track has {}",
                                          Counted(sample, "sample"), Counted(chunkCount_, "chunk"),
                                          sampleCount_));
}

Verdict ChunkMap::WalkChunks(const Atom& offsets, const SampleSizes& sizes,
                             const std::vector<bool>& isInFile) {
    breaks_.assign(chunkCount_ / 64 + 1, 0);
    ncfUInt32 sample = 0;
    ncfUInt64 end = 0;
    ncfUInt32 lastDescription = 0;
    for (ncfUInt32 run = 0; run < runCount_; ++run) {
        const ncfUInt32 description = Description(run);
        const ncfUInt32 perChunk = SamplesPerChunk(run);
        const ncfUInt32 endChunk = EndChunk(run);
        for (ncfUInt32 chunk = FirstChunk(run); chunk < endChunk; ++chunk) {
            const ncfUInt32 count = std::min(perChunk, sampleCount_ - sample);
            const ncfUInt64 position = PositionOf(chunk);
            const ncfUInt64 size = sizes.BytesOf(sample, count);
            if (position > kMaxPosition || size > kMaxPosition - position) {
                return Broken(offsets, fmt::format("chunk {} begins at byte {}, beyond any file",
                                                   chunk + 1, position));
            }
            // No media can stand where the first atom has its header; this is
            // also what a table looks like behind the end of a cut file.
            if (position < 8 && size > 0 && isInFile[description - 1]) {
                return Broken(offsets,
                              fmt::format("chunk {} begins at byte {}, where the first atom "
                                          "has its header",
                                          chunk + 1, position));
            }
            if (position != end || description != lastDescription) {
                breaks_[chunk / 64] |= ncfUInt64{1} << chunk % 64;
            }
            end = position + size;
            lastDescription = description;
            sample += count;
        }
    }
    return Fine();
}

ChunkMap::Place ChunkMap::PlaceIn(ncfUInt32 run, ncfUInt32 firstSampleOfRun,
                                  ncfUInt32 chunkInRun) const {
    const ncfUInt32 perChunk = SamplesPerChunk(run);
    const ncfUInt32 first = firstSampleOfRun + chunkInRun * perChunk;
    return {FirstChunk(run) + chunkInRun, first, std::min(perChunk, sampleCount_ - first),
            Description(run)};
}

ChunkMap::Place ChunkMap::PlaceOfSample(ncfUInt32 sample) const {
    const auto marks = static_cast<ncfUInt32>(marks_.size());
    const ncfUInt32 mark = LastNotAbove(marks, sample, [&](ncfUInt32 i) { return marks_[i]; });
    ncfUInt32 run = mark * kStep;
    ncfUInt32 first = marks_[mark];
    for (;; ++run) {
        const ncfUInt64 held = ncfUInt64{EndChunk(run) - FirstChunk(run)} * SamplesPerChunk(run);
        if (sample - first < held) {
            return PlaceIn(run, first, (sample - first) / SamplesPerChunk(run));
        }
        first += static_cast<ncfUInt32>(held);
    }
}

ChunkMap::Place ChunkMap::PlaceOfChunk(ncfUInt32 chunk) const {
    const ncfUInt32 low =
        LastNotAbove(runCount_, chunk, [&](ncfUInt32 run) { return FirstChunk(run); });
    ncfUInt32 run = low / kStep * kStep;
    ncfUInt32 first = marks_[low / kStep];
    for (; run < low; ++run) {
        first += (EndChunk(run) - FirstChunk(run)) * SamplesPerChunk(run);
    }
    return PlaceIn(low, first, chunk - FirstChunk(low));
}

ncfUInt32 ChunkMap::NextBreak(ncfUInt32 chunk) const {
    ++chunk;
    ncfUInt32 word = chunk / 64;
    ncfUInt64 bits = chunk < chunkCount_ ? breaks_[word] >> chunk % 64 << chunk % 64 : 0;
    while (bits == 0 && (word + 1) * ncfUInt64{64} < chunkCount_) {
        bits = breaks_[++word];
    }
    return bits == 0 ? chunkCount_ : word * 64 + LowestBit(bits);
}

}  // namespace header_parser
