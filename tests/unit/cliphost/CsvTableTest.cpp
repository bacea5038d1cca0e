// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/CsvTable.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/Failure.h"

using namespace cliphost;

namespace {

using Cells = std::vector<std::string>;

CsvTable Parsed(std::string_view text) {
    return ParseCsv("t.csv", text);
}

void ExpectRefused(std::string_view text, const std::string& words) {
    try {
        Parsed(text);
        ADD_FAILURE() << "taken: " << text.substr(0, 40);
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), kExitCaller);
        EXPECT_NE(std::string(failure.what()).find(words), std::string::npos) << failure.what();
    }
}

TEST(CsvTable, ReadsSeparatorsAndLineEnds) {
    for (const std::string separator : {",", ";", "\t"}) {
        for (const std::string end : {"\n", "\r\n", "\r"}) {
            for (const std::string mark : {"", "\xEF\xBB\xBF"}) {
                const CsvTable table = Parsed(mark + "name" + separator + "a b" + end + "x" +
                                              separator + "\"y" + separator + "z\"" + end);
                EXPECT_EQ(table.header, (Cells{"name", "a b"}));
                ASSERT_EQ(table.rows.size(), 1u);
                EXPECT_EQ(table.rows[0].cells, (Cells{"x", "y" + separator + "z"}));
                EXPECT_EQ(table.rows[0].number, 2u);
            }
        }
    }
}

// A separator between quotes is none, and the others may stand in cells.
TEST(CsvTable, TakesTheSeparatorOfTheFirstRow) {
    EXPECT_EQ(Parsed("\"a,b,c\";d\n1,5;2\n").header, (Cells{"a,b,c", "d"}));
    EXPECT_EQ(Parsed("a;b\n1,5,7,8;2\n").rows[0].cells, (Cells{"1,5,7,8", "2"}));
    EXPECT_EQ(Parsed("alone\nx;y\n").rows[0].cells, (Cells{"x;y"}));
}

TEST(CsvTable, ReadsQuotesAndLinesWithinThem) {
    const CsvTable table = Parsed("a,b\n\"say \"\"it\"\"\",\"two\r\nlines\"\n\"\", end \n");
    EXPECT_EQ(table.rows[0].cells, (Cells{"say \"it\"", "two\r\nlines"}));
    EXPECT_EQ(table.rows[1].cells, (Cells{"", "end"}));
    EXPECT_EQ(table.rows[1].number, 3u);
}

TEST(CsvTable, CountsEmptyRowsAndFillsShortOnes) {
    const CsvTable table = Parsed("a,b\r\n\r\n,\r\n1\r\n2,3,,\r\n4");
    ASSERT_EQ(table.rows.size(), 3u);
    EXPECT_EQ(table.rows[0].number, 4u);
    EXPECT_EQ(table.rows[0].cells, (Cells{"1", ""}));
    EXPECT_EQ(table.rows[1].cells, (Cells{"2", "3"}));
    EXPECT_EQ(table.rows[2].number, 6u);
}

TEST(CsvTable, RefusesWhatIsNoTable) {
    using namespace std::string_literals;
    ExpectRefused("", "the table is empty");
    ExpectRefused("\n\n,\n", "the table is empty");
    ExpectRefused("a,b\n1,\"x\n", "row 2: a quote");
    ExpectRefused("a,b\n1,2\n1,x\"y\"\n", "row 3: a quote");
    ExpectRefused("a,b\n1,2,3\n", "row 2: it has 3 cells, and the first row names 2 columns");
    ExpectRefused("a,b\n1,\xFF\n", "row 2: cell 2 is not in UTF-8");
    ExpectRefused("a,b\n1,\xED\xA0\x80\n", "row 2: cell 2 is not in UTF-8");
    ExpectRefused("a,b\n1,x\0\n"s, "row 2: cell 2 is not in UTF-8");
    ExpectRefused(
        "\xFF\xFE"
        "a\0"s,
        "in UTF-16");
    ExpectRefused("a\n" + std::string(kLongestCell + 1, 'x'), "row 2: cell 1 is longer than");
    ExpectRefused("a\n" + std::string(2000, ','), "more than 1000 cells");
    EXPECT_EQ(Parsed("a\n" + std::string(kLongestCell, 'x')).rows.size(), 1u);
}

TEST(CsvTable, WritesWhatItReads) {
    const Cells cells = {"plain", "a,b", "a;b", "a\tb", "\"", "two\nlines", " spaced ", "", "é"};
    const CsvTable table = Parsed(CsvLine(Cells(cells.size(), "h")) + CsvLine(cells));
    ASSERT_EQ(table.rows.size(), 1u);
    EXPECT_EQ(table.rows[0].cells, cells);
    EXPECT_EQ(CsvLine({"a", "b c"}), "a,b c\r\n");
}

TEST(CsvTable, IsARegularFile) {
    EXPECT_THROW(ReadCsvFile("/dev/null"), Failure);
    EXPECT_THROW(ReadCsvFile("/"), Failure);
    EXPECT_THROW(ReadCsvFile("/nowhere/t.csv"), Failure);
}

}  // namespace
