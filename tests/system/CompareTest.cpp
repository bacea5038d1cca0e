// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What is told of two AAF files, and of movies against a file.

#include <algorithm>
#include <fstream>
#include <functional>
#include <nlohmann/json.hpp>

#include "aaf_library/stored/StoredFile.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

namespace fs = std::filesystem;
using Json = nlohmann::ordered_json;
using aaf::stored::StoredObject;
using aaf::stored::StoredProperty;

class ComparedFiles : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }

    // A movie of the test's own; other lengths are other contents.
    std::string Movie(const std::string& name, int frames, int sounds = 1) {
        movies::Movie movie;
        movie.tracks.push_back(movies::VideoTrack({}, frames, 25, 1));
        for (int i = 0; i < sounds; ++i) {
            movie.tracks.push_back(movies::SoundTrack({}, frames * 1920));
        }
        fs::create_directories((folder() / name).parent_path());
        return Quoted(Write(movie, name));
    }
    void Describe(const std::string& movies, const std::string& output) {
        const CommandResult done = RunCliphost("describe -q " + movies + " " + output);
        ASSERT_EQ(done.status, 0) << done.out;
    }
    // Standard output alone.
    CommandResult Answer(const std::string& arguments) {
        return RunCommand(Quoted(ProgramFolder() / "cliphost") + " " + arguments + " 2>/dev/null");
    }
    // The words of all differences.
    static std::vector<std::string> WordsOf(const Json& differences) {
        std::vector<std::string> words;
        for (const Json& one : differences) {
            words.push_back(one["words"]);
        }
        return words;
    }
    // A file with one change in its stored tree.
    void Edit(const std::string& from, const std::string& to,
              const std::function<void(StoredProperty&)>& edit) {
        StoredObject root;
        ASSERT_TRUE(aaf::stored::LoadTree(folder() / from, root));
        const std::function<void(StoredObject&)> walk = [&](StoredObject& object) {
            for (StoredProperty& property : object.properties) {
                edit(property);
                std::for_each(property.objects.begin(), property.objects.end(), walk);
            }
        };
        walk(root);
        ASSERT_TRUE(aaf::stored::SaveTree(root, folder() / to, aaf::stored::SectorSize::Bytes512));
    }
};

using CompareVerb = ComparedFiles;

TEST_F(CompareVerb, FindsNothingBetweenTwoDescriptionsOfAMovie) {
    const std::string movie = Movie("a.mov", 10);
    Describe(movie, "--aaf " + In("a.aaf") + " --pin-time 2020-01-31T12:00:00Z");
    Describe(movie, "--aaf " + In("b.aaf"));
    const CommandResult compared = RunCliphost("compare " + In("a.aaf") + " " + In("b.aaf"));
    EXPECT_EQ(compared.status, 0);
    EXPECT_EQ(compared.out, "no differences: 3 objects alike\n");
}

TEST_F(CompareVerb, NeedsNoModule) {
    Describe(Movie("a.mov", 10), "--aaf " + In("a.aaf"));
    EXPECT_EQ(
        RunCliphost("--plugin /nowhere.nvx compare " + In("a.aaf") + " " + In("a.aaf")).status, 0);
}

// Another content is another mob, which is known by its name.
TEST_F(CompareVerb, TellsInWordsWhatIsOtherInAMovieThatWasWrittenAnew) {
    Describe(Movie("1/a.mov", 10), "--aaf " + In("a.aaf"));
    Describe(Movie("2/a.mov", 11), "--aaf " + In("b.aaf"));
    const CommandResult compared = RunCliphost("compare " + In("a.aaf") + " " + In("b.aaf"));
    ExpectSays(compared, 1, "master mob \"a\"\n  mob id urn:smpte:umid:");
    ExpectSays(compared, 1, "  picture slot 3: length 10 -> 11\n");
    ExpectSays(compared, 1, "source mob \"a\" (MultipleDescriptor)\n");
    ExpectSays(compared, 1, "  essence description: locator: url string ");
    ExpectSays(compared, 1, ": 3 objects changed\n");
    EXPECT_EQ(compared.out.find("source id"), std::string::npos)
        << "what leads to a mob that is known leads there";
}

