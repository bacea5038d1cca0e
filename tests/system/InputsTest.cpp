// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Which movies `describe` and `contact` read: lists, folders within folders, endings and shares.
// What they leave out because it is done, and what they leave behind when a signal stops them.

#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <map>
#include <nlohmann/json.hpp>
#include <sstream>
#include <thread>

#include "reference_host/util/text/FileUrl.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using Json = nlohmann::ordered_json;
using namespace std::chrono_literals;
using Names = std::set<std::string>;

constexpr char kPinned[] = " --pin-time 2026-01-31T12:00:00Z ";
constexpr char kRecords[] = ".cliphost-done";

std::string Program() {
    return Quoted(ProgramFolder() / "cliphost");
}

std::string TextOf(const std::filesystem::path& file) {
    std::ostringstream text;
    text << std::ifstream(file, std::ios::binary).rdbuf();
    return text.str();
}

Names NamesIn(const std::filesystem::path& folder) {
    Names names;
    for (const auto& entry : std::filesystem::directory_iterator(folder)) {
        names.insert(entry.path().filename());
    }
    return names;
}

std::vector<Json> LinesOf(const std::string& text) {
    std::vector<Json> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) {
        lines.push_back(Json::parse(line));
    }
    return lines;
}

class Inputs : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    std::filesystem::path Copy(const std::string& name) {
        std::filesystem::create_directories((folder() / name).parent_path());
        std::filesystem::copy_file(MadeMovie("png.mov"), folder() / name);
        return folder() / name;
    }
    std::string List(const std::string& content, const std::string& name = "list") {
        std::ofstream(folder() / name, std::ios::binary) << content;
        return " --files-from " + In(name);
    }
    // The program in the test's folder; standard error goes to a file.
    CommandResult Run(const std::string& arguments, const std::string& before = "") {
        return RunCommand("cd " + Quoted(folder()) + " && " + before + Program() + " " + arguments +
                          " 2>told");
    }
    std::string Told() { return TextOf(folder() / "told"); }
    // What one process and several print and tell alike.
    CommandResult RunAlike(const std::string& arguments, const std::string& before = "") {
        const CommandResult one = Run(arguments + " --jobs 1", before);
        const std::string told = Told();
        const CommandResult two = Run(arguments + " --jobs 2", before);
        EXPECT_EQ(two.status, one.status) << arguments;
        EXPECT_EQ(two.out, one.out) << arguments;
        EXPECT_EQ(Told(), told) << arguments;
        return two;
    }
    // The movies of a call, as it names them below the test's folder.
    std::vector<std::string> MoviesOf(const std::string& arguments) {
        std::vector<std::string> movies;
        for (const Json& entry :
             LinesOf(RunAlike("describe --jsonl" + std::string(kPinned) + arguments).out)) {
            const std::filesystem::path movie = entry["movie"].get<std::string>();
            movies.push_back(movie.is_absolute() ? movie.lexically_relative(folder()) : movie);
        }
        return movies;
    }
    using Movies = std::vector<std::string>;
};

TEST_F(Inputs, ComeFromAListLineByLine) {
    Copy("a.mov");
    Copy("b c.mov");
    Copy("in/d.mov");
    Copy("e\xFF.mov");
    const std::string list = List(
        "\xEF\xBB\xBF"
        "a.mov\r\n\r\nabsent.mov\nin\nfile://" +
        (folder() / "e%FF.mov").string() + "\nb c.mov");
    const CommandResult ran = RunAlike("describe -q" + list);
    EXPECT_EQ(ran.status, 2);
    EXPECT_EQ(Told(), "cliphost: absent.mov: there is no such file or folder\n");
    EXPECT_NE(ran.out.find("a.mov\n" + (folder() / "in/d.mov").string()), std::string::npos)
        << ran.out;
    EXPECT_NE(ran.out.find("b c.mov\n4 described, 1 not\n"), std::string::npos) << ran.out;
    EXPECT_EQ(MoviesOf("b\\ c.mov" + List("a.mov\n")), (Movies{"b c.mov", "a.mov"}));
    EXPECT_EQ(RunAlike("describe -q" + List("")).out, "0 described, 0 not\n");
}

TEST_F(Inputs, ComeFromStandardInputAndFromAPipe) {
    Copy("a.mov");
    Copy("line\nend.mov");
    Copy("re\r.mov");
    const CommandResult ran =
        RunAlike("describe -q --files-from - -0", "find . -name '*.mov' -print0 | ");
    EXPECT_EQ(ran.status, 0) << Told();
    EXPECT_NE(ran.out.find("3 described, 0 not\n"), std::string::npos);
    EXPECT_NE(Run("contact --frames 1 --width 16 --out-dir out --null --files-from /dev/stdin",
                  "printf 'line\\nend.mov\\0' | ")
                  .out.find("out/line"),
              std::string::npos)
        << Told();
    EXPECT_EQ(NamesIn(folder() / "out"), Names{"line\nend.png"});
    EXPECT_EQ(Run("describe -q --files-from -", "printf 'a.mov\\n' | ").out, "a.mov\n");
}

TEST_F(Inputs, RefuseAListThatCantBeRead) {
    Copy("a.mov");
    const struct {
        std::string list, words;
    } cases[] = {
        {" --files-from absent", "absent: the list can't be read: No such file or directory\n"},
        {" --files-from .", ".: the list can't be read: Is a directory\n"},
        {List(std::string("a.mov\0", 6)),
         "the list has a byte of zero in it; give -0 where its paths end with one\n"},
        {List(std::string("\xFF\xFE"
                          "a\0",
                          4),
              "wide"),
         "the list is in UTF-16; save it as UTF-8\n"},
    };
    for (const auto& each : cases) {
        const CommandResult ran = RunAlike("describe a.mov --out-dir out" + each.list);
        EXPECT_EQ(ran.status, 2);
        EXPECT_EQ(ran.out, "");
        EXPECT_NE(Told().find(each.words), std::string::npos) << Told();
        EXPECT_FALSE(std::filesystem::exists(folder() / "out"));
    }
    const CommandResult json = Run("describe --json --files-from absent");
    EXPECT_EQ(Json::parse(json.out)[0]["reason"],
              "the list can't be read: No such file or directory");
    const CommandResult line = Run("describe --jsonl --files-from absent");
    EXPECT_EQ(LinesOf(line.out).at(0)["reason"],
              "the list can't be read: No such file or directory");
}

