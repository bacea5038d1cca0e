// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

// Positions and lengths in the rates of slots, timecodes and pulldowns. A file may hold any
// numbers.

namespace aaf {

class Object;

// A sum and a difference that stay at the end of their range.
aafPosition_t Plus(aafPosition_t left, aafPosition_t right);
aafPosition_t Minus(aafPosition_t left, aafPosition_t right);

// From one rate to another, rounded down; unchanged where a rate is missing.
aafPosition_t Rescaled(aafPosition_t position, const aafRational_t& from, const aafRational_t& to);

// The frames a second that a timecode in a slot of that rate counts; 0 where the rate is missing.
aafInt64 NominalFrames(const aafRational_t& rate);

// A pulldown makes some frames of its own out of some of its input.
struct PulldownRatio {
    aafInt32 input = 1;
    aafInt32 own = 1;

    aafPosition_t ToInput(aafPosition_t frames) const {
        return Rescaled(frames, {own, 1}, {input, 1});
    }
    aafPosition_t ToOwn(aafPosition_t frames) const {
        return Rescaled(frames, {input, 1}, {own, 1});
    }
};

PulldownRatio PulldownRatioOf(aafPulldownKind_t kind, aafPulldownDir_t direction);
// By its properties; one to one where they are missing.
PulldownRatio PulldownRatioOf(const Object& pulldown);

}  // namespace aaf
