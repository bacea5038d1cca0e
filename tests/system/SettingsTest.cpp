// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The file with options that a user gives always: what it may say, what wins over it, and what is
// told of a wrong one.

#include <cstdlib>
#include <fstream>
#include <nlohmann/json.hpp>
#include <set>
#include <sstream>
#include <vector>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using Json = nlohmann::ordered_json;

class SettingsFile : public SystemTest {
protected:
    SettingsFile() { setenv("XDG_CONFIG_HOME", folder().c_str(), 1); }

    void Settings(const std::string& text) {
        std::ofstream(folder() / "cliphost.toml", std::ios::binary) << text;
    }
    // Between quotes in the file.
    static std::string Value(const std::filesystem::path& path) {
        std::string value = "\"";
        for (const char c : path.string()) {
            value += c == '"' || c == '\\' ? std::string("\\") + c : std::string(1, c);
        }
        return value + '"';
    }
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    CommandResult Describe(const std::string& arguments) {
        return RunCliphost("describe " + arguments + " " + Quoted(MadeMovie("png.mov")));
    }
    // Also with the place.
    void ExpectRefused(const std::string& settings, const std::string& words,
                       const std::string& verb = "describe -q") {
        Settings(settings);
        const CommandResult ran = RunCliphost(verb + " " + Quoted(MadeMovie("png.mov")));
        ExpectSays(ran, 2, words);
        ExpectSays(ran, 2, "cliphost.toml");
    }
};

TEST_F(SettingsFile, GivesOptionsOfProgramAndVerb) {
    Settings(
        "\xEF\xBB\xBF# a comment\neditor-rate = 30 # of the project\r\n\n"
        "[describe]\njson = true\nout-dir = " +
        Value(folder() / "a # b, c") + "\n[contact]\njobs = 1\n");
    const CommandResult ran = Describe("");
    ASSERT_EQ(ran.status, 0) << ran.out;
    EXPECT_EQ(Json::parse(ran.out)[0]["aaf"], (folder() / "a # b, c" / "png.aaf").string());
    EXPECT_TRUE(std::filesystem::exists(folder() / "a # b, c" / "png.aaf"));
    // Of the other verb nothing is taken, of the program all is.
    const std::string withSettings = RunCliphost("formats " + Quoted(MadeMovie("png.mov"))).out;
    EXPECT_EQ(
        withSettings,
        RunCliphost("--no-config formats --editor-rate 30 " + Quoted(MadeMovie("png.mov"))).out);
}

TEST_F(SettingsFile, TakesListsAndSeveralLines) {
    Settings("[describe]\nquiet = true\nmap = [\n  " +
             Value(MadeMoviesFolder().string() + "=//server/media") +
             ", # one\n  '/other=M:',\n]\naaf = " + Value(folder() / "a.aaf") + "\n");
    ExpectSays(Describe(""), 2, "--map /other=M:: nothing was mapped by it");
    ExpectSays(RunCliphost("dump " + In("a.aaf")), 0, "file://server/media/png.mov");
}

TEST_F(SettingsFile, LosesAgainstTheCommandLine) {
    Settings("[describe]\nout-dir = " + Value(folder() / "out") +
             "\njsonl = true\n"
             "map = \"/nowhere=M:\"\nskip-done = true\n");
    // --aaf excludes --out-dir, without which there is no --skip-done; --json excludes --jsonl.
    const CommandResult ran =
        Describe("--json --aaf " + In("b.aaf") + " --map " + Quoted(MadeMoviesFolder()) + "=M:");
    ASSERT_EQ(ran.status, 0) << ran.out;
    EXPECT_EQ(Json::parse(ran.out).size(), 1u);
    EXPECT_FALSE(std::filesystem::exists(folder() / "out"));
    EXPECT_TRUE(std::filesystem::exists(folder() / "b.aaf"));
}

TEST_F(SettingsFile, CountsAndNegates) {
    Settings("v = 2\n[describe]\nquiet = false\njson = false\n");
    const CommandResult ran = Describe("");
    ExpectSays(ran, 0, "console");
    ExpectSays(ran, 0, "MasterMob");
}

TEST_F(SettingsFile, SaysWhatIsWrongInItsOwnWords) {
    ExpectRefused("\n[describe]\njobs = \"many\"\n",
                  "line 3: describe.jobs: 'many' is not a whole number");
    ExpectRefused("[describe]\nq = true\nquiet = false\n",
                  "line 3: describe.q and describe.quiet are one option");
    ExpectRefused("v = 12\n",
                  "line 1: v: '12' is neither true nor false, nor a number from 0 to 9");
}

