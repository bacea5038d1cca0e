// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/SampleSizes.h"

#include <fmt/format.h>

#include <algorithm>
#include <limits>

namespace header_parser {

namespace {
constexpr ncfUInt32 kStep = 64;  // samples between two marks: 8 bytes for 256 of the table
}

template <class Visit>
auto SampleSizes::WithEntries(Visit visit) const {
    const ncfUInt8* const entries = entries_;
    switch (entryBits_) {
        case 4:
            return visit([entries](ncfUInt32 sample) -> ncfUInt32 {
                return sample % 2 == 0 ? entries[sample / 2] >> 4 : entries[sample / 2] & 0xF;
            });
        case 8:
            return visit([entries](ncfUInt32 sample) -> ncfUInt32 { return entries[sample]; });
        case 16:
            return visit([entries](ncfUInt32 sample) -> ncfUInt32 {
                return LoadU16(entries + ncfUInt64{2} * sample);
            });
        default:
            return visit(
                [entries](ncfUInt32 sample) { return LoadU32(entries + ncfUInt64{4} * sample); });
    }
}

// Over all entries: their width is settled before the loop, not within it.
template <class EntryAt>
void SampleSizes::Mark(EntryAt entryAt) {
    marks_.reserve(count_ / kStep + 1);
    ncfUInt64 sum = 0;
    ncfUInt32 smallest = std::numeric_limits<ncfUInt32>::max();
    ncfUInt32 largest = 0;
    for (ncfUInt32 sample = 0; sample < count_;) {
        marks_.push_back(sum);
        const ncfUInt32 end = sample + std::min(kStep, count_ - sample);
        for (; sample < end; ++sample) {
            const ncfUInt32 size = entryAt(sample);
            sum += size;
            smallest = std::min(smallest, size);
            largest = std::max(largest, size);
        }
    }
    smallest_ = count_ == 0 ? 0 : smallest;
    largest_ = largest;
}

Verdict SampleSizes::Read(const Atom& stsz, const Atom& stz2) {
    if (!stsz && !stz2) {
        return Broken("it lacks 'stsz', the sample sizes");
    }
    const Atom& atom = stsz ? stsz : stz2;
    ByteReader reader(atom.begin, atom.end);
    reader.Skip(4);
    const ncfUInt32 parameter = reader.U32();
    count_ = reader.U32();
    if (reader.Failed()) {
        return CutShort(atom);
    }
    entries_ = reader.At();
    entryBits_ = 32;
    if (stsz) {
        fixed_ = parameter;
    } else {
        entryBits_ = parameter & 0xFF;
        if (entryBits_ != 4 && entryBits_ != 8 && entryBits_ != 16) {
            return Broken(atom, fmt::format("'stz2' gives sizes of {} bits; 4, 8 and 16 are known",
                                            entryBits_));
        }
    }
    if (fixed_ != 0) {
        smallest_ = largest_ = fixed_;
        return Fine();
    }
    if ((ncfUInt64{count_} * entryBits_ + 7) / 8 > reader.Left()) {
        return ClaimsTooMany(atom, count_, reader.Left());
    }
    WithEntries([this](auto entryAt) { Mark(entryAt); });
    return Fine();
}

void SampleSizes::UsePackets(const PacketLayout& layout) {
    packets_ = layout;
    smallest_ = largest_ = layout.bytesPerPacket;
}

ncfUInt32 SampleSizes::Entry(ncfUInt32 sample) const {
    return WithEntries([sample](auto entryAt) { return entryAt(sample); });
}

ncfUInt64 SampleSizes::Sum(ncfUInt32 from, ncfUInt32 to) const {
    return WithEntries([from, to](auto entryAt) {
        ncfUInt64 sum = 0;
        for (ncfUInt32 sample = from; sample < to; ++sample) {
            sum += entryAt(sample);
        }
        return sum;
    });
}

ncfUInt32 SampleSizes::SizeOf(ncfUInt32 sample) const {
    if (packets_.bytesPerPacket != 0) {
        return packets_.bytesPerPacket;
    }
    return fixed_ != 0 ? fixed_ : Entry(sample);
}

ncfUInt64 SampleSizes::BytesUpTo(ncfUInt32 first, ncfUInt32 sample) const {
    const ncfUInt32 between = sample - first;
    if (packets_.bytesPerPacket != 0) {
        return ncfUInt64{between / packets_.framesPerPacket} * packets_.bytesPerPacket;
    }
    if (fixed_ != 0) {
        return ncfUInt64{between} * fixed_;
    }
    if (between <= 2 * kStep) {
        return Sum(first, sample);
    }
    const ncfUInt32 firstMark = first / kStep;
    const ncfUInt32 lastMark = sample / kStep;
    return marks_[lastMark] + Sum(lastMark * kStep, sample) - marks_[firstMark] -
           Sum(firstMark * kStep, first);
}

ncfUInt64 SampleSizes::BytesOf(ncfUInt32 first, ncfUInt32 count) const {
    if (packets_.bytesPerPacket != 0) {
        const ncfUInt64 frames = packets_.framesPerPacket;
        return (count + frames - 1) / frames * packets_.bytesPerPacket;
    }
    if (fixed_ != 0) {
        return ncfUInt64{count} * fixed_;
    }
    return count == 0 ? 0 : BytesUpTo(first, first + count - 1) + Entry(first + count - 1);
}

}  // namespace header_parser
