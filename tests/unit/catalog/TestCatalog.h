// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "reference_host/catalog/Catalog.h"

namespace catalog_tests {

// A movie with what every row needs, and further cells of the table of movies.
inline catalog::Entry Movie(const std::string& path, int id, const catalog::Row& cells = {}) {
    catalog::Row row = cells;
    row.insert({{"id", std::to_string(id)},
                {"path", path},
                {"name", "clip " + std::to_string(id)},
                {"size", "10"},
                {"date", "20"},
                {"looked", "30"},
                {"settings", "s"},
                {"failed", "0"}});
    return {{"movies", {row}}};
}

// All that one column of an answer holds.
inline std::vector<std::string> Answers(catalog::Catalog& catalog, const std::string& sql) {
    std::vector<std::string> found;
    for (catalog::Statement select = catalog.database().Prepare(sql); select.Step();) {
        found.push_back(select.Text(0));
    }
    return found;
}

using Texts = std::vector<std::string>;

}  // namespace catalog_tests
