// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Verbs about saved AAF files, and how what is saved names its media.

#include <fstream>
#include <nlohmann/json.hpp>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

namespace fs = std::filesystem;
using Json = nlohmann::ordered_json;

class AafFiles : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }

    // Copies of a movie in the folder `in`.
    void Copy(const std::string& name) {
        fs::create_directories(folder() / "in");
        fs::copy_file(MadeMovie("prores_with_pcm.mov"), folder() / "in" / name);
    }

    CommandResult Cliphost(const std::string& arguments) {
        return RunCommand(Quoted(ProgramFolder() / "cliphost") + " " + arguments);
    }
};

// All values of a property in a tree.
void Collect(const Json& tree, const std::string& name, std::set<std::string>& values) {
    for (const auto& [key, value] : tree.items()) {
        if (value.is_structured()) {
            Collect(value, name, values);
        } else if (key == name) {
            values.insert(value.get<std::string>());
        }
    }
}

using DumpVerb = AafFiles;

TEST_F(DumpVerb, ShowsTheTreeThatDescribeShows) {
    Copy("a.mov");
    const CommandResult described =
        Cliphost("describe --json " + In("in/a.mov") + " --aaf " + In("a.aaf"));
    ASSERT_EQ(described.status, 0);
    const CommandResult dumped = Cliphost("dump --json " + In("a.aaf"));
    ASSERT_EQ(dumped.status, 0);
    const Json dump = Json::parse(dumped.out);
    EXPECT_EQ(dump["aaf"], (folder() / "a.aaf").string());
    EXPECT_EQ(dump["description"], Json::parse(described.out)[0]["description"]);
}

TEST_F(DumpVerb, ShowsThatTreeToPeopleToo) {
    Copy("a.mov");
    const CommandResult described =
        Cliphost("describe " + In("in/a.mov") + " --aaf " + In("a.aaf"));
    std::string lines;
    std::istringstream text(described.out);
    std::string line;
    std::getline(text, line);  // the movie and its file
    while (std::getline(text, line)) {
        ASSERT_EQ(line.substr(0, 2), "  ") << line;
        lines += line.substr(2) + "\n";
    }
    EXPECT_EQ(Cliphost("dump " + In("a.aaf")).out, lines);
}

TEST_F(DumpVerb, NeedsNoModule) {
    Copy("a.mov");
    ASSERT_EQ(Cliphost("describe -q " + In("in/a.mov") + " --aaf " + In("a.aaf")).status, 0);
    EXPECT_EQ(Cliphost("--plugin /nowhere.nvx dump " + In("a.aaf")).status, 0);
}

TEST_F(DumpVerb, TellsWhatIsNoAafFile) {
    std::ofstream(folder() / "text.aaf") << "not an AAF file";
    ExpectSays(RunCliphost("dump " + In("text.aaf")), 1,
               "text.aaf: can't be read as AAF: AAFRESULT_NOT_AAF_FILE");
    ExpectSays(RunCliphost("dump " + In("none.aaf")), 2, "none.aaf: there is no such file");
    ExpectSays(RunCliphost("dump " + In("")), 2, "this is a folder; give an AAF file in it");
    const CommandResult json = Cliphost("dump --json " + In("text.aaf") + " 2>/dev/null");
    EXPECT_EQ(json.status, 1);
    EXPECT_EQ(Json::parse(json.out)["aaf"], (folder() / "text.aaf").string());
}

class MappedPaths : public AafFiles {
protected:
    // The URLs in what is saved of the movies.
    std::set<std::string> UrlsIn(const std::string& file) {
        std::set<std::string> urls;
        const CommandResult dumped = Cliphost("dump --json " + In(file));
        EXPECT_EQ(dumped.status, 0);
        Collect(Json::parse(dumped.out), "URLString", urls);
        return urls;
    }
    std::string MapTo(const std::string& there) {
        return " --map " + Quoted((folder() / "in").string() + "=" + there);
    }
};

TEST_F(MappedPaths, AreSavedAsTheOtherMachineSeesThem) {
    Copy("a b.mov");
    const struct {
        const char* to;
        const char* url;
    } places[] = {{"//server/media", "\"file://server/media/a%20b.mov\""},
                  {"\\\\server\\media", "\"file://server/media/a%20b.mov\""},
                  {"M:", "\"file:///M:/a%20b.mov\""},
                  {"/Volumes/x", "\"file:///Volumes/x/a%20b.mov\""}};
    for (const auto& place : places) {
        const CommandResult run = RunCliphost("describe -q " + In("in/a b.mov") + MapTo(place.to) +
                                              " --aaf " + In("a.aaf"));
        EXPECT_EQ(run.status, 0) << run.out;
        EXPECT_EQ(UrlsIn("a.aaf"), std::set<std::string>{place.url});
    }
}

TEST_F(MappedPaths, AreTheSameInOneProcessAndInSeveral) {
    for (const char* const name : {"a.mov", "b.mov", "c.mov"}) {
        Copy(name);
    }
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult run = RunCliphost("describe -q --jobs " + std::string(jobs) + " " +
                                              In("in") + MapTo("M:") + " --out-dir " + In("out"));
        EXPECT_EQ(run.status, 0) << run.out;
        EXPECT_EQ(UrlsIn("out/c.aaf"), std::set<std::string>{"\"file:///M:/c.mov\""});
        fs::remove_all(folder() / "out");
    }
}

TEST_F(MappedPaths, AreShownAsTheyAreSaved) {
    Copy("a.mov");
    const CommandResult run = RunCliphost("describe " + In("in/a.mov") + MapTo("//s/m"));
    EXPECT_NE(run.out.find("URLString = \"file://s/m/a.mov\""), std::string::npos) << run.out;
}

TEST_F(MappedPaths, TellARuleThatNothingIsMappedBy) {
    Copy("a.mov");
    Copy("b.mov");
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult run =
            RunCliphost("describe -q --jobs " + std::string(jobs) + " " + In("in") + MapTo("M:") +
                        " --map /nowhere=/x --out-dir " + In("out"));
        ExpectSays(run, 2, "--map /nowhere=/x: nothing was mapped by it");
        EXPECT_EQ(run.out.find("=M:: nothing"), std::string::npos) << run.out;
        EXPECT_EQ(UrlsIn("out/b.aaf"), std::set<std::string>{"\"file:///M:/b.mov\""})
            << "all the same, the rest is done";
        fs::remove_all(folder() / "out");
    }
}

TEST_F(MappedPaths, RefuseWhatIsNoRule) {
    ExpectSays(RunCliphost("describe x.mov --map /a"), 2, "--map /a: is not FROM=TO");
    ExpectSays(RunCliphost("describe x.mov --map /a=b"), 2, "--map /a=b: TO is no absolute path");
}

}  // namespace
