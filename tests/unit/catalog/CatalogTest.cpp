// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/catalog/Catalog.h"

#include <gtest/gtest.h>

#include "reference_host/catalog/Schema.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/catalog/TestCatalog.h"

using namespace catalog;
using namespace catalog_tests;

namespace {

using For = Catalog::For;

Entry Whole(const std::string& path, int id, const Row& cells = {}) {
    Entry entry = Movie(path, id, cells);
    entry["tracks"] = {{{"number", "0"}, {"kind", "picture"}, {"codec", "apch"}},
                       {{"number", "1"}, {"kind", "sound"}, {"codec", "sowt"}}};
    entry["descriptors"] = {{{"number", "0"}, {"class", "CDCIDescriptor"}, {"properties", "{}"}}};
    entry["columns"] = {{{"place", "0"}, {"name", "Scene"}, {"value", "Twelve"}}};
    entry["warnings"] = {{{"place", "0"}, {"kind", "doubt"}, {"reason", "odd"}}};
    entry["thumbnails"] = {{{"type", "image/png"},
                            {"width", "1"},
                            {"height", "2"},
                            {"picture", std::string("\0\x89", 2)}}};
    return entry;
}

class Catalogs : public testing::Test {
protected:
    Catalog Make(const std::string& name) { return {folder / name, For::Making}; }
    // Everything but what was done when, table by table.
    static Texts Content(Catalog& catalog) {
        Texts all;
        for (std::size_t i = 0; i < kTableCount; ++i) {
            Statement rows =
                catalog.database().Prepare(std::string("SELECT * FROM ") + kTables[i].name);
            while (rows.Step()) {
                std::string line = kTables[i].name;
                for (int column = 0; column < rows.Columns(); ++column) {
                    line += "|" + rows.Text(column);
                }
                all.push_back(line);
            }
        }
        for (Statement texts = catalog.database().Prepare(
                 "SELECT rowid, name, path, codec, sound, columns FROM texts ORDER BY rowid");
             texts.Step();) {
            all.push_back(texts.Text(0) + texts.Text(1) + texts.Text(2) + texts.Text(3) +
                          texts.Text(4) + texts.Text(5));
        }
        return all;
    }

    const TestFolder folder;
};

}  // namespace

TEST_F(Catalogs, KeepNumbersAsNumbersAndPicturesAsBytes) {
    Catalog catalog = Make("c");
    catalog.Put(
        {Whole("/a.mov", 1,
               {{"rate_numerator", "30000"}, {"rate_denominator", "1001"}, {"length", "300"}})});
    EXPECT_EQ(Answers(catalog,
                      "SELECT typeof(size) || typeof(rate_numerator) || typeof(width) "
                      "FROM movies"),
              Texts{"integerintegernull"});
    EXPECT_EQ(Answers(catalog, "SELECT round(rate, 3) || ' ' || round(seconds, 3) FROM movies"),
              Texts{"29.97 10.01"});
    EXPECT_EQ(Answers(catalog, "SELECT typeof(picture) || hex(picture) FROM thumbnails"),
              Texts{"blob0089"});
}

TEST_F(Catalogs, ReplaceWhatIsThereOfAPath) {
    Catalog catalog = Make("c");
    catalog.Put({Whole("/a.mov", 1), Whole("/b.mov", 2)});
    catalog.Put({Movie("/a.mov", 1, {{"name", "other"}, {"size", "11"}})});
    EXPECT_EQ(catalog.Count(), 2);
    EXPECT_EQ(Answers(catalog, "SELECT name FROM movies ORDER BY id"), (Texts{"other", "clip 2"}));
    EXPECT_EQ(Answers(catalog, "SELECT movie FROM tracks"), (Texts{"2", "2"}));
    EXPECT_EQ(Answers(catalog, "SELECT rowid FROM texts WHERE texts MATCH 'twelve'"), Texts{"2"});
    const auto known = catalog.Find("/a.mov");
    ASSERT_TRUE(known);
    EXPECT_EQ(known->size, 11u);
    EXPECT_FALSE(catalog.Find("/c.mov"));
}

// As somebody does in SQL whose movies have moved.
TEST_F(Catalogs, TakeAMovieWhosePathWasChangedForAnother) {
    Catalog catalog = Make("c"), from = Make("from");
    catalog.Put({Whole("/old.mov", 1)});
    catalog.database().Run("UPDATE movies SET path = '/new.mov'");
    catalog.Put({Whole("/old.mov", 1)});
    EXPECT_EQ(Answers(catalog, "SELECT path FROM movies"), Texts{"/old.mov"});
    catalog.database().Run("UPDATE movies SET path = '/new.mov'");
    from.Put({Whole("/old.mov", 1)});
    catalog.Take(from);
    EXPECT_EQ(Content(catalog), Content(from));
}

