// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/data_check/Entry.h"

namespace data_check {

// What a record of AAFInfo.xml is found by.
struct Record {
    std::uint32_t id = 0;
    std::uint32_t storedWidth = 0;
    std::uint32_t sampledWidth = 0;
    std::uint32_t storedHeight = 0;
    std::uint32_t displayHeight = 0;
    std::uint32_t layout = 0;
    host::XmlPlace place;
    std::string values;  // all that it says, in an order of its own, to find repeats by
};

struct Records {
    std::vector<Record> records;
    bool isWhole = true;  // none was left out for a mistake in what it is found by
};

// Reads the records and tells what is wrong with each by itself.
Records ReadRecords(const host::PlacedElement& root, Findings& findings);

}  // namespace data_check
