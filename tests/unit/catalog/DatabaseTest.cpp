// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/catalog/Database.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "tests/support/TestFolder.h"

using namespace catalog;

namespace {

const auto kRead = Database::Access::Read;
const auto kMake = Database::Access::Make;

}  // namespace

TEST(Database, KeepsWhatIsBoundAsItIs) {
    Database database;
    database.Run("CREATE TABLE t (a TEXT, b INTEGER, c REAL, d BLOB)");
    const std::string text = "it's \"a\"; DROP TABLE t --";
    const std::string bytes("\0\xFF\0", 3);
    Statement insert = database.Prepare("INSERT INTO t VALUES (?, ?, ?, ?)");
    insert.Bind(1, text).Bind(2, std::int64_t{-5}).Bind(3, 0.5).BindBytes(4, bytes).Do();
    insert.Bind(1, "only").Do();  // what was bound before is gone
    Statement select = database.Prepare("SELECT * FROM t ORDER BY rowid");
    ASSERT_TRUE(select.Step());
    EXPECT_EQ(select.Text(0), text);
    EXPECT_EQ(select.Integer(1), -5);
    EXPECT_EQ(select.Real(2), 0.5);
    EXPECT_EQ(select.Text(3), bytes);
    ASSERT_TRUE(select.Step());
    EXPECT_EQ(select.Text(0), "only");
    EXPECT_TRUE(select.IsNull(1));
    EXPECT_FALSE(select.Step());
}

TEST(Database, TakesBackWhatIsNotCommitted) {
    Database database;
    database.Run("CREATE TABLE t (a)");
    {
        Transaction lost(database);
        database.Run("INSERT INTO t VALUES (1)");
    }
    {
        Transaction kept(database);
        database.Run("INSERT INTO t VALUES (2)");
        kept.Commit();
    }
    EXPECT_EQ(database.Number("SELECT sum(a) FROM t"), 2);
}

TEST(Database, TellsTheKindsOfErrors) {
    const TestFolder folder;
    const auto errorOf = [](const std::filesystem::path& file, Database::Access access,
                            const char* sql) {
        try {
            Database(file, access).Run(sql);
        } catch (const DatabaseError& error) {
            return error;
        }
        return DatabaseError(0, "none");
    };
    EXPECT_TRUE(errorOf(folder / "missing", kRead, "SELECT 1").CantOpen());
    EXPECT_EQ(errorOf(folder / "no/folder", kMake, "SELECT 1").SystemError(), ENOENT);
    const auto text = folder.Write("text", std::string(5000, 'x'));
    EXPECT_TRUE(errorOf(text, kRead, "PRAGMA user_version").IsNoDatabase());
    EXPECT_FALSE(errorOf(text, kRead, "PRAGMA user_version").IsDamaged());
    Database(folder / "data", kMake).Run("CREATE TABLE t (a)");
    EXPECT_TRUE(errorOf(folder / "data", kRead, "INSERT INTO t VALUES (1)").IsReadOnly());
}

// The file and its journal as a program leaves them that is killed while it commits.
TEST(Database, IsReadWhereAProgramWasKilledThatWrote) {
    const TestFolder folder;
    {
        Database database(folder / "data", kMake);
        database.Run("CREATE TABLE t (a); INSERT INTO t VALUES (1)");
        // A small cache puts pages into the file before the commit.
        database.Run("PRAGMA cache_size = 1; BEGIN; UPDATE t SET a = 2; CREATE TABLE big (a);");
        database.Run(
            "WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n WHERE i < 200) "
            "INSERT INTO big SELECT zeroblob(2000) FROM n");
        ASSERT_TRUE(std::filesystem::exists(folder / "data-journal"));
        std::filesystem::copy_file(folder / "data", folder / "killed");
        std::filesystem::copy_file(folder / "data-journal", folder / "killed-journal");
        ASSERT_GT(std::filesystem::file_size(folder / "killed"), 20000u);
    }
    EXPECT_EQ(Database(folder / "killed", kRead).Number("SELECT a FROM t"), 1);
    EXPECT_FALSE(std::filesystem::exists(folder / "killed-journal"));
    EXPECT_LT(std::filesystem::file_size(folder / "killed"), 20000u);
}

TEST(Database, TellsWhyItIsReadOnly) {
    const DatabaseError rollback(776, "");  // the library's numbers
    EXPECT_TRUE(rollback.IsReadOnly() && rollback.IsHalfWritten() && !rollback.HasMoved());
    EXPECT_TRUE(DatabaseError(264, "").IsHalfWritten());
    const DatabaseError moved(1032, "");
    EXPECT_TRUE(moved.IsReadOnly() && moved.HasMoved() && !moved.IsHalfWritten());
    EXPECT_FALSE(DatabaseError(8, "").IsHalfWritten() || DatabaseError(8, "").HasMoved());
}

TEST(Database, MakesAFileOfAnyName) {
    const TestFolder folder;
    const auto before = std::filesystem::current_path();
    std::filesystem::current_path(folder.path());
    for (const char* const name : {":memory:", "file:x?mode=memory", "a?b=c#d"}) {
        Database(name, kMake).Run("CREATE TABLE t (a)");
        EXPECT_TRUE(std::filesystem::exists(folder / name)) << name;
    }
    std::filesystem::current_path(before);
}