TEST_F(Inputs, RefuseCallsThatMeanNothing) {
    const std::pair<const char*, const char*> cases[] = {
        {"describe", "paths or --files-from is required"},
        {"contact --out-dir out", "paths or --files-from is required"},
        {"describe a.mov -0", "--null requires --files-from"},
        {"describe a.mov --skip-done", "--skip-done requires --out-dir"},
        {"describe a.mov --aaf a.aaf --files-from list", "excludes"},
        {"contact a.mov -o a.png --files-from list", "excludes"},
        {"describe a.mov --json --jsonl", "excludes"},
        {"describe a.mov --shard 0/2", "--shard 0/2: is not I/N with I from 1 to N"},
        {"describe a.mov --shard 2", "--shard 2: is not I/N with I from 1 to N"},
        {"describe a.mov --extensions mp4,", "--extensions mp4,: is not a list of endings"},
        {"describe a.mov --aaf - --jsonl", "standard output takes the JSON"},
    };
    for (const auto& [call, words] : cases) {
        ExpectSays(RunCliphost(call), 2, words);
    }
}

// For the parser of the command line they would be lists.
TEST_F(Inputs, MayHaveNamesInBrackets) {
    Copy("[2024]/a.mov");
    Copy("[a,b]/c.mov");
    EXPECT_EQ(MoviesOf("'[2024]' '[a,b]'"), (Movies{"[2024]/a.mov", "[a,b]/c.mov"}));
    const auto expectSays = [&](const std::string& call, int status, const std::string& words) {
        const CommandResult ran = Run(call);
        ExpectSays({ran.status, ran.out + Told()}, status, words);
    };
    expectSays("contact --output '[x,y]' '[2024]/a.mov'", 0, "");
    EXPECT_TRUE(std::filesystem::exists(folder() / "[x,y]"));
    expectSays("contact --out-dir sheets '[2024]' '[a,b]'", 0, "c.png");
    expectSays("describe -q --bin '[b,c]' '[a,b]' --map='[a,b]=[M:]'", 2, "--map [a,b]=[M:]: ");
    expectSays("describe -q --bin '[b,c]' '[a,b]'", 0, "c.mov");
    expectSays("verify '[b,c]'", 0, "1 clip: 1 same");
    expectSays("catalog '[2024]' '[a,b]' -o '[c,d]'", 0, "2");
    expectSays("find '[c,d]' '[x,y]'", 1, "");
    expectSays("describe '[no,ne]'", 2, "[no,ne]: there is no such file");
    expectSays("'[no,ne]'", 2, "'[no,ne]' is neither a verb nor an option");
    std::ofstream(folder() / "[x,y].toml") << "[describe]\nmap = \"[x,y]=[M:]\"\n";
    expectSays("describe --config '[x,y].toml' '[a,b]'", 2, "describe.map: TO is no absolute path");
    std::ofstream(folder() / "[t,o]") << "[describe]\nquiet = true\n";
    expectSays("describe --config '[t,o]' '[a,b]'", 0, "c.mov");
}

TEST_F(Inputs, ComeFromFoldersWithinFolders) {
    Copy("in/b/z.mov");
    Copy("in/b/a/y.mov");
    Copy("in/.hidden/x.mov");
    Copy("in/w.mov");
    Copy("in/c/other.mp4");
    std::filesystem::create_directories(folder() / "in/empty");
    std::filesystem::create_symlink("../..", folder() / "in/b/circle");
    std::filesystem::create_symlink("b", folder() / "in/again");
    std::filesystem::create_symlink("gone", folder() / "in/b/broken.mov");
    const Movies all{"in/w.mov", "in/.hidden/x.mov", "in/b/broken.mov", "in/b/z.mov",
                     "in/b/a/y.mov"};
    // The circle leads to the test's folder, where nothing else is.
    EXPECT_EQ(MoviesOf("--recursive in"), all);
    EXPECT_NE(Told().find("in/c: 1 movie is left out, because the module only takes *.mov"),
              std::string::npos)
        << Told();
    EXPECT_EQ(MoviesOf("in"), Movies{"in/w.mov"});
    EXPECT_EQ(MoviesOf("--recursive" + List("in\nin/w.mov\n")).size(), all.size() + 1);
    const CommandResult none = RunAlike("describe --recursive in/empty in/c");
    EXPECT_EQ(none.status, 1);
    EXPECT_NE(
        Told().find("cliphost: in/empty: no file in it or in a folder within it is named *.mov\n"),
        std::string::npos)
        << Told();
}

// As root too: a name with a backslash can't be given to the module.
TEST_F(Inputs, TellOfAFolderThatCantBeListedAndGoOn) {
    Copy("in/a.mov");
    Copy("in/b\\c/lost.mov");
    Copy("in/closed/closed.mov");
    Copy("in/d/d.mov");
    const CommandResult ran = RunAlike("describe -q --recursive in");
    EXPECT_EQ(ran.status, 2);
    EXPECT_NE(Told().find("a name with a backslash in it can't be passed to the module"),
              std::string::npos);
    EXPECT_NE(ran.out.find("3 described, 1 not\n"), std::string::npos) << ran.out;

    const std::string other =
        geteuid() == 0 ? "setpriv --reuid=65534 --regid=65534 --clear-groups " : "";
    std::filesystem::permissions(folder(), std::filesystem::perms(0755));
    std::filesystem::permissions(folder() / "in/closed", std::filesystem::perms::none);
    if (RunCommand("(" + other + Program() + " --version && " + other + "ls " + In("in") +
                   ") >/dev/null 2>&1")
            .status != 0) {
        GTEST_SKIP() << "no other user can run the program";
    }
    for (const char* const more : {"", " --extensions mov"}) {
        const CommandResult closed =
            RunAlike("describe -q --recursive in" + std::string(more), other);
        EXPECT_EQ(closed.status, 2);
        EXPECT_NE(Told().find("in/closed: the folder can't be listed: Permission denied; get "
                              "permission to read it\n"),
                  std::string::npos)
            << Told();
        EXPECT_NE(closed.out.find("2 described, 2 not\n"), std::string::npos) << closed.out;
    }
    std::filesystem::permissions(folder() / "in/closed", std::filesystem::perms(0755));
}

