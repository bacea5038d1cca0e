// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/SampleTimes.h"

#include <fmt/format.h>

#include <algorithm>
#include <limits>

#include "reference_host/header_parser/Marks.h"

namespace header_parser {

namespace {

// Entries between two marks: the walk is short and the marks of a table take
// an eighth of its bytes at most.
constexpr ncfUInt32 kStep = 16;

constexpr ncfUInt64 kMaxTime = static_cast<ncfUInt64>(std::numeric_limits<ncfSInt64>::max()) / 2;

Verdict CountsOther(const Atom& atom, ncfUInt64 counted, ncfUInt32 sampleCount) {
    return Broken(atom, fmt::format("{} counts {}{}, the track has {}", NameOf(atom.type),
                                    Counted(counted, "sample"),
                                    counted > sampleCount ? " or more" : "", sampleCount));
}

}  // namespace

Verdict SampleTimes::Read(const Atom& durations, const Atom& offsets, ncfUInt32 sampleCount) {
    sampleCount_ = sampleCount;
    if (sampleCount == 0) {
        return Fine();
    }
    const Verdict verdict = ReadDurations(durations);
    displayEnd_ = total_;
    return !verdict.Refused() && offsets ? ReadOffsets(offsets) : verdict;
}

Verdict SampleTimes::ReadDurations(const Atom& atom) {
    if (!atom) {
        return Broken("it lacks 'stts', the sample durations");
    }
    Verdict verdict = OpenTable(atom, 8, durations_, durationEntries_);
    if (verdict.Refused()) {
        return verdict;
    }
    durationMarks_.reserve(durationEntries_ / kStep + 1);
    ncfUInt64 sample = 0;
    for (ncfUInt32 entry = 0; entry < durationEntries_; ++entry) {
        if (entry % kStep == 0) {
            durationMarks_.push_back({total_, static_cast<ncfUInt32>(sample)});
        }
        const ncfUInt64 length = ncfUInt64{DurationCount(entry)} * Duration(entry);
        sample += DurationCount(entry);
        if (sample > sampleCount_) {
            return CountsOther(atom, sample, sampleCount_);
        }
        if (length > kMaxTime - total_) {
            return Broken(atom,
                          fmt::format("the durations in 'stts' come to more than {}", kMaxTime));
        }
        total_ += length;
        hasOneDuration_ = hasOneDuration_ && Duration(entry) == Duration(0);
    }
    return sample == sampleCount_ ? Fine() : CountsOther(atom, sample, sampleCount_);
}

// Walks the samples in the order in which they are decoded, in steps of samples that
// share a duration, and keeps where those steps are shown.
class SampleTimes::DisplayWalk {
public:
    explicit DisplayWalk(const SampleTimes& times) : at_(times.durations_) {}

    // The samples of one offset. No more than the durations count.
    void Take(ncfUInt32 count, ncfSInt32 offset) {
        if (count > 0) {
            extent_.minOffset = std::min(extent_.minOffset, offset);
            extent_.maxOffset = std::max(extent_.maxOffset, offset);
        }
        while (count > 0) {
            const ncfUInt32 step = std::min(count, Alike());
            extent_.first = std::min(extent_.first, time_ + offset);
            Step(step);
            extent_.end = std::max(extent_.end, time_ + offset);
            count -= step;
        }
    }

    // The samples of `kStep` entries at once, if all have one duration and there are no
    // more than `left`; else false, and nothing is taken. The sums of entries that don't
    // fit may wrap.
    bool TakeEntries(const ncfUInt8* offsets, ncfUInt32& left) {
        const ncfUInt32 most = std::min(Alike(), left);
        Extent extent = extent_;
        ncfUInt64 samples = 0;
        bool hasEmpty = false;
        auto time = static_cast<ncfUInt64>(time_);
        for (ncfUInt32 i = 0; i < kStep; ++i) {
            const ncfUInt64 entry = LoadU64(offsets + std::size_t{8} * i);
            const ncfUInt64 count = entry >> 32;
            const auto offset = static_cast<ncfSInt32>(static_cast<ncfUInt32>(entry));
            const auto shift = static_cast<ncfUInt64>(ncfSInt64{offset});
            hasEmpty |= count == 0;
            samples += count;
            extent.minOffset = std::min(extent.minOffset, offset);
            extent.maxOffset = std::max(extent.maxOffset, offset);
            extent.first = std::min(extent.first, static_cast<ncfSInt64>(time + shift));
            time += count * duration_;
            extent.end = std::max(extent.end, static_cast<ncfSInt64>(time + shift));
        }
        if (hasEmpty || samples > most) {
            return false;
        }
        extent_ = extent;
        Step(static_cast<ncfUInt32>(samples));
        left -= static_cast<ncfUInt32>(samples);
        return true;
    }