TEST_F(CompareVerb, HoldsTwoFilesOfOneClipAgainstEachOtherWhateverItsName) {
    Describe(Movie("a.mov", 10), "--aaf " + In("a.aaf"));
    Describe(Movie("b.mov", 11), "--aaf " + In("b.aaf"));
    const CommandResult compared = RunCliphost("compare " + In("a.aaf") + " " + In("b.aaf"));
    ExpectSays(compared, 1, "  name \"a\" -> \"b\"\n");
    ExpectSays(compared, 1, ": 3 objects changed\n");
}

TEST_F(CompareVerb, TellsWhatCameIntoABinAndWhatWent) {
    const std::string a = Movie("in/a.mov", 10);
    const std::string b = Movie("in/b.mov", 11);
    const std::string c = Movie("in/c.mov", 12);
    Describe(a + " " + b, "--bin " + In("old.aaf"));
    Describe(b + " " + c, "--bin " + In("new.aaf"));
    const CommandResult compared = RunCliphost("compare " + In("old.aaf") + " " + In("new.aaf"));
    ExpectSays(compared, 1, "master mob \"a\" gone\n");
    ExpectSays(compared, 1, "master mob \"c\" new\n");
    ExpectSays(compared, 1, "6 differences: 3 objects alike, 3 objects gone, 3 objects new\n");
    EXPECT_EQ(compared.out.find("\"b\""), std::string::npos) << compared.out;
}

TEST_F(CompareVerb, AnswersInJson) {
    const std::string movie = Movie("in/a.mov", 10);
    Describe(movie, "--aaf " + In("a.aaf"));
    Describe(movie,
             "--aaf " + In("b.aaf") + " --map " + Quoted((folder() / "in").string() + "=/nowhere"));
    const CommandResult compared = Answer("compare --json " + In("a.aaf") + " " + In("b.aaf"));
    EXPECT_EQ(compared.status, 1);
    const Json answer = Json::parse(compared.out);
    EXPECT_EQ(answer["beforeFile"], (folder() / "a.aaf").string());
    EXPECT_EQ(answer["afterFile"], (folder() / "b.aaf").string());
    ASSERT_EQ(answer["differences"].size(), 2u) << "the locators of two mobs";
    for (const Json& one : answer["differences"]) {
        EXPECT_EQ(one["object"]["class"], "SourceMob");
        EXPECT_EQ(one["kind"], "changed");
        EXPECT_EQ(one["property"], "URLString");
        EXPECT_EQ(one["after"], "\"file:///nowhere/a.mov\"");
    }
    EXPECT_EQ(answer["counts"]["differences"], 2);
    EXPECT_EQ(answer["counts"]["changed"], 2);
    EXPECT_EQ(answer["counts"]["alike"], 1);
    const Json same = Json::parse(Answer("compare --json " + In("a.aaf") + " " + In("a.aaf")).out);
    EXPECT_EQ(same["differences"], Json::array());
}