TEST_F(Inputs, ComeOutOfFoldersByTheirEndings) {
    Copy("in/a.mov");
    Copy("in/B.MOV");
    Copy("in/c.Mp4");
    Copy("in/sub/d.mxf");
    Copy("in/e.txt");
    std::filesystem::create_directories(folder() / "in/folder.mp4");
    EXPECT_EQ(MoviesOf("in"), Movies{"in/a.mov"});
    EXPECT_NE(Told().find("2 movies are left out"), std::string::npos) << Told();
    EXPECT_EQ(MoviesOf("in --extensions mp4,.MOV"), (Movies{"in/B.MOV", "in/a.mov", "in/c.Mp4"}));
    EXPECT_EQ(Told(), "");
    EXPECT_EQ(MoviesOf("in --recursive --extensions mxf"), Movies{"in/sub/d.mxf"});
    EXPECT_EQ(MoviesOf("in/e.txt --extensions mov"), Movies{"in/e.txt"}) << "it is named";
    EXPECT_EQ(RunAlike("describe in --extensions avi,mpg,mxf").status, 1);
    EXPECT_EQ(Told(), "cliphost: in: no file in it is named *.avi, *.mpg or *.mxf\n");
    // The same description on both roads.
    Run("describe in/a.mov --aaf named.aaf" + std::string(kPinned));
    Run("describe in --extensions mov --out-dir out" + std::string(kPinned));
    EXPECT_EQ(ReadFile(folder() / "out/a.aaf"), ReadFile(folder() / "named.aaf"));
}

// Whatever the working folder is, and by whichever way: the same locators.
TEST_F(Inputs, AreDescribedAlikeHoweverTheyAreNamed) {
    Copy("real/in/a.mov");
    std::filesystem::create_directories(folder() / "real/in/sub");
    std::filesystem::create_directory_symlink("real/in/sub", folder() / "link");
    Run("describe " + In("real/in/a.mov") + " --aaf whole.aaf" + kPinned);
    const movies::Bytes whole = ReadFile(folder() / "whole.aaf");
    const std::string url = host::text::FileUrl((folder() / "real/in/a.mov").native());
    EXPECT_NE(Run("dump whole.aaf").out.find("\"" + url + "\""), std::string::npos);
    const struct {
        const char *from, *inputs;
    } calls[] = {{".", "real/in/a.mov"},
                 {".", "real/in"},
                 {".", "./real/../real/in/a.mov"},
                 {".", "link/../a.mov"},
                 {".", "link/.."},
                 {".", "link/.. --extensions mov"},
                 {".", "link/../.. --recursive"},
                 {".", "link/../a.mov --limit-seconds 60"},
                 {"real/in", "a.mov"},
                 {"real/in", "."},
                 {"real/in/sub", "../a.mov"},
                 {"link", "../../in"}};
    for (const auto& call : calls) {
        std::filesystem::remove_all(folder() / "out");
        Run(std::string("describe ") + call.inputs + " --out-dir " + In("out") + kPinned,
            "cd " + std::string(call.from) + " && ");
        EXPECT_EQ(NamesIn(folder() / "out"), Names{"a.aaf"}) << call.inputs;
        EXPECT_EQ(ReadFile(folder() / "out/a.aaf"), whole) << call.from << ": " << call.inputs;
    }
}

TEST_F(Inputs, AreShownInLinesThatAreTheEntriesOfAList) {
    Copy("in/a.mov");
    Copy("in/b\xFF\n.mov");
    Write(movies::Bytes(100, 'x'), "in/text.mov");
    const std::string call = "describe in absent.mov --out-dir out" + std::string(kPinned);
    const CommandResult lines = RunAlike(call + "--jsonl");
    const CommandResult list = RunAlike(call + "--json");
    EXPECT_EQ(lines.status, list.status);
    const std::vector<Json> entries = LinesOf(lines.out);
    ASSERT_EQ(entries.size(), 4u);
    EXPECT_EQ(Json(entries), Json::parse(list.out));
    EXPECT_FALSE(entries[0]["description"].empty());
}

TEST_F(Inputs, AreShownInLinesBySheetsAndCatalogsToo) {
    const std::string good = Copy("in/a.mov");
    Copy("in/b\xFF\n.mov");
    const std::string bad = Write(movies::Bytes(100, 'x'), "in/text.mov");
    for (const std::string call :
         {"contact --frames 1 --width 16 --out-dir out", "catalog -o all.sqlite"}) {
        const std::string output = call[2] == 'n' ? "out/a.png" : "all.sqlite";
        const CommandResult ran = RunAlike(call + " --jsonl in absent.mov");
        EXPECT_EQ(ran.status, 2);
        const std::vector<Json> lines = LinesOf(ran.out);
        ASSERT_EQ(lines.size(), 4u) << ran.out;
        EXPECT_EQ(lines[0],
                  Json({{"schema", lines[0]["schema"]}, {"movie", good}, {"output", output}}));
        EXPECT_TRUE(std::filesystem::exists(folder() / output));
        EXPECT_TRUE(lines[1].contains("output")) << lines[1];
        EXPECT_EQ(lines[2]["movie"], bad);
        EXPECT_FALSE(lines[2].contains("output"));
        EXPECT_EQ(lines[3]["movie"], "absent.mov");
        EXPECT_EQ(lines[3]["reason"], "there is no such file or folder");
    }
    const CommandResult update = Run("catalog -o all.sqlite --update --jsonl in/a.mov");
    EXPECT_EQ(LinesOf(update.out).at(0)["doneAlready"], true);
    EXPECT_EQ(LinesOf(update.out).size(), 1u) << "and no summary";
    ExpectSays(RunCliphost("contact a.mov --jsonl -o -"), 2, "standard output takes the JSON");
    ExpectSays(RunCliphost("catalog --merge a b -o c --jsonl"), 2, "excludes");
}

