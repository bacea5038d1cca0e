// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/data_check/Entry.h"

namespace data_check {

// A row of FourCharMapper.xml.
struct MapperRow {
    std::string code;
    std::optional<std::string> vendor;
    std::uint32_t id = 0;  // 0: it gives none
    host::XmlPlace place;
};

struct MapperRows {
    std::vector<MapperRow> rows;
    bool isWhole = true;  // no row was left out for a mistake in it
};

// Reads the rows and tells what is wrong with each by itself.
MapperRows ReadMapperRows(const host::PlacedElement& root, Findings& findings);

}  // namespace data_check
