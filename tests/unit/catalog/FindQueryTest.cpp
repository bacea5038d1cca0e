// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/catalog/FindQuery.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "tests/support/TestFolder.h"
#include "tests/unit/catalog/TestCatalog.h"

using namespace catalog;
using namespace catalog_tests;

namespace {

std::string Shown(const std::string& query) {
    std::string text;
    for (const Term& term : TermsOf(query)) {
        text += (text.empty() ? "" : " ") + std::string(term.isNegated ? "-" : "") + "[" +
                term.field + "|" + term.value + "]";
    }
    return text;
}

std::string WhyNot(const std::string& query) {
    try {
        ConditionOf(TermsOf(query));
    } catch (const QueryError& error) {
        return error.what();
    }
    return {};
}

class Find : public testing::Test {
protected:
    Find() {
        const auto add = [&](const char* path, int id, Row cells, std::vector<Row> tracks,
                             std::vector<Row> columns) {
            Entry entry = Movie(path, id, cells);
            entry["tracks"] = std::move(tracks);
            entry["columns"] = std::move(columns);
            if (cells.count("failed") != 0) {
                entry["warnings"] = {{{"place", "0"}, {"kind", "failure"}, {"reason", "no"}}};
            }
            catalog_.Put({entry});
        };
        add("/day1/A001_C003.mov", 1,
            {{"name", "A001_C003"},
             {"rate_numerator", "25"},
             {"rate_denominator", "1"},
             {"length", "250"},
             {"start", "10:00:00:00"},
             {"codec", "apch"},
             {"codec_name", "Apple ProRes 422 HQ"},
             {"sound_codec", "mp4a"},
             {"sound_name", "AAC"},
             {"width", "1920"},
             {"height", "1080"},
             {"alpha", "0"},
             {"channels", "2"},
             {"sound_rate", "48000"},
             {"route", "header"},
             {"size", "1500000000"},
             {"master_mob", "m1"}},
            {{{"number", "0"},
              {"kind", "picture"},
              {"codec", "apch"},
              {"codec_name", "Apple ProRes 422 HQ"}},
             {{"number", "1"}, {"kind", "sound"}, {"codec", "mp4a"}, {"codec_name", "AAC"}}},
            {{{"place", "0"}, {"name", "Reel"}, {"value", "A001"}},
             {{"place", "1"}, {"name", "Comment"}, {"value", "second take, 100%"}}});
        add("/day2/caf\xC3\xA9.mov", 2,
            {{"name", "caf\xC3\xA9"},
             {"rate_numerator", "24000"},
             {"rate_denominator", "1001"},
             {"length", "24"},
             {"start", "01:00:00;00"},
             {"codec", "ap4h"},
             {"codec_name", "Apple ProRes 4444"},
             {"width", "1280"},
             {"height", "720"},
             {"alpha", "1"},
             {"channels", "0"},
             {"route", "library"},
             {"size", "2000"},
             {"master_mob", "m2"}},
            {{{"number", "0"},
              {"kind", "picture"},
              {"codec", "ap4h"},
              {"codec_name", "Apple ProRes 4444"}}},
            {});
        add("/copies/caf\xC3\xA9.mov", 3,
            {{"name", "caf\xC3\xA9"},
             {"rate_numerator", "24000"},
             {"rate_denominator", "1001"},
             {"length", "24"},
             {"start", "01:00:00;00"},
             {"alpha", "1"},
             {"master_mob", "m2"}},
            {}, {{{"place", "0"}, {"name", "Tape"}, {"value", "100_percent"}}});
        add("/broken.mov", 4, {{"name", "broken"}, {"failed", "1"}, {"route", "none"}}, {}, {});
    }

    // The numbers of the movies that fit, such as "13".
    std::string Ids(const std::string& query) {
        const Condition condition = ConditionOf(TermsOf(query));
        Statement select = catalog_.database().Prepare("SELECT id FROM movies WHERE " +
                                                       condition.sql + " ORDER BY id");
        int parameter = 0;
        for (const auto& value : condition.values) {
            ++parameter;
            std::visit([&](const auto& known) { select.Bind(parameter, known); }, value);
        }
        std::string ids;
        while (select.Step()) {
            ids += select.Text(0);
        }
        return ids;
    }

    const TestFolder folder_;
    Catalog catalog_{folder_ / "c", Catalog::For::Making};
};

}  // namespace