    struct Extent {
        ncfSInt64 first = std::numeric_limits<ncfSInt64>::max();
        ncfSInt64 end = std::numeric_limits<ncfSInt64>::min();
        ncfSInt32 minOffset = std::numeric_limits<ncfSInt32>::max();
        ncfSInt32 maxOffset = std::numeric_limits<ncfSInt32>::min();
    };
    const Extent& Shown() const { return extent_; }

private:
    // How many of the next samples share a duration. There must be one more.
    ncfUInt32 Alike() {
        for (; alike_ == 0; at_ += 8) {
            alike_ = LoadU32(at_);
            duration_ = LoadU32(at_ + 4);
        }
        return alike_;
    }
    void Step(ncfUInt32 samples) {
        alike_ -= samples;
        time_ += ncfSInt64{samples} * duration_;
    }

    const ncfUInt8* at_;  // the next entry of the durations
    ncfUInt32 alike_ = 0;
    ncfUInt32 duration_ = 0;
    ncfSInt64 time_ = 0;
    Extent extent_;
};

// One walk over both tables, which may be longer than the processor's caches. Among
// samples that share duration and offset the display times rise, so the first and the
// last are all that matters.
Verdict SampleTimes::ReadOffsets(const Atom& atom) {
    Verdict verdict = OpenTable(atom, 8, offsets_, offsetEntries_);
    if (verdict.Refused()) {
        return verdict;
    }
    offsetMarks_.reserve(offsetEntries_ / kStep + 1);
    DisplayWalk walk(*this);
    ncfUInt32 left = sampleCount_;
    for (ncfUInt32 entry = 0; entry < offsetEntries_;) {
        if (entry % kStep == 0) {
            offsetMarks_.push_back(sampleCount_ - left);
            if (left > 0 && offsetEntries_ - entry >= kStep &&
                walk.TakeEntries(offsets_ + std::size_t{8} * entry, left)) {
                entry += kStep;
                continue;
            }
        }
        const ncfUInt32 count = OffsetCount(entry);
        if (count > left) {
            return CountsOther(atom, ncfUInt64{sampleCount_} - left + count, sampleCount_);
        }
        walk.Take(count, Offset(entry));
        left -= count;
        ++entry;
    }
    if (left > 0) {
        return CountsOther(atom, sampleCount_ - left, sampleCount_);
    }
    const DisplayWalk::Extent& shown = walk.Shown();
    minOffset_ = shown.minOffset;
    maxOffset_ = shown.maxOffset;
    shift_ = shown.first;
    displayEnd_ = static_cast<ncfUInt64>(shown.end - shown.first);
    isReordered_ = minOffset_ != shift_ || maxOffset_ != shift_;
    return Fine();
}

SampleTimes::DurationRun SampleTimes::DurationRunOf(ncfUInt32 sample) const {
    const auto marks = static_cast<ncfUInt32>(durationMarks_.size());
    const ncfUInt32 mark =
        LastNotAbove(marks, sample, [&](ncfUInt32 i) { return durationMarks_[i].sample; });
    DurationRun run{mark * kStep, durationMarks_[mark].sample, durationMarks_[mark].time};
    while (sample - run.first >= DurationCount(run.entry)) {
        run.first += DurationCount(run.entry);
        run.decodeTime += ncfUInt64{DurationCount(run.entry)} * Duration(run.entry);
        ++run.entry;
    }
    return run;
}

SampleTimes::OffsetRun SampleTimes::OffsetRunOf(ncfUInt32 sample) const {
    const auto marks = static_cast<ncfUInt32>(offsetMarks_.size());
    const ncfUInt32 mark =
        LastNotAbove(marks, sample, [&](ncfUInt32 i) { return offsetMarks_[i]; });
    OffsetRun run{mark * kStep, offsetMarks_[mark]};
    while (sample - run.first >= OffsetCount(run.entry)) {
        run.first += OffsetCount(run.entry);
        ++run.entry;
    }
    return run;
}

ncfUInt32 SampleTimes::DurationOf(ncfUInt32 sample) const {
    return Duration(hasOneDuration_ ? 0 : DurationRunOf(sample).entry);
}

ncfUInt64 SampleTimes::DecodeTimeOf(ncfUInt32 sample) const {
    const DurationRun run = DurationRunOf(sample);
    return run.decodeTime + ncfUInt64{sample - run.first} * Duration(run.entry);
}

ncfUInt32 SampleTimes::LongestSample() const {
    ncfUInt32 longest = 0;
    ncfUInt32 duration = 0;
    ncfUInt32 first = 0;
    for (ncfUInt32 entry = 0; entry < durationEntries_; ++entry) {
        if (DurationCount(entry) > 0 && Duration(entry) > duration) {
            longest = first;
            duration = Duration(entry);
        }
        first += DurationCount(entry);
    }
    return longest;
}

ncfSInt64 SampleTimes::DisplayOffsetOf(ncfUInt32 sample) const {
    return offsets_ == nullptr ? 0 : Offset(OffsetRunOf(sample).entry) - shift_;
}

template <typename Visit>
void SampleTimes::ForEachStretch(ncfUInt32 sample, Visit visit) const {
    DurationRun decode = DurationRunOf(sample);
    OffsetRun display = offsets_ == nullptr ? OffsetRun{0, 0} : OffsetRunOf(sample);
    ncfUInt32 decodeLeft = 0;  // samples of the run at hand
    ncfUInt32 displayLeft = offsets_ == nullptr ? sampleCount_ : 0;
    ncfUInt32 duration = 0;
    ncfSInt32 offset = 0;
    if (sample < sampleCount_) {
        duration = Duration(decode.entry);
        decodeLeft = DurationCount(decode.entry) - (sample - decode.first);
        decode.decodeTime += ncfUInt64{sample - decode.first} * duration;
        if (offsets_ != nullptr) {
            offset = Offset(display.entry);
            displayLeft = OffsetCount(display.entry) - (sample - display.first);
        }
    }
    while (sample < sampleCount_) {
        while (decodeLeft == 0) {
            ++decode.entry;
            decodeLeft = DurationCount(decode.entry);
            duration = Duration(decode.entry);
        }
        while (displayLeft == 0) {
            ++display.entry;
            displayLeft = OffsetCount(display.entry);
            offset = Offset(display.entry);
        }
        const ncfUInt32 count = std::min(decodeLeft, displayLeft);
        if (!visit(Stretch{sample, count, decode.decodeTime, duration, offset})) {
            return;
        }
        decode.decodeTime += ncfUInt64{count} * duration;
        decodeLeft -= count;
        displayLeft -= count;
        sample += count;
    }
}

// The last sample whose decode time is not behind `time`.
ncfUInt32 SampleTimes::SampleDecodedAt(ncfUInt64 time) const {
    const auto marks = static_cast<ncfUInt32>(durationMarks_.size());
    const ncfUInt32 mark =
        LastNotAbove(marks, time, [&](ncfUInt32 i) { return durationMarks_[i].time; });
    ncfUInt32 entry = mark * kStep;
    ncfUInt64 start = durationMarks_[mark].time;
    ncfUInt32 first = durationMarks_[mark].sample;
    ncfUInt32 found = first;
    for (; entry < durationEntries_ && start <= time; ++entry) {
        const ncfUInt32 count = DurationCount(entry);
        const ncfUInt32 duration = Duration(entry);
        if (count > 0) {
            const ncfUInt64 steps = duration == 0 ? count - 1 : (time - start) / duration;
            found = first + static_cast<ncfUInt32>(std::min<ncfUInt64>(steps, count - 1));
        }
        first += count;
        start += ncfUInt64{count} * duration;
    }
    return found;
}

// Without reordering the decode times answer. With it, some sample s decoded at
// time - largest offset is shown in time; what is shown at or behind s, and
// thus the one wanted, was decoded from shown(s) - largest offset on, and up to
// time - smallest offset. Of those in this window the latest shown is taken.
bool SampleTimes::SampleShownAt(ncfUInt64 time, ncfUInt32& sample) const {
    if (sampleCount_ == 0 || time >= displayEnd_) {
        return false;
    }
    if (!isReordered_) {
        sample = SampleDecodedAt(time);
        return true;
    }
    const ncfSInt64 wanted = static_cast<ncfSInt64>(time) + shift_;  // on the table's own axis
    const ncfSInt64 latest = wanted - minOffset_;
    ncfSInt64 best = std::numeric_limits<ncfSInt64>::min();
    ForEachStretch(WindowStart(wanted), [&](const Stretch& stretch) {
        const ncfSInt64 shown = static_cast<ncfSInt64>(stretch.decodeTime) + stretch.offset;
        if (shown <= wanted) {
            ncfUInt64 steps = stretch.count - 1;
            if (stretch.duration != 0) {
                steps = std::min(steps, static_cast<ncfUInt64>(wanted - shown) / stretch.duration);
            }
            const ncfSInt64 last = shown + static_cast<ncfSInt64>(steps * stretch.duration);
            if (last >= best) {
                best = last;
                sample = stretch.first + static_cast<ncfUInt32>(steps);
            }
        }
        return static_cast<ncfSInt64>(stretch.decodeTime) <= latest;
    });
    return true;
}

ncfUInt32 SampleTimes::WindowStart(ncfSInt64 wanted) const {
    const ncfSInt64 early = wanted - maxOffset_;
    if (early < 0) {
        return 0;
    }
    const ncfUInt32 inTime = SampleDecodedAt(static_cast<ncfUInt64>(early));
    const DurationRun run = DurationRunOf(inTime);
    const ncfUInt64 decoded = run.decodeTime + ncfUInt64{inTime - run.first} * Duration(run.entry);
    const ncfSInt64 shown = static_cast<ncfSInt64>(decoded) + Offset(OffsetRunOf(inTime).entry);
    const ncfSInt64 start = shown - maxOffset_ - 1;
    return start < 0 ? 0 : SampleDecodedAt(static_cast<ncfUInt64>(start));
}

}  // namespace header_parser
