// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "host_interfaces/framework/Types.h"

namespace header_parser {

// Two positive numbers.
struct Ratio {
    ncfUInt32 numerator = 1;
    ncfUInt32 denominator = 1;
};

// The size that is meant for display, as fractions of pixels.
struct CleanAperture {
    Ratio width;
    Ratio height;
};

// Ratio of the whole picture, reduced: the clean aperture where there is one,
// else the encoded size, times the pixel's own ratio. A raster of standard
// definition that comes within 2.5 per cent of 4/3 or 16/9 is exactly that,
// since its pixel ratios are roundings. Width and height are not 0.
Ratio ImageAspect(ncfUInt32 width, ncfUInt32 height, const std::optional<CleanAperture>& clean,
                  const std::optional<Ratio>& pixel);

}  // namespace header_parser
