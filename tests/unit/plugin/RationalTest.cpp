// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/Rational.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace {

void ExpectRate(double value, ncfSInt32 numerator, ncfSInt32 denominator) {
    const Rational rate = Rational::FromDouble(value);
    EXPECT_EQ(rate.numerator, numerator) << value;
    EXPECT_EQ(rate.denominator, denominator) << value;
}

}  // namespace

TEST(Rational, StartsUndetermined) {
    EXPECT_EQ(Rational(), (Rational{0, 0}));
}

TEST(Rational, KeepsWholeRates) {
    ExpectRate(24.0, 24, 1);
    ExpectRate(25.0, 25, 1);
    ExpectRate(60.0, 60, 1);
}

TEST(Rational, SnapsToNtscWhenNearer) {
    ExpectRate(29.97, 30000, 1001);
    ExpectRate(23.976, 24000, 1001);
    ExpectRate(59.94, 60000, 1001);
}

TEST(Rational, RoundsHalfAFrameASecondUp) {
    ExpectRate(0.5, 1000, 1001);
}

TEST(Rational, RoundsToThousandthsFirst) {
    ExpectRate(0.4996, 1000, 1001);
    ExpectRate(0.4994, 0, 1);
}

TEST(Rational, ReducesTheNtscForm) {
    ExpectRate(12.5, 1000, 77);
    ExpectRate(7.5, 8000, 1001);
    ExpectRate(24.5, 25000, 1001);
    ExpectRate(29.41, 29, 1);
    ExpectRate(26000.0 / 1001.0, 2000, 77);
}

TEST(Rational, BringsEveryWholeAndNtscRateBack) {
    for (ncfSInt32 n = 1; n <= 240; ++n) {
        ExpectRate(n, n, 1);
        const Rational ntsc = Rational::FromDouble(n * 1000.0 / 1001.0);
        EXPECT_EQ(ncfSInt64{ntsc.numerator} * 1001, ncfSInt64{ntsc.denominator} * n * 1000) << n;
    }
}

TEST(Rational, GivesNothingBelowHalfAFrameASecond) {
    ExpectRate(0.0, 0, 1);
    ExpectRate(0.499, 0, 1);
    ExpectRate(0.02, 0, 1);
}

TEST(Rational, GivesNothingForWhatIsNoRate) {
    ExpectRate(-25.0, 0, 1);
    ExpectRate(std::numeric_limits<double>::quiet_NaN(), 0, 1);
    ExpectRate(std::numeric_limits<double>::infinity(), 0, 1);
    ExpectRate(-std::numeric_limits<double>::infinity(), 0, 1);
    ExpectRate(2147484.0, 0, 1);
    ExpectRate(1e300, 0, 1);
}

TEST(Rational, HoldsTheLargestRate) {
    ExpectRate(2147483.0, 2147483, 1);
    ExpectRate(1998001.998, 1998002, 1);
}

TEST(Rational, RefusesThousandthsThatAreNotPositive) {
    Rational rate{25, 1};
    rate.SetMilli(-1);
    EXPECT_EQ(rate, (Rational{0, 1}));
    rate.SetMilli(0);
    EXPECT_EQ(rate, (Rational{0, 1}));
}

TEST(Rational, DividesAsDoubles) {
    EXPECT_DOUBLE_EQ((Rational{30000, 1001}.ToDouble()), 30000.0 / 1001.0);
}

TEST(TruncateToUInt64, CutsTheFraction) {
    EXPECT_EQ(TruncateToUInt64(308.99), 308u);
    EXPECT_EQ(TruncateToUInt64(0.99), 0u);
}

TEST(TruncateToUInt64, GivesZeroForWhatHasNoPlace) {
    EXPECT_EQ(TruncateToUInt64(std::numeric_limits<double>::quiet_NaN()), 0u);
    EXPECT_EQ(TruncateToUInt64(std::numeric_limits<double>::infinity()), 0u);
    EXPECT_EQ(TruncateToUInt64(-1.0), 0u);
    EXPECT_EQ(TruncateToUInt64(std::ldexp(1.0, 64)), 0u);
}

TEST(TruncateToUInt64, ReachesBeyondTheSignedRange) {
    EXPECT_EQ(TruncateToUInt64(std::ldexp(1.0, 63)), ncfUInt64{1} << 63);
    EXPECT_EQ(TruncateToUInt64(std::ldexp(1.0, 63) + 4096.0), (ncfUInt64{1} << 63) + 4096);
    EXPECT_EQ(TruncateToUInt64(std::ldexp(1.0, 62)), ncfUInt64{1} << 62);
}

TEST(UnitsIn, RoundsTheSecondsFirst) {
    const struct {
        double duration, rate, exact;
    } rows[] = {{348, 25.0, 14.5}, {696, 25.0, 29.0}, {23, 44100.0, 1690.5}};
    for (const auto& row : rows) {
        EXPECT_LT(UnitsIn(row.duration, 600, row.rate), row.exact);
        EXPECT_DOUBLE_EQ(UnitsIn(row.duration, 600, row.rate), row.exact);
    }
}
