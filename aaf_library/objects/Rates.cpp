// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Rates.h"

#include <limits>

#include "aaf_library/model/Object.h"

namespace aaf {

namespace {

__extension__ using Wide = __int128;

using Limits = std::numeric_limits<aafPosition_t>;

bool IsRate(const aafRational_t& rate) {
    return rate.numerator > 0 && rate.denominator > 0;
}

struct Frames {
    aafPulldownKind_t kind;
    aafInt32 film;
    aafInt32 tape;
};

// The kinds that aren't one to one.
constexpr Frames kFrames[] = {
    {kAAFTwoThreePD, 4, 5},
    {kAAFPALPD, 24, 25},
    {kAAFTwentyFourToSixtyPD, 2, 5},
    {kAAFTwoToOnePD, 1, 2},
};

}  // namespace

aafPosition_t Plus(aafPosition_t left, aafPosition_t right) {
    aafPosition_t sum = 0;
    if (!__builtin_add_overflow(left, right, &sum)) {
        return sum;
    }
    return left < 0 ? Limits::min() : Limits::max();
}

aafPosition_t Minus(aafPosition_t left, aafPosition_t right) {
    aafPosition_t difference = 0;
    if (!__builtin_sub_overflow(left, right, &difference)) {
        return difference;
    }
    return left < 0 ? Limits::min() : Limits::max();
}

aafPosition_t Rescaled(aafPosition_t position, const aafRational_t& from, const aafRational_t& to) {
    if (!IsRate(from) || !IsRate(to)) {
        return position;
    }
    const Wide above = Wide{position} * to.numerator * from.denominator;
    const Wide below = Wide{to.denominator} * from.numerator;
    const Wide quotient = above / below - (above % below < 0 ? 1 : 0);
    if (quotient < Limits::min() || quotient > Limits::max()) {
        return quotient < 0 ? Limits::min() : Limits::max();
    }
    return static_cast<aafPosition_t>(quotient);
}

aafInt64 NominalFrames(const aafRational_t& rate) {
    return IsRate(rate) ? (rate.numerator + aafInt64{rate.denominator} / 2) / rate.denominator : 0;
}

PulldownRatio PulldownRatioOf(aafPulldownKind_t kind, aafPulldownDir_t direction) {
    for (const Frames& frames : kFrames) {
        if (frames.kind == kind) {
            return direction == kAAFTapeToFilmSpeed ? PulldownRatio{frames.tape, frames.film}
                                                    : PulldownRatio{frames.film, frames.tape};
        }
    }
    return {};
}

PulldownRatio PulldownRatioOf(const Object& pulldown) {
    return PulldownRatioOf(
        static_cast<aafPulldownKind_t>(pulldown.IntegerOr(prop::Pulldown_PulldownKind, -1)),
        static_cast<aafPulldownDir_t>(
            pulldown.IntegerOr(prop::Pulldown_PulldownDirection, kAAFTapeToFilmSpeed)));
}

}  // namespace aaf