// What can't be written to its end tells nobody that the files are alike, or that this is all.
TEST_F(CompareVerb, FailsWhereItsAnswerCanNotBeWritten) {
    Describe(Movie("1/a.mov", 10), "--aaf " + In("a.aaf"));
    Describe(Movie("2/a.mov", 11, 3), "--aaf " + In("b.aaf"));
    const std::string program = Quoted(ProgramFolder() / "cliphost") + " compare ";
    for (const std::string form : {"", "--json "}) {
        for (const std::string& files :
             {In("a.aaf") + " " + In("a.aaf"), In("a.aaf") + " " + In("b.aaf")}) {
            const CommandResult full = RunCommand(program + form + files + " 2>&1 >/dev/full");
            EXPECT_EQ(full.status, 2);
            EXPECT_EQ(full.out.find("cliphost: standard output: not written: No space left"), 0u)
                << full.out;
        }
        // In the middle.
        const CommandResult cut =
            RunCommand("ulimit -f 1; exec " + program + form + In("a.aaf") + " " + In("b.aaf") +
                       " 2>" + In("told") + " >" + In("answer"));
        EXPECT_EQ(cut.status, 2);
        const movies::Bytes answer = ReadFile(folder() / "answer");
        EXPECT_FALSE(answer.empty());
        EXPECT_FALSE(Json::accept(answer));
        const movies::Bytes told = ReadFile(folder() / "told");
        EXPECT_NE(std::string(told.begin(), told.end()).find("standard output: not written: "),
                  std::string::npos);
    }
}

// Who has seen a difference may stop reading.
TEST_F(CompareVerb, TellsADifferenceByItsStatusToAReaderThatGoes) {
    Describe(Movie("1/a.mov", 10), "--aaf " + In("a.aaf"));
    Describe(Movie("2/a.mov", 11, 9), "--aaf " + In("b.aaf"));
    const CommandResult ran =
        RunCommand("bash -c " +
                   Quoted("exec 3> >(true); wait $!; " + Quoted(ProgramFolder() / "cliphost") +
                          " compare --json " + In("a.aaf") + " " + In("b.aaf") + " >&3; echo $?"));
    EXPECT_EQ(ran.out, "1\n");
}

// Of long values the first bytes are shown; the last ones count as well.
TEST_F(CompareVerb, SeesADifferenceBehindWhatItShowsOfAValue) {
    Describe(Movie("a.mov", 10), "--aaf " + In("a.aaf"));
    for (const char last : {1, 2}) {
        Edit("a.aaf", last == 1 ? "1.aaf" : "2.aaf", [&](StoredProperty& property) {
            if (property.pid == 0x4001) {  // of a locator, its URL; of an odd size it is none
                property.bytes.assign(2001, 'x');
                property.bytes.back() = static_cast<unsigned char>(last);
            }
        });
    }
    const CommandResult compared = RunCliphost("compare " + In("1.aaf") + " " + In("2.aaf"));
    ExpectSays(compared, 1, "locator: url string ");
    ExpectSays(compared, 1, "2001 in all, digest ");
    EXPECT_EQ(RunCliphost("compare " + In("1.aaf") + " " + In("1.aaf")).status, 0);
}

TEST_F(CompareVerb, ShowsHostileTextsAsText) {
    Describe(Movie("a.mov", 10), "--aaf " + In("a.aaf"));
    Edit("a.aaf", "odd.aaf", [](StoredProperty& property) {
        if (property.pid == 0x4001) {
            property.bytes = {'\x1B', 0, '[', 0, '2', 0, 'J', 0, '\n', 0, 0, 0};
        }
    });
    const CommandResult compared = RunCliphost("compare " + In("a.aaf") + " " + In("odd.aaf"));
    EXPECT_EQ(compared.status, 1);
    EXPECT_EQ(compared.out.find('\x1B'), std::string::npos);
    ExpectSays(compared, 1, "\\x1B[2J\\n");
}

