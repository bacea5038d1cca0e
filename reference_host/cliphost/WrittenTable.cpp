// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WrittenTable.h"

#include <iterator>

#include "reference_host/cliphost/CsvTable.h"
#include "reference_host/cliphost/Words.h"

namespace cliphost {

WrittenTable::WrittenTable() : header_(std::begin(kFixedColumns), std::end(kFixedColumns)) {
    for (const std::string& name : header_) {
        places_.emplace(name, places_.size());
    }
}

void WrittenTable::AddNames(const ColumnValues& values) {
    for (const auto& [name, value] : values) {
        const std::string key = InSmallLetters(name);
        if (places_.count(key) > 0) {
            continue;
        }
        if (header_.size() >= kMostCells || name.size() > kLongestCell) {
            unplaced_.insert(key);
        } else {
            places_.emplace(key, header_.size());
            header_.push_back(name);
        }
    }
}

std::vector<std::string> WrittenTable::Cells(const std::string& path, const ColumnValues& values) {
    std::vector<std::string> cells(header_.size());
    cells[0] = path;
    for (const auto& [name, value] : values) {
        const auto place = places_.find(InSmallLetters(name));
        if (value.size() > kLongestCell) {
            ++tooLong_;
        } else if (place != places_.end()) {
            cells[place->second] = value;
        }
    }
    return cells;
}

}  // namespace cliphost
