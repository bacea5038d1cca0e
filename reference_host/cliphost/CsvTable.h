// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

namespace cliphost {

// A table as spreadsheets save it. Its first row names the columns and tells by what cells are
// parted: the one of comma, semicolon and tab that it has most of.
struct CsvTable {
    struct Row {
        std::uint64_t number;            // as a spreadsheet counts it, from 1; 1 is the header
        std::vector<std::string> cells;  // one for each column
    };

    std::vector<std::string> header;
    std::vector<Row> rows;  // without empty ones
};

inline constexpr std::size_t kMostCells = 1000;      // of a row
inline constexpr std::size_t kLongestCell = 10'000;  // bytes; an AAF file's texts are bounded

// Reads a table in UTF-8, with a byte order mark or without. Throws a Failure that names `file` and
// the row.
CsvTable ParseCsv(const std::filesystem::path& file, std::string_view bytes);
CsvTable ReadCsvFile(const std::filesystem::path& file);

// A row with its line end, cells parted by commas.
std::string CsvLine(const std::vector<std::string>& cells);

}  // namespace cliphost