TEST_F(CompareVerb, TellsWhichFileCanNotBeRead) {
    Describe(Movie("a.mov", 10), "--aaf " + In("a.aaf"));
    std::ofstream(folder() / "text.aaf") << "not an AAF file";
    const std::string good = In("a.aaf") + " ";
    ExpectSays(RunCliphost("compare " + good + In("text.aaf")), 1,
               "text.aaf: not compared: can't be read as AAF: AAFRESULT_NOT_AAF_FILE");
    ExpectSays(RunCliphost("compare " + In("text.aaf") + " " + good), 1,
               "text.aaf: not compared: can't be read");
    ExpectSays(RunCliphost("compare " + good + In("none.aaf")), 2,
               "none.aaf: not compared: there is no such file");
    ExpectSays(RunCliphost("compare " + good + In("")), 2, "this is a folder; give an AAF file");
    ExpectSays(RunCliphost("compare " + good), 2, "after is required");
    const CommandResult json = Answer("compare --json " + good + In("text.aaf"));
    EXPECT_EQ(json.status, 1);
    EXPECT_EQ(Json::parse(json.out)["afterFile"], (folder() / "text.aaf").string());
    const std::string reason = Json::parse(json.out)["reason"];
    EXPECT_EQ(reason.rfind("not compared: can't be read as AAF: AAFRESULT_NOT_AAF_FILE", 0), 0u)
        << reason;
}

// Both have status 1.
TEST_F(CompareVerb, TellsDifferencesFromAFileThatCanNotBeRead) {
    Describe(Movie("a.mov", 10), "--aaf " + In("a.aaf"));
    Describe(Movie("b.mov", 12), "--aaf " + In("b.aaf"));
    std::ofstream(folder() / "text.aaf") << "not an AAF file";
    const std::string call = "compare " + In("a.aaf") + " ";
    const CommandResult differ = Answer(call + In("b.aaf"));
    EXPECT_EQ(differ.status, 1);
    EXPECT_NE(differ.out.find("differences: "), std::string::npos) << differ.out;
    const CommandResult unread = Answer(call + In("text.aaf"));
    EXPECT_EQ(unread.status, 1);
    EXPECT_EQ(unread.out, "");
    EXPECT_TRUE(Json::parse(Answer(call + In("b.aaf") + " --json").out).contains("counts"));
    EXPECT_FALSE(Json::parse(Answer(call + In("text.aaf") + " --json").out).contains("counts"));
}

TEST_F(CompareVerb, EndsWithADocumentedStatusOnDamagedFiles) {
    Describe(Movie("a.mov", 10), "--aaf " + In("a.aaf"));
    const movies::Bytes whole = ReadFile(folder() / "a.aaf");
    constexpr std::size_t kRuns = 40;
    for (std::size_t run = 0; run < kRuns; ++run) {
        movies::Bytes damaged = whole;
        const std::size_t at = whole.size() * run / kRuns;
        for (std::size_t i = 0; i < 16 && at + i * 37 < damaged.size(); ++i) {
            damaged[at + i * 37] ^= 0xFF;
        }
        Write(damaged, "damaged.aaf");
        const CommandResult compared =
            RunCliphost("compare " + In("a.aaf") + " " + In("damaged.aaf"));
        EXPECT_TRUE(compared.status == 0 || compared.status == 1) << compared.status;
        EXPECT_FALSE(compared.out.empty());
    }
}

using DescribeAgainst = ComparedFiles;

TEST_F(DescribeAgainst, FindsNothingOtherThanBefore) {
    const std::string movie = Movie("in/a.mov", 10);
    Describe(movie, "--aaf " + In("a.aaf"));
    const CommandResult again = RunCliphost("describe " + movie + " --against " + In("a.aaf"));
    EXPECT_EQ(again.status, 0) << again.out;
    EXPECT_EQ(again.out, (folder() / "in/a.mov").string() + "\nno differences: 3 objects alike\n");
}

TEST_F(DescribeAgainst, TellsOfABinWhateverTheJobs) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 11);
    Describe(In("in"), "--bin " + In("old.aaf"));
    for (const char* const jobs : {"1", "2"}) {
        const std::string call =
            "describe " + In("in") + " --against " + In("old.aaf") + " --jobs " + std::string(jobs);
        ExpectSays(RunCliphost(call), 0, "no differences: 6 objects alike\n");
    }
    Movie("in/b.mov", 12);
    for (const char* const jobs : {"1", "2"}) {
        const std::string call =
            "describe " + In("in") + " --against " + In("old.aaf") + " --jobs " + std::string(jobs);
        const CommandResult compared = RunCliphost(call);
        ExpectSays(compared, 1, "picture slot 3: length 11 -> 12\n");
        ExpectSays(compared, 1, ": 3 objects alike, 3 objects changed\n");
        EXPECT_EQ(compared.out.find("MasterMob"), std::string::npos) << "no tree is shown";
    }
}

