// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Arbitrary queries of a catalog. What is no query is refused by its reader: the database meets a
// statement that it knows, with values that it takes.

#include <cstdint>
#include <string>

#include "fuzz/support/RunLimits.h"
#include "reference_host/catalog/Database.h"
#include "reference_host/catalog/FindQuery.h"
#include "reference_host/catalog/Schema.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static catalog::Database* const database = [] {
        auto* made = new catalog::Database;
        catalog::BringUp(*made);
        made->Run(
            "INSERT INTO movies (id, path, name, size, date, looked, settings, failed, start) "
            "VALUES (1, '/a.mov', 'a', 1, 1, 1, '', 0, '10:00:00:00');"
            "INSERT INTO texts (rowid, name, path) VALUES (1, 'a', '/a.mov')");
        return made;
    }();
    const fuzz::TimeLimit limit;
    try {
        const catalog::Condition condition =
            catalog::ConditionOf(catalog::TermsOf({reinterpret_cast<const char*>(data), size}));
        catalog::Statement select =
            database->Prepare("SELECT path FROM movies WHERE " + condition.sql);
        int parameter = 0;
        for (const auto& value : condition.values) {
            ++parameter;
            std::visit([&](const auto& known) { select.Bind(parameter, known); }, value);
        }
        select.Do();
    } catch (const catalog::QueryError&) {
        // told to whoever asked
    }
    return 0;
}
