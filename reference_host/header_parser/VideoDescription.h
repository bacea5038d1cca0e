// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/header_parser/ImageAspect.h"
#include "reference_host/header_parser/ParserLimits.h"
#include "reference_host/header_parser/Verdict.h"

namespace header_parser {

// One video sample description. Texts and codings stay in the header's bytes.
struct VideoDescription {
    struct Fields {
        ncfUInt32 count;
        bool topFirst;
        bool split;
    };
    struct Colors {
        ncfUInt32 primaries;
        ncfUInt32 transfer;
        ncfUInt32 matrix;
    };

    ncfUInt32 codec = 0;
    ncfUInt32 vendor = 0;
    ncfUInt16 width = 0;
    ncfUInt16 height = 0;
    ncfUInt16 depth = 0;
    bool hasAlpha = false;
    std::optional<Fields> fields;
    std::optional<Colors> colors;
    std::optional<Ratio> pixelAspect;
    std::optional<CleanAperture> cleanAperture;

    // The project's own user atoms, see docs/user_atoms.md.
    Atom rasterText;
    Atom colorText;
    std::optional<ncfUInt32> resolutionId;
    const ncfUInt8* alphaCodings = nullptr;
    ncfUInt32 alphaCodingCount = 0;
};

// `entry` is the description behind its size and code.
Verdict ReadVideoDescription(const Atom& entry, const ParserLimits& limits,
                             VideoDescription& description);

}  // namespace header_parser
