// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/header_parser/Verdict.h"

namespace header_parser {

// Decode and display times of a track's samples, out of its stts and ctts
// tables:
//
//     stts   (count, duration) (count, duration) ...
//     ctts   (count, offset) (count, offset) (count, offset) ...
//
// Both are read in place. A mark is kept for every few entries, with the
// sample and the time at which they begin, so a sample is found by a binary
// search over the marks and a short walk. Samples count from zero here.
class SampleTimes {
public:
    // `offsets` may be empty. Refuses tables whose counts do not add up to
    // `sampleCount` and sums that overflow.
    Verdict Read(const Atom& durations, const Atom& offsets, ncfUInt32 sampleCount);

    ncfUInt32 DurationOf(ncfUInt32 sample) const;
    ncfUInt64 DecodeTimeOf(ncfUInt32 sample) const;
    // Shifted so that the first picture shown has the decode time of the
    // first sample, which is 0.
    ncfSInt64 DisplayOffsetOf(ncfUInt32 sample) const;

    bool IsReordered() const { return isReordered_; }
    bool HasOneDuration() const { return hasOneDuration_; }
    ncfUInt64 TotalDuration() const { return total_; }
    // Where the last picture shown ends, on the axis that edits count on.
    ncfUInt64 DisplayEnd() const {
        const ncfSInt64 end = static_cast<ncfSInt64>(displayEnd_) + shift_;
        return end < 0 ? 0 : static_cast<ncfUInt64>(end);
    }
    ncfUInt64 MeanDuration() const { return sampleCount_ == 0 ? 0 : total_ / sampleCount_; }

    // The first of the samples that last longest. There must be one.
    ncfUInt32 LongestSample() const;

    // The sample on show at that time of the shifted display axis; false
    // behind the end.
    bool SampleShownAt(ncfUInt64 time, ncfUInt32& sample) const;

private:
    struct DurationMark {
        ncfUInt64 time;
        ncfUInt32 sample;
    };
    // Samples that share duration and offset: their times are a progression.
    struct Stretch {
        ncfUInt32 first;
        ncfUInt32 count;
        ncfUInt64 decodeTime;
        ncfUInt32 duration;
        ncfSInt32 offset;
    };
    struct DurationRun {
        ncfUInt32 entry;
        ncfUInt32 first;
        ncfUInt64 decodeTime;
    };
    class DisplayWalk;
    struct OffsetRun {
        ncfUInt32 entry;
        ncfUInt32 first;
    };

    Verdict ReadDurations(const Atom& atom);
    Verdict ReadOffsets(const Atom& atom);
    DurationRun DurationRunOf(ncfUInt32 sample) const;
    OffsetRun OffsetRunOf(ncfUInt32 sample) const;
    ncfUInt32 SampleDecodedAt(ncfUInt64 time) const;
    // First sample that may be the one shown at `wanted` of the table's axis.
    ncfUInt32 WindowStart(ncfSInt64 wanted) const;
    // Calls visit(stretch) from the one that holds `sample` until it answers
    // false or the table ends.
    template <typename Visit>
    void ForEachStretch(ncfUInt32 sample, Visit visit) const;

    ncfUInt32 DurationCount(ncfUInt32 entry) const {
        return LoadU32(durations_ + ncfUInt64{8} * entry);
    }
    ncfUInt32 Duration(ncfUInt32 entry) const {
        return LoadU32(durations_ + ncfUInt64{8} * entry + 4);
    }
    ncfUInt32 OffsetCount(ncfUInt32 entry) const {
        return LoadU32(offsets_ + ncfUInt64{8} * entry);
    }
    ncfSInt32 Offset(ncfUInt32 entry) const {
        return static_cast<ncfSInt32>(LoadU32(offsets_ + ncfUInt64{8} * entry + 4));
    }

    ncfUInt32 sampleCount_ = 0;
    const ncfUInt8* durations_ = nullptr;
    ncfUInt32 durationEntries_ = 0;
    std::vector<DurationMark> durationMarks_;
    const ncfUInt8* offsets_ = nullptr;  // null: all offsets are 0
    ncfUInt32 offsetEntries_ = 0;
    std::vector<ncfUInt32> offsetMarks_;

    ncfUInt64 total_ = 0;
    ncfSInt64 shift_ = 0;      // smallest display time
    ncfSInt32 minOffset_ = 0;  // of the table, unshifted
    ncfSInt32 maxOffset_ = 0;
    ncfUInt64 displayEnd_ = 0;
    bool isReordered_ = false;
    bool hasOneDuration_ = true;
};

}  // namespace header_parser
