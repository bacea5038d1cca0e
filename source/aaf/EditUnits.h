// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"
#include "source/plugin/Rational.h"

namespace NMA::Impl {

inline aafRational_t AAFRational(const Rational& value) {
    return {value.numerator, value.denominator};
}

// Frames per second as timecode counts them: 29.97 has 30.
inline ncfUInt32 WholeRate(const Rational& rate) {
    return static_cast<ncfUInt32>(TruncateToUInt64(rate.ToDouble() + 0.5));
}

// A sampling rate, its fraction cut off, over 1.
inline aafRational_t WholeSamplingRate(double rate) {
    return {static_cast<aafInt32>(static_cast<ncfSInt32>(TruncateToUInt64(rate))), 1};
}

}  // namespace NMA::Impl