// A program that reads them need not wait for the last movie.
TEST_F(Inputs, AreShownAtOnceInLines) {
    Copy("in/a.mov");
    Copy("in/hang.mov");
    const CommandResult ran =
        RunCommand("cd " + Quoted(folder()) + "; " + Program() + " --plugin " +
                   Quoted(ProgramFolder() / "tests/BreakingModule.nvx") +
                   " describe --jsonl in --jobs 2 --limit-seconds 60 >lines 2>told & for i in "
                   "$(seq 500); do sleep 0.05; [ -s lines ] && break; done; "
                   "wc -l <lines; kill $!; wait $!; echo $?");
    EXPECT_EQ(ran.out, "1\n143\n") << Told();
}

TEST_F(Inputs, AreInOneShareEach) {
    for (int i = 0; i < 12; ++i) {
        Copy("in/" + std::to_string(i % 3) + "/" + std::to_string(i / 3) + ".mov");
    }
    const auto sharesOf = [&](const std::string& inputs) {
        std::map<std::string, int> shares;
        for (int share = 1; share <= 3; ++share) {
            for (const std::string& movie :
                 MoviesOf(inputs + " --shard " + std::to_string(share) + "/3")) {
                EXPECT_TRUE(shares.emplace(movie, share).second) << movie;
            }
        }
        return shares;
    };
    const auto shares = sharesOf("--recursive in");
    EXPECT_EQ(shares.size(), 12u);
    Copy("in/0/new.mov");
    Copy("in/a/new.mov");
    auto more = sharesOf("--recursive in");
    EXPECT_EQ(more.size(), 14u);
    for (const auto& [movie, share] : shares) {
        EXPECT_EQ(more[movie], share) << "moved by others: " << movie;
    }
    // A list of the same movies has the same shares.
    std::string list;
    for (const auto& [movie, share] : shares) {
        list += "./" + movie + "\n";
    }
    for (const auto& [movie, share] : sharesOf(List(list))) {
        EXPECT_EQ(shares.at(std::filesystem::path(movie).lexically_normal()), share) << movie;
    }
}

// Movies of one name go by the same numbers in every share, so that none takes another's place.
TEST_F(Inputs, HaveOutputsOfTheirOwnInAllShares) {
    for (int i = 0; i < 6; ++i) {
        Copy("in/" + std::to_string(i) + "/clip.mov");
    }
    Write(movies::Bytes(100, 'x'), "in/0/bad.mov");
    std::size_t told = 0;
    for (const char* const share : {"1/3", "2/3", "3/3"}) {
        Run("describe -q --recursive in absent.mov --out-dir out --shard " + std::string(share));
        const std::string text = Told();
        told += static_cast<std::size_t>(std::count(text.begin(), text.end(), '\n'));
    }
    EXPECT_EQ(NamesIn(folder() / "out"), (Names{"clip.aaf", "clip-2.aaf", "clip-3.aaf",
                                                "clip-4.aaf", "clip-5.aaf", "clip-6.aaf"}));
    EXPECT_EQ(told, 2u) << "each problem by one share";
}

class SkipDone : public Inputs {
protected:
    void SetUp() override {
        Inputs::SetUp();
        for (const char* const name : {"in/a.mov", "in/b.mov", "in/sub/a.mov"}) {
            Copy(name);
        }
    }
    // How many movies a run makes, and how many it leaves out.
    std::pair<int, int> Counts(const std::string& more = "", const std::string& out = "out") {
        const CommandResult ran =
            Run("-v describe --json --recursive in --skip-done --out-dir " + out + " " + more);
        std::pair<int, int> counts;
        for (const Json& entry : Json::parse(ran.out)) {
            const bool isDone = entry.contains("doneAlready");
            EXPECT_EQ(isDone, !entry.contains("description") && !entry.contains("reason")) << entry;
            EXPECT_EQ(isDone, Told().find("cliphost: " + entry["movie"].get<std::string>() +
                                          ": is done already\n") != std::string::npos)
                << Told();
            ++(isDone ? counts.second : counts.first);
        }
        return counts;
    }
    using Made = std::pair<int, int>;
};

TEST_F(SkipDone, LeavesOutWhatIsThere) {
    EXPECT_EQ(Counts(), Made(3, 0));
    EXPECT_EQ(NamesIn(folder() / "out"), (Names{kRecords, "a.aaf", "b.aaf", "a-2.aaf"}));
    for (const char* const jobs : {"--jobs 1", "--jobs 2"}) {
        EXPECT_EQ(Counts(jobs), Made(0, 3));
    }
    EXPECT_EQ(Run("describe -q --recursive in --skip-done --out-dir out").out,
              "0 described, 0 not, 3 done already\n");
    EXPECT_EQ(Told(), "");
    EXPECT_EQ(NamesIn(folder() / "out" / kRecords).size(), 1u)
        << "a run that makes nothing writes nothing";
    // By other ways to name them.
    EXPECT_EQ(Run("describe -q in/a.mov ./in/b.mov --skip-done --out-dir out/../out --jobs 2").out,
              "0 described, 0 not, 2 done already\n");
}

