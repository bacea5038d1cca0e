// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/Rational.h"

#include <cmath>

namespace {

// Thousandths must fit 31 bits.
constexpr double kLargestRate = 2147483.0;

ncfSInt64 GreatestCommonDivisor(ncfSInt64 a, ncfSInt64 b) {
    while (a != 0 && b != 0) {
        if (a > b) {
            a %= b;
        } else {
            b %= a;
        }
    }
    return a + b;
}

}  // namespace

Rational Rational::FromDouble(double value) {
    if (!std::isfinite(value) || value <= 0.0 || value > kLargestRate) {
        return Rational{0, 1};
    }
    Rational rate;
    rate.SetMilli(static_cast<ncfSInt32>(value * 1000.0 + 0.5));
    return rate;
}

void Rational::SetMilli(ncfSInt32 thousandths) {
    if (thousandths <= 0) {
        *this = Rational{0, 1};
        return;
    }
    const double rate = thousandths / 1000.0;
    const auto whole = static_cast<ncfSInt32>(rate + 0.5);
    const double distanceToWhole = std::fabs(whole - rate);
    const double distanceToNtsc = std::fabs(whole * 1000.0 / 1001.0 - rate);

    ncfSInt64 top = whole;
    ncfSInt64 bottom = 1;
    if (!(distanceToNtsc > distanceToWhole)) {
        top *= 1000;
        bottom = 1001;
    }
    const ncfSInt64 divisor = GreatestCommonDivisor(top, bottom);
    numerator = static_cast<ncfSInt32>(top / divisor);
    denominator = static_cast<ncfSInt32>(bottom / divisor);
}

ncfUInt64 TruncateToUInt64(double value) {
    constexpr double kTwoTo64 = 18446744073709551616.0;
    constexpr double kTwoTo63 = 9223372036854775808.0;
    if (!(value > 0.0) || value >= kTwoTo64) {
        return 0;
    }
    if (value >= kTwoTo63) {
        return static_cast<ncfUInt64>(value - kTwoTo63) | (ncfUInt64{1} << 63);
    }
    return static_cast<ncfUInt64>(value);
}

double UnitsIn(double duration, double timescale, double rate) {
    return duration / timescale * rate;
}
