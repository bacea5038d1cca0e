// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/header_parser/ParserLimits.h"
#include "reference_host/header_parser/Verdict.h"

namespace header_parser {

// Which parts of the media a track plays, in order; without an edit list all
// of it. Track times count in the movie's scale, media times in the media's.
class EditList {
public:
    struct Scales {
        ncfUInt32 movie;
        ncfUInt32 media;
    };

    // `elst` as it stands in the header. Refuses counts that do not fit,
    // durations that overflow and media times below -1.
    Verdict Read(const Atom& elst, const ParserLimits& limits);

    bool IsEmpty() const { return edits_.empty(); }
    // Sum of the edits; 0 when the list leaves it open.
    ncfUInt64 Duration() const { return duration_; }

    // Movie units that media of this end can fill: each edit as far as there is
    // media behind its start, nothing for as long as it tells, and where the list
    // leaves the length open, all behind its start.
    ncfUInt64 Filled(ncfUInt64 mediaEnd, const Scales& scales) const;

    // The media plays once, straight through, at its own speed.
    bool IsLinear(const Scales& scales) const;
    // Track and media time advance in one proportion from end to end.
    bool IsProportional(const Scales& scales) const;
    // Media time at which a linear or proportional track begins, else 0.
    ncfSInt64 Offset() const;

    // Media time at a track time in front of the track's end; -1 in an empty
    // edit.
    ncfSInt64 MediaTimeAt(ncfUInt64 trackTime, const Scales& scales) const;

private:
    struct Edit {
        ncfUInt64 start;
        ncfUInt64 duration;
        ncfSInt64 mediaTime;  // -1: nothing plays
        ncfSInt32 rate;       // 16.16
    };

    std::vector<Edit> edits_;
    ncfUInt64 duration_ = 0;
};

// a * b / c, rounded down, without overflow in between; `b` and `c` have 32
// bits. The largest number when the result does not fit.
ncfUInt64 MultiplyDivide(ncfUInt64 a, ncfUInt32 b, ncfUInt32 c);

}  // namespace header_parser