TEST_F(SkipDone, MakesAnewWhatChanged) {
    Counts();
    std::filesystem::last_write_time(folder() / "in/a.mov",
                                     std::filesystem::last_write_time(folder() / "in/a.mov") + 1ns);
    EXPECT_EQ(Counts(), Made(1, 2));
    std::ofstream(folder() / "in/b.mov", std::ios::app) << "free";
    EXPECT_EQ(Counts(), Made(1, 2));
    std::filesystem::remove(folder() / "out/a-2.aaf");
    EXPECT_EQ(Counts(), Made(1, 2));
    Run("describe in/b.mov --out-dir out --use-alpha");
    EXPECT_EQ(Counts(), Made(1, 2)) << "another run wrote over it";
    Copy("in/c.mov");
    EXPECT_EQ(Counts(), Made(1, 3));
    EXPECT_EQ(Counts(), Made(0, 4));
}

// Movies of one name keep their outputs, whichever others come or go.
TEST_F(SkipDone, LeavesEachMovieItsOutput) {
    using Outputs = std::map<std::string, std::string>;
    for (const std::vector<std::string>& calls : std::vector<std::vector<std::string>>{
             {"--jobs 1"}, {"--jobs 2"}, {"--shard 1/3", "--shard 2/3", "--shard 3/3"}}) {
        SCOPED_TRACE(calls[0]);
        int made = 0;
        const auto outputs = [&] {
            Outputs all;
            made = 0;
            for (const std::string& call : calls) {
                const CommandResult ran =
                    Run("describe --json --recursive clips --skip-done --out-dir outputs " + call);
                for (const Json& entry : Json::parse(ran.out)) {
                    const std::filesystem::path movie = entry["movie"].get<std::string>();
                    const std::filesystem::path aaf = entry["aaf"].get<std::string>();
                    EXPECT_TRUE(std::filesystem::exists(folder() / aaf)) << entry;
                    EXPECT_TRUE(all.emplace(movie.parent_path().filename(), aaf.filename()).second);
                    made += entry.contains("doneAlready") ? 0 : 1;
                }
            }
            return all;
        };
        Copy("clips/b/clip.mov");
        Copy("clips/c/clip.mov");
        EXPECT_EQ(outputs(), (Outputs{{"b", "clip.aaf"}, {"c", "clip-2.aaf"}}));
        EXPECT_EQ(made, 2);
        Copy("clips/a/clip.mov");
        const Outputs three{{"a", "clip-3.aaf"}, {"b", "clip.aaf"}, {"c", "clip-2.aaf"}};
        EXPECT_EQ(outputs(), three) << "one before the others";
        EXPECT_EQ(made, 1);
        std::ofstream(folder() / "clips/c/clip.mov", std::ios::app) << "free";
        std::ofstream(folder() / "clips/a/clip.mov", std::ios::app) << "free";
        EXPECT_EQ(outputs(), three) << "two that changed";
        EXPECT_EQ(made, 2);
        std::filesystem::remove_all(folder() / "clips/b");
        Copy("clips/d/clip.mov");
        EXPECT_EQ(outputs(),
                  (Outputs{{"a", "clip-3.aaf"}, {"c", "clip-2.aaf"}, {"d", "clip-4.aaf"}}))
            << "the output of one that went is there";
        EXPECT_EQ(made, 1);
        std::filesystem::remove(folder() / "outputs/clip.aaf");
        Copy("clips/e/clip.mov");
        const Outputs last{
            {"a", "clip-3.aaf"}, {"c", "clip-2.aaf"}, {"d", "clip-4.aaf"}, {"e", "clip.aaf"}};
        EXPECT_EQ(outputs(), last) << "it was taken away";
        EXPECT_EQ(outputs(), last);
        EXPECT_EQ(made, 0);
        EXPECT_EQ(NamesIn(folder() / "outputs"),
                  (Names{kRecords, "clip.aaf", "clip-2.aaf", "clip-3.aaf", "clip-4.aaf"}));
        std::filesystem::remove_all(folder() / "clips");
        std::filesystem::remove_all(folder() / "outputs");
    }
}

// A part of the movies, other options, and a movie that is given twice.
TEST_F(SkipDone, KnowsOutputsInOtherCalls) {
    Counts();
    const std::string call = "describe --json --skip-done --out-dir out ";
    const auto aafOf = [&](const std::string& arguments, std::size_t place = 0) {
        return Json::parse(Run(call + arguments).out).at(place)["aaf"];
    };
    EXPECT_EQ(aafOf("in/sub/a.mov"), "out/a-2.aaf");
    EXPECT_EQ(aafOf("in/sub/a.mov --use-alpha"), "out/a-2.aaf");
    EXPECT_EQ(aafOf("in/sub/a.mov in/sub/a.mov", 1), "out/a-3.aaf");
    EXPECT_EQ(aafOf("in/sub/a.mov in/sub/a.mov"), "out/a-2.aaf");
    EXPECT_EQ(aafOf("in/sub/a.mov in/sub/a.mov", 1), "out/a-3.aaf");
}

TEST_F(SkipDone, MakesAnewWithOtherOptions) {
    const auto expectNew = [&](const std::string& more) {
        EXPECT_EQ(Counts(more), Made(3, 0)) << more;
        EXPECT_EQ(Counts(more), Made(0, 3)) << more;
    };
    expectNew("");
    expectNew("--use-alpha");
    expectNew("--editor-rate 24");
    expectNew(kPinned);
    expectNew("--map /=/other");
    expectNew("--map " + In("in") + "=M:");
    EXPECT_EQ(Counts("-vv --limit-seconds 100 --map " + In("in") + "=M: --plugin " +
                     Quoted(ProgramFolder() / "plugins/QuickTimePlugin.nvx")),
              Made(0, 3))
        << "these change no output";
    expectNew("--plugin " + Quoted(ProgramFolder() / "tests/BreakingModule.nvx"));
    // A rule for movies that are left out has been of use.
    EXPECT_EQ(Run("describe -q in --skip-done --out-dir other --map " + In("in") + "=M:").status,
              0);
    EXPECT_EQ(Run("describe -q in --skip-done --out-dir other --map " + In("in") + "=M:").status, 0)
        << Told();
}

