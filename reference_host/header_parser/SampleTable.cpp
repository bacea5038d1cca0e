// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/SampleTable.h"

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
        verdict = ReadSyncSamples(atoms.stss);
    }
    if (!verdict.Refused() && atoms.sdtp) {
        if (atoms.sdtp.Size() < 4 || atoms.sdtp.Size() - 4 < Count()) {
            return Broken("sdtp has no entry for some samples");
        }
        dependencies_ = atoms.sdtp.begin + 4;
    }
    return verdict;
}

Verdict SampleTable::ReadSyncSamples(const Atom& stss) {
    ByteReader reader(stss.begin, stss.end);
    reader.Skip(4);
    syncCount_ = reader.U32();
    syncSamples_ = reader.At();
    if (reader.Failed() || syncCount_ > reader.Left() / 4) {
        return Broken("stss claims more entries than it holds");
    }
    ncfUInt32 last = 0;
    for (ncfUInt32 i = 0; i < syncCount_; ++i) {
        const ncfUInt32 number = reader.U32();
        if (number <= last) {
            return Broken("the samples of stss do not rise");
        }
        last = number;
    }
    if (last > Count()) {
        return Broken("stss names samples that the track lacks");
    }
    allAreSync_ = false;
    return Fine();
}

ncfUInt64 SampleTable::PositionOf(ncfUInt32 sample) const {
    const ChunkMap::Place place = chunks_.PlaceOfSample(sample);
    return chunks_.PositionOf(place.chunk) + sizes_.BytesUpTo(place.firstSample, sample);
}

bool SampleTable::IsSync(ncfUInt32 sample) const {
    if (allAreSync_) {
        return true;
    }
    ncfUInt32 low = 0;
    ncfUInt32 high = syncCount_;
    while (low < high) {
        const ncfUInt32 middle = low + (high - low) / 2;
        const ncfUInt32 number = LoadU32(syncSamples_ + ncfUInt64{4} * middle);
        if (number == sample + 1) {
            return true;
        }
        number < sample + 1 ? low = middle + 1 : high = middle;
    }
    return false;
}

bool SampleTable::IsDisposable(ncfUInt32 sample) const {
    return dependencies_ != nullptr && (dependencies_[sample] >> 2 & 3) == 2;
}

ncfUInt32 SampleTable::NextBreak(ncfUInt32 sample) const {
    const ncfUInt32 chunk = chunks_.NextBreak(chunks_.PlaceOfSample(sample).chunk);
    return chunk == chunks_.Count() ? Count() : chunks_.PlaceOfChunk(chunk).firstSample;
}

}  // namespace header_parser
