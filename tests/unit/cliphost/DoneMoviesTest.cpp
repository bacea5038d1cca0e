// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/DoneMovies.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/MoviePlan.h"
#include "tests/unit/cliphost/TestFolder.h"

using namespace cliphost;
using namespace cliphost_tests;
using host::system::FileState;

namespace {

constexpr FileState kState{1000, 1'700'000'000'123'456'789};

class DoneMoviesTest : public testing::Test {
protected:
    // What a run writes that makes a movie's output of this content.
    void Run(const std::string& movie, const std::string& output, const std::string& content,
             const std::string& settings = "s",
             DoneMovies::Known known = DoneMovies::Known::ByContent) {
        WriteFile(folder_ / output, content);
        DoneMovies(folder_.path(), settings).Add(movie, kState, output, known);
    }
    bool Has(const std::string& movie, const std::string& output, FileState state = kState,
             const std::string& settings = "s") {
        return HasIn(folder_.path(), movie, output, state, settings);
    }
    static bool HasIn(const std::filesystem::path& folder, const std::string& movie,
                      const std::string& output, FileState state = kState,
                      const std::string& settings = "s") {
        DoneMovies done(folder, settings);
        EXPECT_TRUE(done.Load().empty());
        return done.Has(movie, state, output);
    }
    std::filesystem::path OnlyRecord() {
        return std::filesystem::directory_iterator(folder_ / DoneMovies::kFolder)->path();
    }