TEST_F(SkipDone, SurvivesACopyOfTheFolderAndDamage) {
    Counts();
    RunCommand("cp -r " + In("out") + " " + In("copy"));
    EXPECT_EQ(Counts("", "copy"), Made(0, 3));
    EXPECT_EQ(Run("contact --recursive in --skip-done --out-dir copy --frames 1 --width 16").status,
              0);
    EXPECT_EQ(Counts("", "copy"), Made(0, 3));
    // The last line was not written whole.
    for (const auto& entry : std::filesystem::directory_iterator(folder() / "out" / kRecords)) {
        std::filesystem::resize_file(entry.path(), std::filesystem::file_size(entry.path()) - 7);
    }
    EXPECT_EQ(Counts(), Made(1, 2));
    EXPECT_EQ(Counts(), Made(0, 3));
    std::filesystem::remove_all(folder() / "out" / kRecords);
    std::ofstream(folder() / "out" / kRecords) << "in the way";
    const CommandResult ran = Run("describe -q --recursive in --skip-done --out-dir out");
    EXPECT_EQ(ran.status, 2);
    EXPECT_NE(ran.out.find("3 described, 0 not\n"), std::string::npos) << "all outputs are there";
    EXPECT_EQ(Told(),
              "cliphost: out/.cliphost-done: the folder can't be made: File exists; --skip-done "
              "will not find the outputs of this run\n");
}

TEST_F(SkipDone, TriesWhatFailedAgain) {
    Write(movies::Bytes(100, 'x'), "in/text.mov");
    EXPECT_EQ(Counts(), Made(4, 0));
    EXPECT_EQ(Counts(), Made(1, 3));
    const CommandResult ran = RunAlike("describe -q --recursive in --skip-done --out-dir out");
    EXPECT_EQ(ran.status, 1);
    EXPECT_EQ(ran.out, "0 described, 1 not, 3 done already\n");
}

TEST_F(SkipDone, LeavesOutSheets) {
    const std::string call =
        "contact --recursive in --skip-done --out-dir out --width 16 --frames ";
    for (const char* const jobs : {" --jobs 1", " --jobs 2"}) {
        EXPECT_NE(Run(call + "2" + jobs).out.find("out/a-2.png: 2 of 3 frames"), std::string::npos);
        EXPECT_EQ(Run(call + "2" + jobs).out, "0 made, 0 not, 3 done already\n");
        std::filesystem::remove_all(folder() / "out");
    }
    Run(call + "2");
    EXPECT_NE(Run(call + "3").out.find("out/a-2.png: 3 of 3 frames"), std::string::npos);
    EXPECT_EQ(Run(call + "2").out.find("already"), std::string::npos)
        << "sheets of other frames lie there";
    // A document counts by what is in it.
    RunCommand("cd " + Quoted(folder()) + " && " + Program() +
               " params in/a.mov --xml values >one.xml");
    ASSERT_NE(TextOf(folder() / "one.xml"), "");
    Run(call + "2 --set-xml one.xml");
    EXPECT_EQ(Run(call + "2 --set-xml one.xml").out, "0 made, 0 not, 3 done already\n");
    std::ofstream(folder() / "one.xml", std::ios::app) << "\n";
    EXPECT_EQ(Run(call + "2 --set-xml one.xml").out.find("already"), std::string::npos);
}

// A sheet with empty cells is told of each time.
TEST_F(SkipDone, MakesWhatLacksSomethingEachTime) {
    const auto cut = Make(
        "-i " + Quoted(MadeMovie("h264_bframes.mov")) + " -c copy -movflags +faststart", "cut.mov");
    std::filesystem::resize_file(cut, std::filesystem::file_size(cut) * 3 / 4);
    for (int i = 0; i < 2; ++i) {
        const CommandResult ran =
            Run("contact cut.mov --skip-done --out-dir out --exact --width 32 --frames 4");
        EXPECT_EQ(ran.status, 1);
        EXPECT_EQ(ran.out.find("already"), std::string::npos);
        EXPECT_NE(Told().find("stays empty"), std::string::npos);
    }
}

TEST_F(SkipDone, IsKeptByTwoRunsAtTheSameTime) {
    for (int i = 0; i < 40; ++i) {
        Copy("in/" + std::to_string(i) + ".mov");
    }
    const std::string call =
        Program() + " describe -q --recursive in --skip-done --out-dir out --jobs ";
    const CommandResult ran = RunCommand("cd " + Quoted(folder()) + " && { " + call + "1 >one & " +
                                         call + "2 >two & wait; } 2>&1");
    EXPECT_EQ(ran.out, "");
    EXPECT_EQ(Counts(), Made(0, 43));
    EXPECT_EQ(NamesIn(folder() / "out").size(), 44u);
}

TEST_F(SkipDone, LeavesNothingWhereItIsNotAskedFor) {
    Run("describe -q --recursive in --out-dir out");
    EXPECT_EQ(NamesIn(folder() / "out"), (Names{"a.aaf", "b.aaf", "a-2.aaf"}));
    Run("describe -q absent.mov --out-dir none --skip-done");
    EXPECT_FALSE(std::filesystem::exists(folder() / "none"));
}

// A run over many movies that a signal stops in the midst.
class Stopped : public Inputs {
protected:
    static constexpr int kMovies = 200;

    void SetUp() override {
        Inputs::SetUp();
        std::filesystem::create_directories(folder() / "tmp");
        for (int i = 0; i < kMovies; ++i) {
            Copy("in/" + std::to_string(1000 + i) + ".mov");
        }
        Write(movies::Bytes(100, 'x'), "in/1001.mov");
    }

