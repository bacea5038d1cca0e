// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

// A ratio of two whole numbers, such as a frame rate or a coordinate. 0/0 is
// "not determined"; nothing here divides by the denominator unasked.
struct Rational {
    ncfSInt32 numerator = 0;
    ncfSInt32 denominator = 0;

    // The frame rate nearest to `value`: n/1 or n * 1000/1001, reduced. 0/1
    // for what is no rate: not finite, not above 0, or beyond the range.
    static Rational FromDouble(double value);

    // The same from thousandths of a frame per second.
    void SetMilli(ncfSInt32 thousandths);

    double ToDouble() const { return static_cast<double>(numerator) / denominator; }
};

inline bool operator==(const Rational& left, const Rational& right) {
    return left.numerator == right.numerator && left.denominator == right.denominator;
}
inline bool operator!=(const Rational& left, const Rational& right) {
    return !(left == right);
}

// The whole part of a number, for lengths that were worked out in doubles: 0
// for what is not a number, negative, or too large for 64 bits.
ncfUInt64 TruncateToUInt64(double value);

// How many units at `rate` per second fill a duration. The seconds are rounded to a
// double before they are multiplied, so 696/600 of a second at 25 is a little below 29.
double UnitsIn(double duration, double timescale, double rate);