    const TestFolder folder_;
};

TEST_F(DoneMoviesTest, HaveWhatAllRunsBeforeHaveMade) {
    EXPECT_FALSE(Has("a.mov", "a.aaf"));
    Run("a.mov", "a.aaf", "A");
    Run("b.mov", "b.aaf", "B");
    EXPECT_TRUE(Has("a.mov", "a.aaf"));
    EXPECT_TRUE(Has("b.mov", "b.aaf"));
    EXPECT_TRUE(Has("./x/../a.mov", "a.aaf")) << "the same file";
    EXPECT_TRUE(Has(std::filesystem::absolute("a.mov").u8string(), "a.aaf"));
    EXPECT_FALSE(Has("x/a.mov", "a.aaf"));
    EXPECT_FALSE(Has("a.mov", "b.aaf"));
}

TEST_F(DoneMoviesTest, LackAMovieThatChangedAndOtherSettings) {
    Run("a.mov", "a.aaf", "A");
    EXPECT_FALSE(Has("a.mov", "a.aaf", {kState.size + 1, kState.date}));
    EXPECT_FALSE(Has("a.mov", "a.aaf", {kState.size, kState.date + 1}));
    EXPECT_FALSE(Has("a.mov", "a.aaf", kState, "other"));
}

TEST_F(DoneMoviesTest, LackAnOutputThatIsAnotherOne) {
    Run("a.mov", "a.aaf", "AAA");
    const auto written = std::filesystem::last_write_time(folder_ / "a.aaf");
    WriteFile(folder_ / "a.aaf", "AAAA");
    std::filesystem::last_write_time(folder_ / "a.aaf", written);
    EXPECT_FALSE(Has("a.mov", "a.aaf")) << "another size";
    WriteFile(folder_ / "a.aaf", "BBB");
    std::filesystem::last_write_time(folder_ / "a.aaf", written + std::chrono::nanoseconds(1));
    EXPECT_FALSE(Has("a.mov", "a.aaf")) << "another date and content";
    std::filesystem::remove(folder_ / "a.aaf");
    EXPECT_FALSE(Has("a.mov", "a.aaf")) << "none";
}

// Whichever run comes first in the folder's own order.
TEST_F(DoneMoviesTest, HaveTheOutputOfTheLastRunAlone) {
    for (const char* const settings : {"1", "2", "3"}) {
        Run("a.mov", "a.aaf", settings, settings);
        std::filesystem::last_write_time(
            folder_ / "a.aaf", std::filesystem::file_time_type(std::chrono::seconds(settings[0])));
    }
    EXPECT_FALSE(Has("a.mov", "a.aaf", kState, "1"));
    EXPECT_FALSE(Has("a.mov", "a.aaf", kState, "2"));
    EXPECT_TRUE(Has("a.mov", "a.aaf", kState, "3"));
}

TEST_F(DoneMoviesTest, TellTheOutputsThatAMovieWasTheLastToHave) {
    using Outputs = std::vector<std::filesystem::path>;
    const auto outputsOf = [&](const std::string& movie) {
        DoneMovies done(folder_.path(), "s");
        done.Load();
        Outputs outputs = done.OutputsOf(movie);
        std::sort(outputs.begin(), outputs.end());
        return outputs;
    };
    const auto run = [&](const std::string& movie, const std::string& output, int date) {
        WriteFile(folder_ / output, movie);
        std::filesystem::last_write_time(
            folder_ / output, std::filesystem::file_time_type(std::chrono::seconds(date)));
        DoneMovies(folder_.path(), "other").Add(movie, kState, output, DoneMovies::Known::ByDate);
    };
    EXPECT_EQ(outputsOf("b/c.mov"), Outputs{});
    run("b/c.mov", "c.aaf", 1);
    run("b/c.mov", "c\xFF 2.aaf", 1);
    EXPECT_EQ(outputsOf("b/../b/c.mov"), (Outputs{"c.aaf", "c\xFF 2.aaf"}));
    // Whichever file of the record is read first.
    for (int i = 2; i < 10; ++i) {
        run(i % 2 == 0 ? "a/c.mov" : "b/c.mov", "c.aaf", i);
    }
    EXPECT_EQ(outputsOf("a/c.mov"), Outputs{});
    run("a/c.mov", "c.aaf", 10);
    EXPECT_EQ(outputsOf("a/c.mov"), Outputs{"c.aaf"});
    EXPECT_EQ(outputsOf("b/c.mov"), Outputs{"c\xFF 2.aaf"});
}

TEST_F(DoneMoviesTest, KeepTheOutputsThatAreThere) {
    Run("a.mov", "a b.aaf", "A", "other");
    WriteFile(folder_ / "b.aaf", "B");
    DoneMovies done(folder_.path(), "s");
    done.Load();
    EXPECT_TRUE(done.Keeps("a b.aaf"));
    EXPECT_EQ(done.Keeps("A B.AAF"), std::filesystem::exists(folder_ / "A B.AAF"));
    EXPECT_FALSE(done.Keeps("b.aaf")) << "no run made it";
    std::filesystem::remove(folder_ / "a b.aaf");
    EXPECT_FALSE(done.Keeps("a b.aaf"));
}

TEST(OutputNumber, IsReadFromANameThatItMakes) {
    for (const unsigned number : {1U, 2U, 10U, 4294967295U}) {
        EXPECT_EQ(NumberInName(OutputName("x/clip.mov", number, ".aaf"), "clip.mov", ".aaf"),
                  number);
    }
    for (const char* const name :
         {"", "clip", "clip.png", "clip-0.aaf", "clip-1.aaf", "clip-02.aaf", "clip-.aaf",
          "clip-4294967296.aaf", "clip--2.aaf", "clip-2-2.aaf", "other.aaf", "clip2.aaf"}) {
        EXPECT_EQ(NumberInName(name, "clip.mov", ".aaf"), 0U) << name;
    }
    EXPECT_EQ(NumberInName("clip-2.aaf", "clip-2.mov", ".aaf"), 1U);
    EXPECT_EQ(NumberInName("clip-2-2.aaf", "clip-2.mov", ".aaf"), 2U);
}

TEST_F(DoneMoviesTest, SurviveACopyOfTheFolderWithItsDatesLost) {
    Run("a.mov", "a.aaf", "A");
    Run("b.mov", "b.aaf", "B", "s", DoneMovies::Known::ByDate);
    const TestFolder copy;
    std::filesystem::copy(folder_.path(), copy.path(), std::filesystem::copy_options::recursive);
    const auto old = std::filesystem::file_time_type::clock::now() - std::chrono::hours(1);
    for (const char* const name : {"a.aaf", "b.aaf"}) {
        std::filesystem::last_write_time(copy / name, old);
    }
    EXPECT_TRUE(HasIn(copy.path(), "a.mov", "a.aaf"));
    EXPECT_FALSE(HasIn(copy.path(), "b.mov", "b.aaf")) << "its content was not kept";
    EXPECT_TRUE(Has("b.mov", "b.aaf"));
}

TEST_F(DoneMoviesTest, TakeAnyName) {
    for (const char* const name : {"a\nb\"\t.mov", "\xFF.mov", "\xC3\xA9%20.mov", "file:x.mov"}) {
        const std::string output = std::string(name) + ".aaf";
        Run(name, output, "A");
        EXPECT_TRUE(Has(name, output)) << name;
    }
}

// A run that was ended in the midst of a line, or a folder where somebody else has written.
TEST_F(DoneMoviesTest, PassOverLinesThatAreNone) {
    Run("a.mov", "a.aaf", "A");
    const std::string whole = ContentOf(OnlyRecord());
    for (std::size_t size = 0; size < whole.size(); ++size) {
        WriteFile(OnlyRecord(), whole.substr(0, size));
        EXPECT_FALSE(Has("a.mov", "a.aaf")) << size;
    }
    for (const char* const line :
         {"", "x", "{}", "[]", "null", "7", "{\"settings\":\"s\"}", "\xFF\xFE", "{\"settings\":7}",
          R"({"settings":"s","movie":"a.mov","size":-1,"date":"1","output":[]})"}) {
        WriteFile(OnlyRecord(), std::string(line) + "\n" + whole + line);
        EXPECT_TRUE(Has("a.mov", "a.aaf")) << line;
    }
    WriteFile(folder_ / DoneMovies::kFolder / "notes.txt", "x");
    std::filesystem::create_directory(folder_ / DoneMovies::kFolder / "folder.jsonl");
    EXPECT_TRUE(Has("a.mov", "a.aaf"));
}

TEST_F(DoneMoviesTest, TakeNoLineWhoseNumbersAreOthers) {
    Run("a.mov", "a.aaf", "A");
    const auto line = nlohmann::json::parse(ContentOf(OnlyRecord()));
    for (const char* const name :
         {"movie", "size", "date", "output", "outputSize", "outputDate", "settings"}) {
        for (const nlohmann::json& odd :
             {nlohmann::json(), nlohmann::json("x"), nlohmann::json(1.5)}) {
            auto changed = line;
            changed[name] = odd;
            changed.erase("outputDigest");
            WriteFile(OnlyRecord(), changed.dump() + "\n");
            EXPECT_FALSE(Has("a.mov", "a.aaf")) << changed;
        }
    }
    WriteFile(OnlyRecord(), line.dump() + "\n");
    EXPECT_TRUE(Has("a.mov", "a.aaf"));
}

TEST_F(DoneMoviesTest, TellWhereTheyCantBeKept) {
    WriteFile(folder_ / DoneMovies::kFolder, "a file");
    WriteFile(folder_ / "a.aaf", "A");
    DoneMovies done(folder_.path(), "s");
    EXPECT_TRUE(done.Load().empty());
    try {
        done.Add("a.mov", kState, "a.aaf", DoneMovies::Known::ByContent);
        ADD_FAILURE() << "it was kept";
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), kExitCaller);
        EXPECT_EQ(failure.problem().subject, folder_ / DoneMovies::kFolder);
    }
}

