// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Any bytes as a table of movies' columns. What is taken has cells of UTF-8 in bounds, finds its
// own rows again, and comes back the same when it is written.

#include <cstdlib>

#include "fuzz/support/RunLimits.h"
#include "reference_host/cliphost/CsvTable.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/MovieColumns.h"

namespace {

void Require(bool holds) {
    if (!holds) {
        std::abort();
    }
}

void WriteAndReadAgain(const cliphost::CsvTable& table) {
    // With a column more, so that commas are what the first row has most of.
    const auto line = [](std::vector<std::string> cells) {
        cells.emplace_back("x");
        return cliphost::CsvLine(cells);
    };
    std::string text = line(std::vector<std::string>(table.header.size(), "h"));
    for (const cliphost::CsvTable::Row& row : table.rows) {
        Require(row.cells.size() == table.header.size());
        text += line(row.cells);
    }
    const cliphost::CsvTable again = cliphost::ParseCsv("again.csv", text);
    Require(again.rows.size() == table.rows.size());
    for (std::size_t i = 0; i < table.rows.size(); ++i) {
        std::vector<std::string> cells = table.rows[i].cells;
        cells.emplace_back("x");
        Require(again.rows[i].cells == cells);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
    const fuzz::TimeLimit limit;
    const std::string_view bytes(reinterpret_cast<const char*>(data), size);
    try {
        WriteAndReadAgain(cliphost::ParseCsv("input.csv", bytes));
        const cliphost::MovieColumns columns("input.csv", bytes);
        for (const cliphost::MovieColumns::Row& row : columns.rows()) {
            Require(columns.Find(row.movie) == &row);
        }
    } catch (const cliphost::Failure& failure) {
        Require(failure.status() == cliphost::kExitCaller);
    }
    return 0;
}