    struct Left {
        int signal = 0;
        std::string out, told;
        int done = 0, failed = 0, left = 0;
    };
    // Sends the signal once some outputs are there.
    Left Stop(int signal, std::vector<std::string> arguments) {
        std::fflush(nullptr);
        const pid_t program = fork();
        if (program == 0) {
            for (const int other : {SIGINT, SIGTERM, SIGHUP}) {
                std::signal(other, SIG_DFL);
            }
            if (chdir(folder().c_str()) != 0 || !freopen("printed", "w", stdout) ||
                !freopen("told", "w", stderr)) {
                _exit(126);
            }
            setenv("TMPDIR", (folder() / "tmp").c_str(), 1);
            std::vector<char*> line;
            arguments.insert(arguments.begin(), "cliphost");
            for (std::string& argument : arguments) {
                line.push_back(argument.data());
            }
            line.push_back(nullptr);
            execv((ProgramFolder() / "cliphost").c_str(), line.data());
            _exit(127);
        }
        for (int i = 0; i < 6000 && !HasBegun(); ++i) {
            std::this_thread::sleep_for(5ms);
        }
        EXPECT_EQ(kill(program, signal), 0);
        int status = 0;
        EXPECT_EQ(waitpid(program, &status, 0), program);
        Left left;
        left.signal = WIFSIGNALED(status) ? WTERMSIG(status) : 0;
        left.out = TextOf(folder() / "printed");
        left.told = Told();
        const std::size_t at = left.told.find("cliphost: stopped by signal ");
        int number = 0, all = 0;
        EXPECT_EQ(
            std::sscanf(left.told.c_str() + std::min(at, left.told.size()),
                        "cliphost: stopped by signal %d: %d of %d movies done, %d failed, %d left",
                        &number, &left.done, &all, &left.failed, &left.left),
            5)
            << left.told;
        EXPECT_EQ(number, signal);
        EXPECT_EQ(all, kMovies);
        EXPECT_EQ(left.done + left.failed + left.left, kMovies);
        EXPECT_GT(left.left, 0);
        return left;
    }
    virtual bool HasBegun() {
        std::error_code ignored;
        return std::filesystem::exists(folder() / "out/1004.aaf", ignored) ||
               std::filesystem::exists(folder() / "out/1004.png", ignored);
    }
    // Outputs that are whole, and nothing else.
    int CountOutputs(const std::string& ending) {
        int count = 0;
        for (const std::string& name : NamesIn(folder() / "out")) {
            if (name == kRecords) {
                continue;
            }
            EXPECT_EQ(std::filesystem::path(name).extension(), ending) << name;
            ++count;
        }
        EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
        return count;
    }
};

TEST_F(Stopped, SaysWhatIsDoneAndGoesOn) {
    for (const char* const jobs : {"1", "2"}) {
        for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
            SCOPED_TRACE(std::string(jobs) + " jobs, signal " + std::to_string(signal));
            const Left left = Stop(signal, {"describe", "in", "--json", "--skip-done", "--out-dir",
                                            "out", "--jobs", jobs});
            EXPECT_EQ(left.signal, signal);
            EXPECT_GE(left.done, 4);
            EXPECT_EQ(left.failed, 1);
            EXPECT_EQ(CountOutputs(".aaf"), left.done);
            EXPECT_EQ(Json::parse(left.out).size(),
                      static_cast<std::size_t>(left.done + left.failed));
            EXPECT_NE(left.told.find("; the same call with --skip-done goes on\n"),
                      std::string::npos);
            const CommandResult second = Run("describe in -q --skip-done --out-dir out");
            EXPECT_EQ(second.status, 1);
            const std::string summary = std::to_string(left.left) + " described, 1 not, " +
                                        std::to_string(left.done) + " done already\n";
            EXPECT_NE(second.out.find(summary), std::string::npos)
                << second.out.substr(second.out.size() - 100);
            EXPECT_EQ(CountOutputs(".aaf"), kMovies - 1);
            std::filesystem::remove_all(folder() / "out");
        }
    }
}

TEST_F(Stopped, LeavesWholeFiles) {
    const Left left = Stop(SIGINT, {"--use-alpha", "describe", "in", "-q", "--pin-time",
                                    "2026-01-31T12:00:00Z", "--out-dir", "out", "--jobs", "2"});
    Run("--use-alpha describe in/1000.mov --out-dir whole" + std::string(kPinned));
    const auto size = std::filesystem::file_size(folder() / "whole/1000.aaf");
    for (const std::string& name : NamesIn(folder() / "out")) {
        if (name != kRecords) {
            EXPECT_EQ(std::filesystem::file_size(folder() / "out" / name), size) << name;
        }
    }
    EXPECT_EQ(RunCliphost("dump " + In("out/1000.aaf")).status, 0);
    // A run that kept no record from the start has one now.
    const CommandResult second =
        Run("--use-alpha describe in -q --skip-done --out-dir out" + std::string(kPinned));
    EXPECT_NE(second.out.find(std::to_string(left.done) + " done already\n"), std::string::npos);
    EXPECT_EQ(CountOutputs(".aaf"), kMovies - 1);
}

class StoppedReports : public Stopped {
protected:
    bool HasBegun() override { return Told().find("1001.mov") != std::string::npos; }
};

TEST_F(StoppedReports, HaveWhatWasReadUnlessThereWasOneBefore) {
    const std::vector<std::string> call = {"report", "in", "-o", "r.html", "--jobs", "1"};
    const Left left = Stop(SIGINT, call);
    const std::string page = TextOf(folder() / "r.html");
    EXPECT_NE(page.find("\"isWhole\":false"), std::string::npos);
    const auto hasClip = [&](int number) {
        return page.find("id=\"clip-" + std::to_string(number) + "\"") != std::string::npos;
    };
    EXPECT_TRUE(hasClip(left.done + left.failed - 1));
    EXPECT_FALSE(hasClip(left.done + left.failed));
    std::filesystem::remove(folder() / "told");
    EXPECT_NE(Stop(SIGTERM, call).told.find("r.html: left as it was"), std::string::npos);
    EXPECT_TRUE(TextOf(folder() / "r.html") == page);
}