// A flag that is off excludes nothing, and nothing can need it.
TEST_F(SettingsFile, TakesNoAccountOfFlagsThatAreOff) {
    Settings("[describe]\njson = false\njsonl = true\n");
    CommandResult ran = Describe("");
    ASSERT_EQ(ran.status, 0) << ran.out;
    EXPECT_TRUE(Json::parse(ran.out).is_object()) << ran.out;
    Settings("[describe]\njsonl = true\n");
    ran = Describe("--json=false");
    ASSERT_EQ(ran.status, 0) << ran.out;
    EXPECT_TRUE(Json::parse(ran.out).is_object()) << ran.out;
    Settings("[describe]\njson = true\n");
    EXPECT_NE(Describe("--json=false").out.find("MasterMob"), std::string::npos);
    Settings("[describe]\nwatch = false\nrest = 2\njson = true\n");
    ran = Describe("");
    ASSERT_EQ(ran.status, 0) << ran.out;
    EXPECT_TRUE(Json::parse(ran.out).is_array()) << ran.out;
}

TEST_F(SettingsFile, MayBeAnotherOneOrNone) {
    Settings("nonsense = 1\n");
    std::ofstream(folder() / "other.toml") << "[describe]\nquiet = true\n";
    EXPECT_EQ(Describe("").status, 2);
    EXPECT_EQ(Describe("--no-config").status, 0);
    const CommandResult other = Describe("--config " + In("other.toml"));
    EXPECT_EQ(other.status, 0) << other.out;
    EXPECT_EQ(other.out.find("MasterMob"), std::string::npos);
    ExpectSays(Describe("--config " + In("none.toml")), 2,
               "none.toml: the settings can't be read: No such file or directory");
    ExpectSays(Describe("--config " + Quoted(folder())), 2,
               folder().string() + ": the settings can't be read: Is a directory");
}

// It may be a pipe, which can be read once.
TEST_F(SettingsFile, IsReadByNoChild) {
    Settings("nonsense = 1\n");
    const auto out = In("out");
    const CommandResult ran = RunCommand(
        "echo '[describe]\nquiet = true\njobs = 2\nextensions = \"mov\"' | " +
        Quoted(ProgramFolder() / "cliphost") + " describe --config /dev/stdin --out-dir " + out +
        " " + Quoted(MadeMovie("png.mov")) + " " + Quoted(MadeMovie("pcm_s16le.mov")) + " 2>&1");
    ExpectSays(ran, 0, "2 described, 0 not");
    EXPECT_EQ(ran.out.find("MasterMob"), std::string::npos) << ran.out;
}

TEST_F(SettingsFile, MayBeMissing) {
    setenv("XDG_CONFIG_HOME", (folder() / "none").c_str(), 1);
    EXPECT_EQ(Describe("-q").status, 0);
    setenv("XDG_CONFIG_HOME", "relative", 1);  // which counts as unset
    EXPECT_EQ(RunCommand("HOME= " + Quoted(ProgramFolder() / "cliphost") + " types").status, 0);
    std::filesystem::create_directories(folder() / ".config");
    std::ofstream(folder() / ".config" / "cliphost.toml") << "nonsense = 1\n";
    ExpectSays(RunCommand("HOME=" + Quoted(folder()) + " " + Quoted(ProgramFolder() / "cliphost") +
                          " types 2>&1"),
               2, ".config/cliphost.toml: line 1: nonsense: there is no such option");
}