// Each run has a file of its own, however many write at the same time.
TEST_F(DoneMoviesTest, AreKeptByManyRunsAtOnce) {
    WriteFile(folder_ / "out", "A");
    std::vector<std::unique_ptr<DoneMovies>> runs;
    for (int i = 0; i < 8; ++i) {
        runs.push_back(std::make_unique<DoneMovies>(folder_.path(), "s"));
    }
    for (int i = 0; i < 80; ++i) {
        runs[i % 8]->Add(std::to_string(i), kState, "out", DoneMovies::Known::ByContent);
    }
    DoneMovies all(folder_.path(), "s");
    all.Load();
    for (int i = 0; i < 80; ++i) {
        EXPECT_TRUE(all.Has(std::to_string(i), kState, "out")) << i;
    }
}

TEST(Digest, IsTheFirstHalfOfTheSystemsOwn) {
    EXPECT_EQ(TextOf(DigestOf("")), "e3b0c44298fc1c149afbf4c8996fb924");
    EXPECT_EQ(TextOf(DigestOf("abc")), "ba7816bf8f01cfea414140de5dae2223");
    const TestFolder folder;
    const std::string content(200000, 'x');
    WriteFile(folder / "file", content);
    EXPECT_EQ(DigestOfFile(folder / "file"), DigestOf(content));
    EXPECT_EQ(DigestOfFile(folder / "absent"), std::nullopt);
    EXPECT_EQ(DigestOfFile(folder.path()), std::nullopt);
}

}  // namespace