TEST_F(DescribeAgainst, SavesTheNewBinToo) {
    Movie("in/a.mov", 10);
    Describe(In("in"), "--bin " + In("old.aaf"));
    EXPECT_EQ(RunCliphost("describe " + In("in") + " --against " + In("old.aaf") + " --bin " +
                          In("new.aaf"))
                  .status,
              0);
    EXPECT_EQ(RunCliphost("compare " + In("old.aaf") + " " + In("new.aaf")).status, 0);
    ExpectSays(RunCliphost("describe " + In("in") + " --against " + In("old.aaf") + " --bin " +
                           In("old.aaf")),
               2, "this is the file of --against");
}

TEST_F(DescribeAgainst, AnswersInJsonBehindTheMovies) {
    const std::string movie = Movie("in/a.mov", 10);
    Describe(movie, "--aaf " + In("a.aaf"));
    Movie("in/a.mov", 12);
    for (const char* const form : {"--json", "--jsonl"}) {
        const CommandResult again =
            Answer("describe " + movie + " " + form + " --against " + In("a.aaf"));
        EXPECT_EQ(again.status, 1);
        const std::size_t line = again.out.rfind('\n', again.out.size() - 2);
        const Json last = *form && std::string(form) == "--jsonl"
                              ? Json::parse(again.out.substr(line + 1))
                              : Json::parse(again.out).back();
        EXPECT_EQ(last["against"], (folder() / "a.aaf").string());
        const std::vector<std::string> words = WordsOf(last["differences"]);
        EXPECT_EQ(std::count(words.begin(), words.end(), "picture slot 3: length 10 -> 12"), 2)
            << again.out;
        EXPECT_EQ(last["counts"]["changed"], 3);
    }
}

TEST_F(DescribeAgainst, TellsAFailureBeforeAnythingIsRead) {
    const std::string movie = Movie("in/a.mov", 10);
    const CommandResult none = RunCliphost("describe " + movie + " --against " + In("none.aaf"));
    ExpectSays(none, 2, "none.aaf: there is no such file");
    EXPECT_EQ(none.out.find("a.mov"), std::string::npos);
    for (const char* const other : {"--aaf x.aaf", "--out-dir x", "--shard 1/2"}) {
        EXPECT_EQ(
            RunCliphost("describe " + movie + " --against x.aaf " + std::string(other)).status, 2);
    }
}

TEST_F(DescribeAgainst, ComparesNothingWhereNoMovieIsDescribed) {
    Describe(Movie("in/a.mov", 10), "--aaf " + In("a.aaf"));
    std::ofstream(folder() / "b.mov") << "no movie at all";
    ExpectSays(RunCliphost("describe " + In("b.mov") + " --against " + In("a.aaf")), 1,
               "a.aaf: not compared: no movie was described");
}

TEST_F(DescribeAgainst, FailsWhereItsAnswerCanNotBeWritten) {
    const std::string movie = Movie("in/a.mov", 10);
    Describe(movie, "--aaf " + In("a.aaf"));
    Movie("in/a.mov", 11, 3);
    for (const std::string form : {"", "--json", "--jsonl"}) {
        const CommandResult cut = RunCommand(
            "ulimit -f 1; exec " + Quoted(ProgramFolder() / "cliphost") + " describe " + movie +
            " " + form + " --against " + In("a.aaf") + " 2>" + In("told") + " >" + In("answer"));
        EXPECT_EQ(cut.status, 2) << form;
        const movies::Bytes answer = ReadFile(folder() / "answer");
        EXPECT_FALSE(Json::accept(answer));
        const movies::Bytes told = ReadFile(folder() / "told");
        EXPECT_NE(std::string(told.begin(), told.end()).find("standard output: not written: "),
                  std::string::npos);
    }
}