TEST_F(StoppedReports, LeaveAPageThatWasThereItsPictures) {
    Run("report in/1000.mov -o r.html --split");
    const std::string page = TextOf(folder() / "r.html");
    const Names pictures = NamesIn(folder() / "r_files");
    EXPECT_EQ(pictures.size(), 2u);
    Write(movies::Bytes(3, 'o'), "r_files/" + *pictures.begin());
    const Left left = Stop(SIGINT, {"report", "in", "-o", "r.html", "--split", "--jobs", "1"});
    EXPECT_GT(left.done, 0);
    EXPECT_NE(left.told.find("r.html: left as it was"), std::string::npos) << left.told;
    EXPECT_TRUE(TextOf(folder() / "r.html") == page);
    EXPECT_EQ(TextOf(folder() / "r_files" / *pictures.begin()), "ooo");
    EXPECT_EQ(NamesIn(folder() / "r_files"), pictures);
}

TEST_F(Stopped, GoesOnWithSheets) {
    const Left left = Stop(SIGTERM, {"contact", "in", "--width", "16", "--frames", "1",
                                     "--skip-done", "--out-dir", "out"});
    EXPECT_EQ(CountOutputs(".png"), left.done);
    const CommandResult second = Run("contact in --width 16 --frames 1 --skip-done --out-dir out");
    EXPECT_NE(second.out.find(std::to_string(left.left) + " made, 1 not, " +
                              std::to_string(left.done) + " done already\n"),
              std::string::npos);
    EXPECT_EQ(CountOutputs(".png"), kMovies - 1);
}

TEST_F(Stopped, SaysNothingToAReaderThatHasSeenEnough) {
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult ran =
            RunCommand("env --default-signal=PIPE " + Program() + " describe " + In("in") +
                       " --jobs " + jobs + " 2>" + In("told") + " | head -n 1");
        EXPECT_EQ(ran.out, (folder() / "in/1000.mov").string() + "\n");
        EXPECT_EQ(Told().find("stop"), std::string::npos) << Told();
    }
}

// Also the exit status that a shell sees.
TEST_F(Stopped, WritesNoPartOfABin) {
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult ran = RunCommand(
            "cd " + Quoted(folder()) + "; rm -f lines; TMPDIR=tmp " + Program() +
            " describe in --jsonl --bin all.aaf --jobs " + jobs +
            " >lines 2>told & for i in $(seq 2000); do sleep 0.01; [ -s lines ] && break; done; "
            "kill -TERM $!; wait $!; echo $?");
        EXPECT_EQ(ran.out, "143\n");
        EXPECT_FALSE(std::filesystem::exists(folder() / "all.aaf"));
        EXPECT_NE(Told().find("cliphost: all.aaf: not written: not all movies were read\n"),
                  std::string::npos)
            << Told();
        EXPECT_EQ(Told().find("--skip-done"), std::string::npos)
            << "there is nothing to go on with";
        EXPECT_EQ(NamesIn(folder()), (Names{"in", "lines", "tmp", "told"}));
        EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
        const std::vector<Json> lines = LinesOf(TextOf(folder() / "lines"));
        EXPECT_EQ(lines.back()["reason"], "not written: not all movies were read");
    }
}

// A signal that comes when the last movie is read finds nothing that could still be lost.
TEST_F(Inputs, AreKeptWhereASignalComesBehindTheLast) {
    Copy("a.mov");
    Copy("interrupt.mov");
    Copy("b.mov");
    std::filesystem::create_directory(folder() / "empty");
    Run("catalog b.mov -o all.sqlite");
    const auto run = [&](const std::string& arguments) {
        const CommandResult ran =
            RunCommand("cd " + Quoted(folder()) + "; env --default-signal=TERM " + Program() +
                       " --plugin " + Quoted(ProgramFolder() / "tests/BreakingModule.nvx") + " " +
                       arguments + " --jobs 1 >printed 2>told; echo $?");
        EXPECT_EQ(ran.out, "143\n") << arguments;
        EXPECT_EQ(Told().find("not all movies were read"), std::string::npos) << Told();
        return TextOf(folder() / "printed");
    };
    const std::string described =
        run("describe a.mov interrupt.mov empty --json --bin all.aaf --columns-out all.csv");
    const Json list = Json::parse(described, nullptr, false);
    ASSERT_EQ(list.size(), 3u) << described;
    EXPECT_EQ(list[2]["reason"], "not claimed: no file in it is named *.mov");
    ExpectSays(RunCliphost("verify " + In("all.aaf")), 0, "1 clip: 1 same");
    EXPECT_NE(TextOf(folder() / "all.csv").find("interrupt.mov"), std::string::npos);
    EXPECT_EQ(run("catalog a.mov interrupt.mov -o all.sqlite"), "2 catalogued, 0 not\n");
    EXPECT_EQ(Run("find all.sqlite name:b").status, 1);
    EXPECT_EQ(Run("find all.sqlite name:interrupt").status, 0);
    EXPECT_NE(run("describe a.mov interrupt.mov -q --out-dir out").find("2 described, 0 not\n"),
              std::string::npos);
    EXPECT_EQ(NamesIn(folder() / "out"), (Names{"a.aaf", "interrupt.aaf"}));
}

TEST_F(Inputs, AreNeverReplacedByAnOutputOfTheSameRun) {
    Copy("in/clip.mov");
    Copy("in/clip.png");
    const movies::Bytes before = ReadFile(folder() / "in/clip.png");
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult run =
            RunCliphost("contact " + In("in") + " --extensions mov,png --jobs " + jobs +
                        " --out-dir " + In("in"));
        ExpectSays(run, 2, "clip.png: this is the movie itself");
        EXPECT_TRUE(ReadFile(folder() / "in/clip.png") == before) << jobs;
    }
}

}  // namespace