TEST(FindTerms, AreWordsAndFields) {
    EXPECT_EQ(Shown(""), "");
    EXPECT_EQ(Shown("  one\ttwo\n"), "[|one] [|two]");
    EXPECT_EQ(Shown("codec:prores -alpha:yes -word"), "[codec|prores] -[alpha|yes] -[|word]");
    EXPECT_EQ(Shown("a:b:c"), "[a|b:c]");
    EXPECT_EQ(Shown("\"two words\" name:\"two words\""), "[|two words] [name|two words]");
    EXPECT_EQ(Shown("\"12:34\" -\"-x\""), "[|12:34] -[|-x]");
    EXPECT_EQ(Shown("column:Scene=\"a b\""), "[column|Scene=a b]");
}

TEST(FindTerms, RefuseWhatSaysNothing) {
    for (const char* const query : {":", ":x", "-:x", "codec:", "-", "\"\"", "\"open", "a:\"open",
                                    "-\"\"", "name:\"\"", "- x"}) {
        EXPECT_THROW(TermsOf(query), QueryError) << query;
    }
}

TEST(FindTerms, NameTheFieldsWhereOneIsUnknown) {
    const std::string why = WhyNot("colour:red");
    EXPECT_NE(why.find("no field 'colour'"), std::string::npos) << why;
    for (const FieldHelp& field : AllFields()) {
        EXPECT_NE(why.find(field.name), std::string::npos) << field.name;
    }
}

TEST(FindTerms, RefuseValuesThatAFieldCantHave) {
    for (const char* const query : {"rate:fast",     "rate:25/0",    "rate:1e3",
                                    "rate:nan",      "rate:inf",     "width:",
                                    "width:<",       "width:>=",     "width:..",
                                    "width:10..",    "width:0x10",   "alpha:maybe",
                                    "alpha:YES",     "route:road",   "route:\"header library\"",
                                    "route:",        "size:10X",     "size:G",
                                    "tc:noon",       "tc:<",         "tc:100",
                                    "tc:010",        "tc:10:",       "tc::10",
                                    "tc:10::1",      "tc:1:2:3:4:5", "tc:1:2:3:4:",
                                    "tc:1:2:3:1000", "column:Scene", "column:=x",
                                    "copy:1",        "warning:"}) {
        EXPECT_NE(WhyNot(query), "") << query;
    }
}

TEST(FindTerms, EachFieldTakesItsExample) {
    for (const FieldHelp& field : AllFields()) {
        EXPECT_EQ(WhyNot(field.example), "") << field.example;
        EXPECT_EQ(std::string(field.example).rfind(std::string(field.name) + ":", 0), 0u);
    }
}

TEST_F(Find, WordsInAllTexts) {
    EXPECT_EQ(Ids(""), "1234");
    EXPECT_EQ(Ids("a001"), "1");
    EXPECT_EQ(Ids("A001_c003"), "1");
    EXPECT_EQ(Ids("a00*"), "1");
    EXPECT_EQ(Ids("a00"), "");
    EXPECT_EQ(Ids("cafe"), "23");
    EXPECT_EQ(Ids("\"second take\""), "1");
    EXPECT_EQ(Ids("\"take second\""), "");
    EXPECT_EQ(Ids("take second"), "1");
    EXPECT_EQ(Ids("-prores"), "34");
    EXPECT_EQ(Ids("name:day2"), "");
    EXPECT_EQ(Ids("path:day2"), "2");
    EXPECT_EQ(Ids("name:caf*"), "23");
}

TEST_F(Find, FieldsOfEachKind) {
    const struct {
        const char* query;
        const char* ids;
    } kQueries[] = {{"codec:prores", "12"},
                    {"codec:apch", "1"},
                    {"codec:\"prores 4*\"", "12"},
                    {"codec:aac", ""},
                    {"sound:aac", "1"},
                    {"-sound:aac", "234"},
                    {"rate:25", "1"},
                    {"rate:23.976", "23"},
                    {"rate:23.98", "23"},
                    {"rate:24000/1001", "23"},
                    {"rate:24", ""},
                    {"rate:<24", "23"},
                    {"rate:<=25", "123"},
                    {"rate:<25", "23"},
                    {"rate:>25", ""},
                    {"rate:20..24", "23"},
                    {"-rate:25", "234"},
                    {"width:1920", "1"},
                    {"width:>=1280", "12"},
                    {"width:>1280", "1"},
                    {"width:1280..1920", "12"},
                    {"height:<1080", "2"},
                    {"alpha:yes", "23"},
                    {"alpha:no", "14"},
                    {"-alpha:yes", "14"},
                    {"length:10", "1"},
                    {"length:<2", "23"},
                    {"frames:24", "23"},
                    {"channels:>1", "1"},
                    {"hz:48000", "1"},
                    {"size:1.5G", "1"},
                    {"size:<=2K", "234"},
                    {"tc:10", "1"},
                    {"tc:1", "23"},
                    {"tc:1:0", "23"},
                    {"tc:1:0:0;0", "23"},
                    {"tc:>=9", "1"},
                    {"tc:1..2", "23"},
                    {"tc:0", ""},
                    {"tc:01:00:00:00", "23"},
                    {"tc:01:00:00;00", "23"},
                    {"tc:>=02:00", "1"},
                    {"tc:<02:00", "23"},
                    {"tc:>01:00", "1"},
                    {"tc:01..10", "123"},
                    {"tc:<=01", "23"},
                    {"route:library", "2"},
                    {"route:none", "4"},
                    {"reel:A001", "1"},
                    {"reel:a0*", "1"},
                    {"reel:100_*", "3"},
                    {"tape:1000*", ""},
                    {"column:comment=*100%", "1"},
                    {"column:comment=*100_", ""},
                    {"column:none=*", ""},
                    {"warning:yes", "4"},
                    {"warning:no", "123"},
                    {"failed:yes", "4"},
                    {"failed:no", "123"},
                    {"copy:yes", "23"},
                    {"-copy:yes", "14"},
                    {"codec:prores rate:25 alpha:no", "1"}};
    for (const auto& query : kQueries) {
        EXPECT_EQ(Ids(query.query), query.ids) << query.query;
    }
}