// Nothing is known of what became of it.
TEST_F(DescribeAgainst, TellsAMovieThatCanNotBeDescribedAsThatAndNotAsGone) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 11);
    Describe(In("in"), "--bin " + In("old.aaf"));
    std::ofstream(folder() / "in/b.mov") << "no movie at all";
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult compared = RunCliphost("describe " + In("in") + " --against " +
                                                   In("old.aaf") + " --jobs " + std::string(jobs));
        ExpectSays(compared, 1, "master mob \"b\" not described: ");
        ExpectSays(compared, 1, "source mob \"b\" (MultipleDescriptor) not described: ");
        ExpectSays(compared, 1, "no differences: 3 objects alike, 3 objects not described\n");
        EXPECT_EQ(compared.out.find(" gone"), std::string::npos) << compared.out;
    }
    const CommandResult json =
        Answer("describe " + In("in") + " --json --against " + In("old.aaf"));
    EXPECT_EQ(json.status, 1);
    const Json last = Json::parse(json.out).back();
    EXPECT_EQ(last["counts"]["differences"], 0);
    EXPECT_EQ(last["counts"]["gone"], 0);
    EXPECT_EQ(last["counts"]["notDescribed"], 3);
    ASSERT_EQ(last["differences"].size(), 3u);
    EXPECT_EQ(last["differences"][0]["kind"], "notDescribed");
    EXPECT_EQ(last["differences"][0]["before"], "MasterMob");
    EXPECT_EQ(last["differences"][0]["after"], nullptr);
}

// It would pass for the only clip of another name.
TEST_F(DescribeAgainst, TakesNoOtherMovieForOneThatCanNotBeDescribed) {
    Describe(Movie("in/a.mov", 10), "--aaf " + In("a.aaf"));
    std::ofstream(folder() / "in/a.mov") << "no movie at all";
    const CommandResult compared = RunCliphost("describe " + In("in/a.mov") + " " +
                                               Movie("in/b.mov", 11) + " --against " + In("a.aaf"));
    ExpectSays(compared, 1, "master mob \"a\" not described: ");
    ExpectSays(compared, 1, "master mob \"b\" new\n");
    ExpectSays(compared, 1, "3 differences: 3 objects new, 3 objects not described\n");
}

TEST_F(DescribeAgainst, KnowsTheMoviesOfAFolderThatFailsAndOfAnotherMachinesPlaces) {
    Movie("in/a.mov", 10);
    Movie("in/sub/b.mov", 11);
    const std::string map = " --map " + Quoted((folder() / "in").string() + "=//server/media");
    const std::string call = In("in") + " " + In("in/sub") + map;
    Describe(call, "--bin " + In("old.aaf"));
    fs::remove_all(folder() / "in/sub");
    const CommandResult compared = RunCliphost("describe " + call + " --against " + In("old.aaf"));
    ExpectSays(compared, 2, "master mob \"b\" not described: there is no such file or folder\n");
    ExpectSays(compared, 2, "no differences: 3 objects alike, 3 objects not described\n");
}

TEST_F(DescribeAgainst, TellsAMovieThatWentAsGoneBesideOneThatFails) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 11);
    Movie("in/c.mov", 12);
    Describe(In("in"), "--bin " + In("old.aaf"));
    std::ofstream(folder() / "in/b.mov") << "no movie at all";
    fs::remove(folder() / "in/c.mov");
    const CommandResult compared =
        RunCliphost("describe " + In("in") + " --against " + In("old.aaf"));
    ExpectSays(compared, 1, "master mob \"c\" gone\n");
    ExpectSays(compared, 1,
               "3 differences: 3 objects alike, 3 objects gone, 3 objects not described\n");
}

}  // namespace