TEST_F(Catalogs, RemoveAllThatBelongsToAMovie) {
    Catalog catalog = Make("c");
    catalog.Put({Whole("/a.mov", 1), Whole("/b.mov", 2)});
    catalog.Remove({"/a.mov", "/none.mov"});
    Catalog other = Make("other");
    other.Put({Whole("/b.mov", 2)});
    EXPECT_EQ(Content(catalog), Content(other));
    EXPECT_EQ(catalog.database().Number("SELECT count(*) FROM pragma_foreign_key_check"), 0);
}

TEST_F(Catalogs, PutAllOrNone) {
    Catalog catalog = Make("c");
    Entry nameless = Movie("/b", 2);
    nameless["movies"][0].erase("name");
    EXPECT_THROW(catalog.Put({Movie("/a", 1), nameless}), DatabaseError);
    EXPECT_EQ(catalog.Count(), 0);
    catalog.Put({Movie("/a", 1)});
    EXPECT_EQ(catalog.Count(), 1);
}

TEST_F(Catalogs, FindPathsByTheirBeginning) {
    Catalog catalog = Make("c");
    catalog.Put(
        {Movie("/a/x", 1), Movie("/a/\xFF", 2), Movie("/ab", 3), Movie("/a", 4), Movie("/a/%", 5)});
    EXPECT_EQ(catalog.PathsThatBegin("/a/"), (Texts{"/a/%", "/a/x", "/a/\xFF"}));
    EXPECT_EQ(catalog.PathsThatBegin("/none"), Texts{});
}

TEST_F(Catalogs, MergeToWhatOneRunWrites) {
    Catalog one = Make("1"), two = Make("2"), whole = Make("whole"), merged = Make("merged");
    one.Put({Whole("/c", 3), Whole("/a", 7)});
    two.Put({Whole("/b", 5)});
    whole.Put({Whole("/a", 7), Whole("/b", 5), Whole("/c", 3)});
    merged.Take(two);
    merged.Take(one);
    EXPECT_EQ(Content(merged), Content(whole));
    EXPECT_EQ(Content(merged).size(), 3u * 8);
}

TEST_F(Catalogs, MergeToWhatWasLookedAtLast) {
    Catalog merged = Make("merged");
    const struct {
        const char* looked;
        const char* name;
        const char* stays;
    } kParts[] = {{"100", "first", "first"},
                  {"99", "older", "first"},
                  {"100", "as late", "first"},
                  {"101", "newer", "newer"}};
    for (const auto& part : kParts) {
        Catalog from = Make(part.name);
        from.Put({Movie("/a", 1, {{"looked", part.looked}, {"name", part.name}})});
        merged.Take(from);
        EXPECT_EQ(Answers(merged, "SELECT name FROM movies"), Texts{part.stays});
        EXPECT_EQ(Answers(merged, "SELECT count(*) FROM texts WHERE texts MATCH '" +
                                      std::string(part.stays) + "'"),
                  Texts{"1"});
    }
}

TEST_F(Catalogs, AreKnownFromOtherFiles) {
    EXPECT_FALSE(IsCatalog(folder / "missing"));
    Make("c");
    EXPECT_TRUE(IsCatalog(folder / "c"));
    std::filesystem::resize_file(folder / "c", 100);  // the header alone
    EXPECT_TRUE(IsCatalog(folder / "c"));
    std::filesystem::resize_file(folder / "c", 99);
    EXPECT_THROW(IsCatalog(folder / "c"), DatabaseError);
    Database(folder / "other", Database::Access::Make).Run("CREATE TABLE movies (a)");
    EXPECT_THROW(IsCatalog(folder / "other"), NoCatalog);
    EXPECT_THROW(IsCatalog(folder.Write("empty", "")), NoCatalog);
    EXPECT_THROW(IsCatalog(folder.Write("text", "some text that is long enough")), DatabaseError);
}

// Whatever bytes of a catalog are wrong, reading ends with an error or an answer.
TEST_F(Catalogs, SurviveDamage) {
    const auto file = folder / "c";
    {
        Catalog catalog = Make("c");
        for (int i = 0; i < 20; ++i) {
            catalog.Put({Whole("/" + std::to_string(i), i)});
        }
    }
    std::string content;
    {
        std::ifstream stream(file, std::ios::binary);
        content.assign(std::istreambuf_iterator<char>(stream), {});
    }
    int refused = 0;
    unsigned random = 7;
    for (int round = 0; round < 200; ++round) {
        std::string damaged = content;
        for (int i = 0; i < 20; ++i) {
            random = random * 1664525 + 1013904223;
            damaged[random % damaged.size()] = static_cast<char>(random >> 24);
        }
        folder.Write("damaged", damaged);
        try {
            Catalog catalog(folder / "damaged", For::Reading);
            catalog.PathsThatBegin("/");
            Answers(catalog, "SELECT rowid FROM texts WHERE texts MATCH 'twelve'");
            Content(catalog);
        } catch (const DatabaseError&) {
            ++refused;
        } catch (const NoCatalog&) {
            ++refused;
        }
    }
    EXPECT_GT(refused, 0);
}
