// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/catalog/Schema.h"

#include <gtest/gtest.h>

#include <set>

#include "reference_host/catalog/Catalog.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/catalog/TestCatalog.h"

using namespace catalog;
using namespace catalog_tests;

namespace {

using For = Catalog::For;

// All steps of today and one of tomorrow.
class Tomorrow {
public:
    Tomorrow() {
        for (std::size_t i = 0; i < kSteps.count; ++i) {
            all_.push_back(kSteps.first[i]);
        }
        all_.push_back({"ALTER TABLE movies ADD COLUMN added TEXT DEFAULT 'new'"});
    }
    Steps steps() const { return {all_.data(), all_.size()}; }

private:
    std::vector<Step> all_;
};

std::string WhyNone(Database& database) {
    try {
        VersionOf(database);
    } catch (const NoCatalog& error) {
        return error.what();
    }
    return {};
}

}  // namespace

TEST(Schema, TakesAnEmptyFileThroughAllSteps) {
    Database database;
    BringUp(database);
    EXPECT_EQ(VersionOf(database), static_cast<std::int64_t>(kSteps.count));
    BringUp(database);  // nothing is left to do
    EXPECT_EQ(VersionOf(database), static_cast<std::int64_t>(kSteps.count));
}

// A program is stopped between the header and the first step.
TEST(Schema, BringsUpAFileOfVersionZero) {
    const TestFolder folder;
    Database(folder / "c", Database::Access::Make)
        .Run("PRAGMA application_id = 1668049264; VACUUM");
    Catalog catalog(folder / "c", For::Changing);
    catalog.Put({Movie("/a", 1)});
    EXPECT_EQ(catalog.Count(), 1);
}

TEST(Schema, KeepsTheRowsOfAnOlderFile) {
    const TestFolder folder;
    const Tomorrow tomorrow;
    Catalog(folder / "c", For::Making).Put({Movie("/a", 1), Movie("/b", 2)});
    Database database(folder / "c", Database::Access::Change);
    BringUp(database, tomorrow.steps());
    EXPECT_EQ(VersionOf(database, tomorrow.steps()),
              static_cast<std::int64_t>(tomorrow.steps().count));
    EXPECT_EQ(database.Number("SELECT count(*) FROM movies WHERE added = 'new'"), 2);
}

TEST(Schema, DoesAllMissingStepsOrNone) {
    Database database;
    const Step steps[] = {{"CREATE TABLE one (a)"}, {"CREATE TABLE two (a); no SQL"}};
    EXPECT_THROW(BringUp(database, {steps, 2}), DatabaseError);
    EXPECT_EQ(database.Number("SELECT count(*) FROM sqlite_schema"), 0);
    EXPECT_EQ(database.Number("PRAGMA user_version"), 0);
    EXPECT_EQ(database.Number("PRAGMA application_id"), 0);
}

TEST(Schema, RefusesFilesOfNewerProgramsAndOfOthers) {
    const Tomorrow tomorrow;
    Database newer;
    BringUp(newer, tomorrow.steps());
    EXPECT_NE(WhyNone(newer).find("of version 2, and this program knows those up to 1"),
              std::string::npos)
        << WhyNone(newer);
    Database other;
    other.Run("CREATE TABLE movies (a)");
    EXPECT_EQ(WhyNone(other), "is no catalog of this program");
    EXPECT_THROW(BringUp(other), NoCatalog);
}

// An older catalog is read without being changed.
TEST(Schema, BringsUpACopyForReading) {
    const TestFolder folder;
    Database(folder / "c", Database::Access::Make)
        .Run("PRAGMA application_id = 1668049264; VACUUM");
    Catalog catalog(folder / "c", For::Reading);
    EXPECT_EQ(catalog.Count(), 0);
    EXPECT_EQ(Database(folder / "c", Database::Access::Read).Number("PRAGMA user_version"), 0);
}

TEST(Schema, FillsEachColumnThatATableHas) {
    Database database;
    BringUp(database);
    std::set<std::string> tables;
    for (std::size_t i = 0; i < kTableCount; ++i) {
        const Table& table = kTables[i];
        tables.insert(table.name);
        std::string columns;
        Statement info = database.Prepare("SELECT name FROM pragma_table_info(?)");
        for (info.Bind(1, table.name); info.Step();) {
            columns += (columns.empty() ? "" : ", ") + info.Text(0);
        }
        EXPECT_EQ(columns, std::string(table.key) + ", " + table.columns);
    }
    Statement all = database.Prepare(
        "SELECT name FROM sqlite_schema WHERE type = 'table' AND name NOT LIKE 'texts%'");
    while (all.Step()) {
        EXPECT_EQ(tables.count(all.Text(0)), 1u) << all.Text(0);
    }
}
