// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/SampleTable.h"

#include <fmt/format.h>

#include "reference_host/header_parser/Marks.h"

namespace header_parser {

Verdict SampleTable::Read(const SampleTableAtoms& atoms, const PacketLayout& oldSound,
                          const std::vector<bool>& isInFile) {
    Verdict verdict = sizes_.Read(atoms.stsz, atoms.stz2);
    if (verdict.Refused()) {
        return verdict;
    }
    // Old linear sound counts frames and says that each has one byte.
    if (sizes_.TableSize() == 1 && oldSound.bytesPerPacket != 0) {
        sizes_.UsePackets(oldSound);
    }
    verdict = times_.Read(atoms.stts, atoms.ctts, Count());
    if (!verdict.Refused()) {
        verdict = chunks_.Read(atoms.stsc, atoms.stco, atoms.co64, sizes_, isInFile);
    }
    if (!verdict.Refused() && atoms.stss) {
        allAreSync_ = false;
        verdict = sync_.Read(atoms.stss, Count());
    }
    if (!verdict.Refused() && atoms.stps) {
        verdict = partialSync_.Read(atoms.stps, Count());
    }
    if (!verdict.Refused() && atoms.sdtp) {
        if (atoms.sdtp.Size() < 4 || atoms.sdtp.Size() - 4 < Count()) {
            return Broken(
                atoms.sdtp,
                fmt::format("'sdtp' holds {}, the track has {}",
                            Counted(atoms.sdtp.Size() < 4 ? 0 : atoms.sdtp.Size() - 4, "entry"),
                            Counted(Count(), "sample")));
        }
        dependencies_ = atoms.sdtp.begin + 4;
    }
    return verdict;
}

Verdict SampleTable::NumberList::Read(const Atom& atom, ncfUInt32 sampleCount) {
    if (Verdict verdict = OpenTable(atom, 4, numbers, count); verdict.Refused()) {
        return verdict;
    }
    ncfUInt32 last = 0;
    for (ncfUInt32 i = 0; i < count; ++i) {
        const ncfUInt32 number = LoadU32(numbers + ncfUInt64{4} * i);
        if (number <= last) {
            return Broken(atom, fmt::format("the numbers in {} do not rise: {} comes after {}",
                                            NameOf(atom.type), number, last));
        }
        last = number;
    }
    return last <= sampleCount ? Fine()
                               : Broken(atom, fmt::format("{} names sample {}, the track has {}",
                                                          NameOf(atom.type), last, sampleCount));
}

bool SampleTable::NumberList::Holds(ncfUInt32 number) const {
    const auto at = [&](ncfUInt32 i) { return LoadU32(numbers + ncfUInt64{4} * i); };
    return count != 0 && number >= at(0) && at(LastNotAbove(count, number, at)) == number;
}

ncfUInt64 SampleTable::PositionOf(ncfUInt32 sample) const {
    const ChunkMap::Place place = chunks_.PlaceOfSample(sample);
    return chunks_.PositionOf(place.chunk) + sizes_.BytesUpTo(place.firstSample, sample);
}

bool SampleTable::IsSync(ncfUInt32 sample) const {
    return allAreSync_ || sync_.Holds(sample + 1) || partialSync_.Holds(sample + 1);
}

bool SampleTable::IsDisposable(ncfUInt32 sample) const {
    return dependencies_ != nullptr && (dependencies_[sample] >> 2 & 3) == 2;
}

ncfUInt32 SampleTable::NextBreak(ncfUInt32 sample) const {
    const ncfUInt32 chunk = chunks_.NextBreak(chunks_.PlaceOfSample(sample).chunk);
    return chunk == chunks_.Count() ? Count() : chunks_.PlaceOfChunk(chunk).firstSample;
}

}  // namespace header_parser