TEST_F(SettingsFile, NamesWhatIsWrong) {
    ExpectRefused("a\n", "line 1: Error while parsing key-value pair");
    ExpectRefused("editor-rate = 25\neditor-rate = 30\n",
                  "line 2: Error while parsing key-value pair: cannot redefine");
    ExpectRefused("editor-rate = x\n", "line 1: Error while parsing value");
    ExpectRefused("editor-rate = \n", "line 1: Error while parsing key-value pair");
    ExpectRefused("editor-rate = 'x'\n", "line 1: editor-rate: ");
    ExpectRefused("editor-rate = 2026-01-31\n", "line 1: editor-rate: is neither a text, a number");
    ExpectRefused("[verify]\nmap = [[1]]\n", "line 2: map: is neither");
    ExpectRefused("[verify]\nmap = \"a\\u0000\"\n", "line 2: map: is neither");
    ExpectRefused("editor-rate = \"\"\n", "line 1: editor-rate: ");
    ExpectRefused("editor-rate = [1, 2]\n", "line 1: editor-rate: ");
    ExpectRefused("jobs = 2\n", "line 1: jobs: there is no such option");
    ExpectRefused("[describe]\neditor-rate = 25\n",
                  "line 2: describe.editor-rate: there is no such option; it stands before");
    ExpectRefused("[describe]\nhelp = true\n", "line 2: describe.help: there is no such option");
    ExpectRefused("config = \"x\"\n", "line 1: config: there is no such option");
    ExpectRefused("[describe]\npaths = \"x\"\n", "there is no such option");
    ExpectRefused("[describe]\njobs = 2000\n", "line 2: describe.jobs: ");
    ExpectRefused("[describe]\njson = 'perhaps'\n", "'perhaps' is neither true nor false");
    ExpectRefused("[describe]\njson = true\njsonl = true\n",
                  "describe.json and jsonl exclude each other");
    ExpectRefused("[describe]\nmap = \"x\"\n", "line 2: describe.map: ");
    ExpectRefused("[describe]\nmap = [\"a=M:\",\n", "line 2: Error while parsing array");
    ExpectRefused("[describe]\nextensions = \"mov\n", "line 2: Error while parsing string");
    ExpectRefused(std::string("a\0b = 1\n", 8), "line 1: Error while parsing key-value pair");
    ExpectRefused("[describe]\nextensions = mov,mp4\n", "line 2: Error while parsing value");
    ExpectRefused("[describe]\nout-dir = \"M:\\media\"\n",
                  "line 2: Error while parsing string: unknown escape");
    ExpectRefused("[nothing]\nx = 1\n", "[nothing] names no verb");
    ExpectRefused("[describe-for-parent]\nquiet = true\n", "names no verb");
    ExpectRefused("[default]\nv = 1\n", "line 1: [default] names no verb");
    ExpectRefused("[describe.more]\nv = 1\n", "line 1: [describe.more]: a section has no other");
    // Names of verbs that don't run are checked as well.
    ExpectRefused("[contact]\ncollumns = 1\n", "line 2: contact.collumns: there is no such option");
}

TEST_F(SettingsFile, MustBeReadable) {
    std::filesystem::create_directory(folder() / "cliphost.toml");
    ExpectSays(Describe("-q"), 2, "the settings can't be read: Is a directory");
    ExpectSays(Describe("-q --no-config"), 0, "png.mov");
}

// Each line of the example that is commented out has to be one that works.
TEST_F(SettingsFile, HasAnExampleThatWorks) {
    std::ifstream example(CLIPHOST_SETTINGS_EXAMPLE);
    std::string all;
    int settings = 0;
    for (std::string line; std::getline(example, line);) {
        const bool isSetting = line.size() > 1 && line[0] == '#' && line[1] != ' ';
        settings += isSetting ? 1 : 0;
        all += (isSetting ? line.substr(1) : line) + '\n';
    }
    EXPECT_GT(settings, 8);
    Settings(all);
    EXPECT_EQ(RunCliphost("types").status, 0) << RunCliphost("types").out;
    ExpectSays(Describe("--aaf " + In("a.aaf")), 2, "nothing was mapped by it");
}

// What help lists as `--name` or `-n`, in the order of the lines.
std::vector<std::string> OptionsOf(const std::string& verb) {
    std::vector<std::string> names;
    std::istringstream help(RunCliphost(verb + " --help").out);
    for (std::string line; std::getline(help, line);) {
        const std::size_t start = line.rfind("  -", 0) == 0 ? line.find("--") : std::string::npos;
        const std::size_t first = start == std::string::npos ? 3 : start + 2;
        if (line.rfind("  -", 0) == 0) {
            names.push_back(line.substr(first, line.find_first_of(" ,=", first) - first));
        }
    }
    return names;
}

TEST_F(SettingsFile, TakesEveryOptionOfEveryVerb) {
    const std::set<std::string> none = {"help", "version", "config", "no-config"};
    std::size_t options = 0;
    for (const char* const verb :
         {"",       "scan",       "describe", "samples", "formats",  "frame", "contact",
          "audio",  "dump",       "compare",  "verify",  "relink",   "types", "params",
          "plugin", "check-data", "catalog",  "find",    "validate", "report"}) {
        for (const std::string& name : OptionsOf(verb)) {
            if (none.count(name) == 0) {
                ++options;
                // Of a verb that does not run, values are not looked at.
                const std::string section = *verb ? std::string("[") + verb + "]\n" : "";
                Settings(section + name + " = 'x'\n");
                const CommandResult ran = RunCliphost(*verb == 't' ? "plugin" : "types");
                EXPECT_EQ(ran.out.find("no such option"), std::string::npos) << ran.out;
                EXPECT_TRUE(ran.status == 0 || *verb == 0) << verb << ' ' << name << ran.out;
            }
        }
    }
    EXPECT_GT(options, 80u);
}

TEST_F(SettingsFile, LeavesHelpAlone) {
    Settings("nonsense = 1\n");
    EXPECT_EQ(RunCliphost("--help").status, 0);
    EXPECT_EQ(RunCliphost("describe --help").status, 0);
    EXPECT_EQ(RunCliphost("--version").status, 0);
}

}  // namespace