TEST_F(Find, LengthsAsTheyAreShown) {
    catalog_.Put(
        {Movie("/short.mov", 5,
               {{"rate_numerator", "30000"}, {"rate_denominator", "1001"}, {"length", "2"}})});
    const struct {
        const char* query;
        const char* ids;
    } kQueries[] = {{"length:0.0667333", "5"}, {"length:<=0.0667333", "5"},
                    {"length:<0.0667333", ""}, {"length:>0.0667333", "123"},
                    {"length:0.066733", ""},   {"length:0.0667333..1.001", "235"},
                    {"length:1.001", "23"},    {"length:1.00101", ""},
                    {"length:10.0001", ""},    {"length:0", ""}};
    for (const auto& query : kQueries) {
        EXPECT_EQ(Ids(query.query), query.ids) << query.query;
    }
}

// What the text search or SQL would understand is a text like any other.
TEST_F(Find, HostileQueriesAsTexts) {
    for (const char* const query : {"NEAR",
                                    "NEAR(a b)",
                                    "AND",
                                    "OR NOT",
                                    "*",
                                    "**",
                                    "^a",
                                    "(",
                                    ")",
                                    "a+b",
                                    "{name}",
                                    "\\",
                                    "%",
                                    "'",
                                    "''",
                                    "';DROP",
                                    "--x",
                                    "name:*",
                                    "name:'",
                                    "codec:'OR'1'='1",
                                    "column:'=%",
                                    "column:x=\\",
                                    "reel:\\",
                                    "?1",
                                    "name:?",
                                    "\xFF\xFE",
                                    "name:\"a b\"*",
                                    "-NOT",
                                    "a\\\"b\\\"",
                                    "texts:MATCH\"\"",
                                    "name:a\"b\"c"}) {
        try {
            const std::string ids = Ids(query);
            EXPECT_LE(ids.size(), 4u) << query;
        } catch (const QueryError&) {
            // Told, and not asked.
        }
        EXPECT_EQ(catalog_.Count(), 4) << query;
    }
    EXPECT_EQ(Ids("AND"), "");
    EXPECT_EQ(Ids("\"' OR 1=1 --\""), "");
}

// Nothing of a query gets into the statement.
TEST(FindConditions, HoldNothingOfTheQuery) {
    const std::string mark = "qzqzq";
    for (const char* const field : {"name", "path", "codec", "sound", "reel", "tape"}) {
        EXPECT_EQ(ConditionOf(TermsOf(field + (":" + mark))).sql.find(mark), std::string::npos);
    }
    EXPECT_EQ(ConditionOf(TermsOf("column:" + mark + "=" + mark)).sql.find(mark),
              std::string::npos);
    const Condition all = ConditionOf(TermsOf(mark + " name:x width:7 tc:10 size:7.5K"));
    EXPECT_EQ(all.sql.find('7'), std::string::npos) << all.sql;
    EXPECT_EQ(static_cast<std::size_t>(std::count(all.sql.begin(), all.sql.end(), '?')),
              all.values.size());
}

TEST(FindConditions, AreOfSoManyTermsAtMost) {
    std::string query;
    for (int i = 0; i < 501; ++i) {
        query += "w ";
    }
    EXPECT_THROW(ConditionOf(TermsOf(query)), QueryError);
}
