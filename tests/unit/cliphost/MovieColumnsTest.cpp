// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieColumns.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/CsvTable.h"
#include "reference_host/cliphost/Failure.h"
#include "tests/support/TestFolder.h"

using namespace cliphost;

namespace {

std::uint64_t RowOf(const MovieColumns& columns, const char* movie) {
    const MovieColumns::Row* const row = columns.Find(movie);
    return row ? row->number : 0;
}

void ExpectNoColumns(std::string_view text, const std::string& words) {
    try {
        const MovieColumns columns("t.csv", text);
        ADD_FAILURE() << "taken: " << text;
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), kExitCaller);
        EXPECT_NE(std::string(failure.what()).find(words), std::string::npos) << failure.what();
    }
}

TEST(MovieColumns, FindsByPathThenByName) {
    const MovieColumns columns("t.csv",
                               "Path,Scene\n/m/a.mov,1\na.mov,2\nb,3\nb.mov,4\n"
                               "file:///m/c%20d.mov,5\n./here/e.mov,6\n/m/x/../f.mov,7\n");
    EXPECT_EQ(RowOf(columns, "/m/a.mov"), 2u);
    EXPECT_EQ(RowOf(columns, "/other/a.mov"), 3u);
    EXPECT_EQ(RowOf(columns, "/m/b.mov"), 5u);
    EXPECT_EQ(RowOf(columns, "/m/b.mxf"), 4u);
    EXPECT_EQ(RowOf(columns, "/m/c d.mov"), 6u);
    EXPECT_EQ(RowOf(columns, "here/e.mov"), 7u);
    EXPECT_EQ(RowOf(columns, "/there/e.mov"), 0u);
    EXPECT_EQ(RowOf(columns, "/m/f.mov"), 8u);
    EXPECT_EQ(RowOf(columns, "/m/A.mov"), 0u);
}

TEST(MovieColumns, FindsByPathsBehindLinks) {
    const TestFolder folder;
    std::filesystem::create_directories(folder.path() / "a/b");
    std::filesystem::create_directory_symlink("a/b", folder.path() / "link");
    const std::string path = (folder.path() / "link/../c.mov").u8string();
    const MovieColumns columns("t.csv", "path,Scene\n" + CsvLine({path, "1"}));
    EXPECT_EQ(RowOf(columns, (folder.path() / "a/c.mov").u8string().c_str()), 2u);
    EXPECT_EQ(RowOf(columns, (folder.path() / "c.mov").u8string().c_str()), 0u);
}

// With a path the name is the clip's; where a row has none, it says which movie.
TEST(MovieColumns, KnowsWhatColumnsAreFor) {
    const MovieColumns columns("t.csv",
                               "path;NAME;Tape;Start TC;codec;Scene;;\n"
                               "/a.mov;Clip;R1;01:00:00:00;x;;;\n;b.mov;;;;9;;\n");
    ASSERT_EQ(columns.rows().size(), 2u);
    const auto& values = columns.rows()[0].values;
    ASSERT_EQ(values.size(), 3u);
    EXPECT_EQ(columns.UseOf(values[0]), ColumnUse::Name);
    EXPECT_EQ(columns.UseOf(values[1]), ColumnUse::Reel);
    EXPECT_EQ(columns.UseOf(values[2]), ColumnUse::Start);
    ASSERT_EQ(columns.rows()[1].values.size(), 1u);
    EXPECT_EQ(columns.NameOf(columns.rows()[1].values[0]), "Scene");
    EXPECT_EQ(columns.UseOf(columns.rows()[1].values[0]), ColumnUse::Comment);
    EXPECT_EQ(RowOf(columns, "/z/b.mov"), 3u);
}

TEST(MovieColumns, RefusesWhatHasTwoMeanings) {
    ExpectNoColumns("scene\n1\n", "no column tells which movie a row is for");
    ExpectNoColumns("name,Scene,scene\n", "row 1: columns 2 and 3 (scene) are for the same");
    ExpectNoColumns("name,reel,Tape\n", "row 1: columns 2 and 3 (Tape) are for the same");
    ExpectNoColumns("name,_x\n", "row 1: column _x: names that begin with _");
    ExpectNoColumns("name,x\na,1\na,2\n", "rows 2 and 3 are both for a");
    ExpectNoColumns("path,x\n/m/a,1\n/m/./a,2\n", "rows 2 and 3 are both for /m/./a");
    ExpectNoColumns("path,x\n,1\n", "row 2: it names no movie");
    ExpectNoColumns("name,\na,1\n", "row 2: column 2 has no name in the first row");
    ExpectNoColumns("name,start\na,1\n", "row 2, column start: '1' is no timecode");
}

}  // namespace
