// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What `scan` and `describe` say of folders whose movies the module does not
// take, and whether following their advice helps.

#include <nlohmann/json.hpp>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using Json = nlohmann::json;

class FolderVerbs : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    void Copy(const std::string& name) {
        std::filesystem::create_directories((folder() / name).parent_path());
        std::filesystem::copy_file(MadeMovie("png.mov"), folder() / name);
    }
};

TEST_F(FolderVerbs, TellHowManyMoviesAreNotClaimedAndHowToNameThem) {
    Copy("in/clip.mp4");
    Copy("in/B.MOV");
    Write(movies::Bytes{'x'}, "in/notes.txt");
    std::filesystem::create_directory(folder() / "in" / "folder.mp4");
    for (const char* const verb : {"describe ", "scan "}) {
        const CommandResult ran = RunCliphost(verb + In("in"));
        ExpectSays(ran, 1,
                   "not claimed: no file in it is named *.mov, but it holds 2 movies with other "
                   "endings: B.MOV, clip.mp4; ");
        ExpectSays(ran, 1,
                   "rename each so that the name ends in .mov, in small letters, such as "
                   "B.mov");
    }
    const CommandResult json =
        RunCommand(Quoted(ProgramFolder() / "cliphost") + " scan --json " + In("in"));
    const Json facts = Json::parse(json.out);
    EXPECT_EQ(facts["claimed"], false);
    EXPECT_EQ(facts["otherEnding"].size(), 2u);
    EXPECT_NE(facts["reason"].get<std::string>().find("2 movies"), std::string::npos);
    EXPECT_NE(facts["hint"].get<std::string>().find("rename"), std::string::npos);
}

TEST_F(FolderVerbs, GiveAdviceThatHelps) {
    Copy("in/clip.mp4");
    ExpectSays(RunCliphost("describe " + In("in")), 1,
               "1 movie with another ending: clip.mp4; rename it so that the name ends in .mov, in "
               "small letters, such as clip.mov; or give the file itself to `cliphost describe`");
    EXPECT_EQ(RunCliphost("describe -q " + In("in/clip.mp4")).status, 0);
    std::filesystem::rename(folder() / "in/clip.mp4", folder() / "in/clip.mov");
    EXPECT_EQ(RunCliphost("describe -q " + In("in")).status, 0);
    ExpectSays(RunCliphost("scan " + In("in")), 0, "1 movie\n");
}

TEST_F(FolderVerbs, TellOfMoviesLeftOutBesideOthers) {
    Copy("in/a.mov");
    Copy("in/a.mp4");
    const std::string words =
        "in: 1 movie is left out, because the module only takes *.mov: a.mp4; rename it so that "
        "the "
        "name ends in .mov, in small letters, such as a.mp4.mov";
    ExpectSays(RunCliphost("describe -q " + In("in")), 0, words);
    ExpectSays(RunCliphost("scan " + In("in")), 0, words);
    std::filesystem::rename(folder() / "in/a.mp4", folder() / "in/a.mp4.mov");
    const CommandResult ran = RunCliphost("describe -q " + In("in"));
    ExpectSays(ran, 0, "2 described, 0 not");
    EXPECT_EQ(ran.out.find("left out"), std::string::npos);
}

TEST_F(FolderVerbs, SayOnlyThatAFolderWithoutMoviesIsNotClaimed) {
    Write(movies::Bytes{'x'}, "notes.txt");
    for (const char* const verb : {"describe ", "scan "}) {
        ExpectSays(RunCliphost(verb + Quoted(folder())), 1,
                   "not claimed: no file in it is named *.mov\n");
    }
}

TEST_F(FolderVerbs, ShowAFewOfManyNames) {
    for (const char* const name : {"a.avi", "b.avi", "c.avi", "d.avi"}) {
        Write(movies::Bytes{'x'}, name);
    }
    ExpectSays(RunCliphost("scan " + Quoted(folder())), 1,
               "4 movies with other endings: a.avi, b.avi, c.avi, ...; ");
}

TEST_F(FolderVerbs, RefuseAMovieWhoseNameHoldsABackslash) {
    Copy("in/good.mov");
    Copy("in/a\\b.mov");
    Copy("in/\\good.mov");
    Copy("in/a/b.mov");  // what the name would become
    const std::string words =
        "in/a\\b.mov: a name with a backslash in it can't be passed to the "
        "module, which separates folders by it; rename it";
    const CommandResult described = RunCliphost("describe -q " + In("in"));
    ExpectSays(described, 2, words);
    ExpectSays(described, 2, "1 described, 2 not");
    EXPECT_EQ(described.out.find("in/a/b.mov"), std::string::npos) << described.out;
    const CommandResult scanned = RunCliphost("scan " + In("in"));
    ExpectSays(scanned, 2, words);
    ExpectSays(scanned, 2, "/in/good.mov\n1 movie\n");
    ExpectSays(RunCliphost("describe " + In("in/a\\b.mov")), 2, words);
}

TEST_F(FolderVerbs, RefuseABackslashInAFoldersNameWhereverItComesFrom) {
    Copy("x\\y/a.mov");
    const std::string words = "a name with a backslash in it can't be passed to the module";
    const std::string program = Quoted(ProgramFolder() / "cliphost");
    ExpectSays(RunCliphost("describe " + In("x\\y")), 2, words);
    ExpectSays(RunCliphost("scan " + In("x\\y")), 2, words);
    ExpectSays(RunCommand("cd " + In("x\\y") + " && " + program + " describe a.mov 2>&1"), 2,
               words);
    const auto module = folder() / "x\\y" / "QuickTimePlugin.nvx";
    std::filesystem::copy_file(ProgramFolder() / "plugins" / "QuickTimePlugin.nvx", module);
    ExpectSays(RunCliphost("types --plugin " + Quoted(module)), 2, words);
}

TEST_F(FolderVerbs, TellAFolderThatIsNotThereFromAFile) {
    ExpectSays(RunCliphost("scan " + In("no")), 2, "there is no such file or folder");
    Copy("a.mov");
    ExpectSays(RunCliphost("scan " + In("a.mov")), 2, "is not a folder");
}

}  // namespace
