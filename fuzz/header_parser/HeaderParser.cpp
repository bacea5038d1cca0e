// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Feeds the input to the header parser as a clip feeds a file, and asks for
// everything that it then knows.

#include <cstdio>
#include <cstdlib>

#include "fuzz/support/RunLimits.h"
#include "reference_host/header_parser/QTParser.h"
#include "reference_host/util/Ref.h"
#include "tests/unit/header_parser/VisitEverything.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::TimeLimit limit;
    const auto parser = host::MakeRef<header_parser::QTParser>();
    ncfUInt32 passes = 0;
    if (header_parser::ReadHeaders(*parser, data, size, &passes) == NCF_OK) {
        VisitEverything(*parser);
    }
    // A pass for each atom of eight bytes at worst, and a few for the ends.
    if (passes > size / 8 + 8) {
        std::fprintf(stderr, "%u passes over %zu bytes\n", passes, size);
        std::abort();
    }
    return 0;
}
