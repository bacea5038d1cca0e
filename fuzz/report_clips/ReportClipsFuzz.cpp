// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Any bytes as what a child process tells of a movie for a report. What is kept of them would be
// kept as it is, and ends no script of the page.

#include <cstdlib>
#include <nlohmann/json.hpp>
#include <string>

#include "fuzz/support/RunLimits.h"
#include "reference_host/cliphost/ReportShape.h"
#include "reference_host/report/PageText.h"

namespace {

void Require(bool holds) {
    if (!holds) {
        std::abort();
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
    const fuzz::TimeLimit limit;
    const std::string kept =
        cliphost::ClipFrom(std::string(reinterpret_cast<const char*>(data), size)).dump();
    Require(cliphost::ClipFrom(kept).dump() == kept);
    Require(report::InScript(kept).find_first_of("<>&") == std::string::npos);
    return 0;
}
