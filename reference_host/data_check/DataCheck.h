// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

#include "reference_host/data_check/Findings.h"

namespace data_check {

struct DataCounts {
    std::size_t rows = 0;  // of the first file that can be used
    std::size_t codes = 0;
    std::size_t records = 0;  // of the second one
    std::size_t ids = 0;
    std::size_t findings = 0;  // all, those that are not kept too
};

struct CheckedData {
    std::vector<Finding> findings;
    DataCounts counts;
    // Why a file could not be read at all; empty where it could. By DataFile.
    std::string unreadable[2];
};

// Looks through the two data files of a module for what would make a clip fail or be described
// wrongly: what is not well-formed, unknown, missing or out of range, and what no movie reaches.
CheckedData CheckData(const std::filesystem::path& folder);

}  // namespace data_check
