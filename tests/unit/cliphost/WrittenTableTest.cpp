// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WrittenTable.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/CsvTable.h"

using namespace cliphost;

namespace {

std::string TextOf(WrittenTable& table, const ColumnValues& values) {
    return CsvLine(table.header()) + CsvLine(table.Cells("/m/a.mov", values));
}

TEST(WrittenTable, HasOneColumnForNamesInAnyCase) {
    const ColumnValues one = {{"name", "a"}, {"Scene", "1"}};
    const ColumnValues other = {{"name", "b"}, {"SCENE", "2"}};
    WrittenTable table;
    table.AddNames(one);
    table.AddNames(other);
    EXPECT_EQ(table.header().size(), std::size(kFixedColumns) + 1);
    EXPECT_EQ(table.header().back(), "Scene");
    EXPECT_EQ(table.Cells("/m/b.mov", other).back(), "2");
    EXPECT_EQ(MovieColumns("t.csv", TextOf(table, other)).rows().size(), 1u);
}

TEST(WrittenTable, LeavesOutWhatNoReaderTakes) {
    ColumnValues values = {{"name", "a"}, {"long", std::string(kLongestCell + 1, 'x')}};
    for (std::size_t i = 0; i < kMostCells; ++i) {
        values.emplace_back("c" + std::to_string(i), "1");
    }
    WrittenTable table;
    table.AddNames(values);
    const MovieColumns read("t.csv", TextOf(table, values));
    ASSERT_EQ(read.rows().size(), 1u);
    EXPECT_EQ(table.header().size(), kMostCells);
    EXPECT_EQ(table.columnsLeftOut(), std::size(kFixedColumns) + 1);
    EXPECT_EQ(table.valuesLeftOut(), 1u);
}

}  // namespace
