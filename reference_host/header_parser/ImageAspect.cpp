// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/ImageAspect.h"

#include <algorithm>
#include <cmath>
#include <numeric>

#include "reference_host/header_parser/NumberLimits.h"

namespace header_parser {

namespace {

// (a * b * c) / (d * e * f), reduced. False when that needs more than 32 bits.
bool Reduce(ncfUInt64 (&above)[3], ncfUInt64 (&below)[3], Ratio& ratio) {
    for (ncfUInt64& a : above) {
        for (ncfUInt64& b : below) {
            const ncfUInt64 common = std::gcd(a, b);
            a /= common;
            b /= common;
        }
    }
    ncfUInt64 numerator = 1;
    ncfUInt64 denominator = 1;
    for (int i = 0; i < 3; ++i) {
        numerator *= above[i];
        denominator *= below[i];
        if (numerator > kMax32 || denominator > kMax32) {
            return false;
        }
    }
    ratio = {static_cast<ncfUInt32>(numerator), static_cast<ncfUInt32>(denominator)};
    return true;
}

bool IsNear(const Ratio& ratio, double wanted) {
    const double value = static_cast<double>(ratio.numerator) / ratio.denominator;
    return std::fabs(value / wanted - 1.0) <= 0.025;
}

bool IsStandardDefinition(ncfUInt32 width, ncfUInt32 height) {
    return (width == 704 || width == 720) && height >= 480 && height <= 608;
}

}  // namespace

Ratio ImageAspect(ncfUInt32 width, ncfUInt32 height, const std::optional<CleanAperture>& clean,
                  const std::optional<Ratio>& pixel) {
    const Ratio square = pixel.value_or(Ratio());
    Ratio ratio;
    bool fits = false;
    if (clean) {
        ncfUInt64 above[3] = {clean->width.numerator, clean->height.denominator, square.numerator};
        ncfUInt64 below[3] = {clean->width.denominator, clean->height.numerator,
                              square.denominator};
        fits = Reduce(above, below, ratio);
    }
    if (!fits) {
        ncfUInt64 above[3] = {width, square.numerator, 1};
        ncfUInt64 below[3] = {height, square.denominator, 1};
        fits = Reduce(above, below, ratio);
    }
    if (!fits) {  // a pixel ratio that nobody means
        ncfUInt64 above[3] = {width, 1, 1};
        ncfUInt64 below[3] = {height, 1, 1};
        static_cast<void>(Reduce(above, below, ratio));
    }
    if (IsStandardDefinition(width, height)) {
        if (IsNear(ratio, 4.0 / 3.0)) {
            return {4, 3};
        }
        if (IsNear(ratio, 16.0 / 9.0)) {
            return {16, 9};
        }
    }
    return ratio;
}

}  // namespace header_parser
