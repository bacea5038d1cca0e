// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <map>
#include <set>
#include <string>
#include <vector>

#include "reference_host/cliphost/ClipColumns.h"

namespace cliphost {

// The columns of a table of movies that can be read again: the fixed ones, then those of the bin
// in the order in which they came. Names that differ in case alone are one column.
class WrittenTable {
public:
    WrittenTable();

    // First for all movies.
    void AddNames(const ColumnValues& values);
    const std::vector<std::string>& header() const { return header_; }
    // Then a row of each. What a reader refuses as too long is left out: it changes nothing then.
    std::vector<std::string> Cells(const std::string& path, const ColumnValues& values);

    // Columns and values that have no place in a table.
    std::size_t columnsLeftOut() const { return unplaced_.size(); }
    std::size_t valuesLeftOut() const { return tooLong_; }

private:
    std::vector<std::string> header_;
    std::map<std::string, std::size_t> places_;  // by the name in small letters
    std::set<std::string> unplaced_;             // the same of those without a place
    std::size_t tooLong_ = 0;
};

}  // namespace cliphost
