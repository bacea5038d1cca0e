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
    Verdict verdict = ReadDurations(durations);
    if (!verdict.Refused() && offsets) {
        verdict = ReadOffsets(offsets);
    }
    if (!verdict.Refused()) {
        MeasureDisplay();
    }
    return verdict;
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

Verdict SampleTimes::ReadOffsets(const Atom& atom) {
    Verdict verdict = OpenTable(atom, 8, offsets_, offsetEntries_);
    if (verdict.Refused()) {
        return verdict;
    }
    offsetMarks_.reserve(offsetEntries_ / kStep + 1);
    ncfUInt64 sample = 0;
    for (ncfUInt32 entry = 0; entry < offsetEntries_; ++entry) {
        if (entry % kStep == 0) {
            offsetMarks_.push_back(static_cast<ncfUInt32>(sample));
        }
        sample += OffsetCount(entry);
        if (sample > sampleCount_) {
            return CountsOther(atom, sample, sampleCount_);
        }
    }
    return sample == sampleCount_ ? Fine() : CountsOther(atom, sample, sampleCount_);
}

// One walk over the runs of both tables. Within a stretch the display times
// rise, so its ends are all that matters.
void SampleTimes::MeasureDisplay() {
    displayEnd_ = total_;
    if (offsets_ == nullptr) {
        return;
    }
    ncfSInt64 first = std::numeric_limits<ncfSInt64>::max();
    ncfSInt64 end = std::numeric_limits<ncfSInt64>::min();
    minOffset_ = std::numeric_limits<ncfSInt32>::max();
    maxOffset_ = std::numeric_limits<ncfSInt32>::min();
    ForEachStretch(0, [&](const Stretch& stretch) {
        const ncfSInt64 shown = static_cast<ncfSInt64>(stretch.decodeTime) + stretch.offset;
        first = std::min(first, shown);
        end = std::max(end,
                       shown + static_cast<ncfSInt64>(ncfUInt64{stretch.count} * stretch.duration));
        minOffset_ = std::min(minOffset_, stretch.offset);
        maxOffset_ = std::max(maxOffset_, stretch.offset);
        return true;
    });
    shift_ = first;
    displayEnd_ = static_cast<ncfUInt64>(end - first);
    isReordered_ = minOffset_ != shift_ || maxOffset_ != shift_;
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
