// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Verbs about saved AAF files, and how what is saved names its media.

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

// One value of the wrong size: a name that was cut.
TEST_F(DumpVerb, ShowsWhatMakesNoSenseAsRawBytes) {
    Copy("a.mov");
    ASSERT_EQ(Cliphost("describe -q " + In("in/a.mov") + " --aaf " + In("a.aaf")).status, 0);
    aaf::stored::StoredObject root;
    ASSERT_TRUE(aaf::stored::LoadTree(folder() / "a.aaf", root));
    std::size_t cut = 0;
    const std::function<void(aaf::stored::StoredObject&)> search =
        [&](aaf::stored::StoredObject& object) {
            for (aaf::stored::StoredProperty& property : object.properties) {
                if (property.pid == 0x4001 && cut++ == 0) {  // of a locator, its URL
                    property.bytes = {'f', 0, 'i'};
                }
                std::for_each(property.objects.begin(), property.objects.end(), search);
            }
        };
    search(root);
    ASSERT_GT(cut, 0u);
    ASSERT_TRUE(
        aaf::stored::SaveTree(root, folder() / "odd.aaf", aaf::stored::SectorSize::Bytes512));
    const CommandResult dumped = Cliphost("dump --json " + In("odd.aaf") + " 2>" + In("told"));
    EXPECT_EQ(dumped.status, 0);
    std::set<std::string> urls;
    Collect(Json::parse(dumped.out), "URLString", urls);
    EXPECT_EQ(urls.count("raw bytes 66 00 69"), 1u) << dumped.out;
    std::ifstream told(folder() / "told");
    std::string line;
    std::getline(told, line);
    EXPECT_NE(line.find("odd.aaf: Content: Mobs: EssenceDescription: Locator: URLString: 3 bytes "
                        "are no value of its type; it is kept as it stands"),
              std::string::npos)
        << line;
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

class BinFile : public AafFiles {
protected:
    // Movies of the test's own, each with another content.
    std::string Movie(const std::string& name, int pictures, int sounds, int frames) {
        std::vector<movies::Track> tracks;
        for (int i = 0; i < pictures; ++i) {
            tracks.push_back(movies::VideoTrack({}, frames, 25, 1));
        }
        for (int i = 0; i < sounds; ++i) {
            tracks.push_back(movies::SoundTrack({}, frames * 1920));
        }
        fs::create_directories(folder() / "in");
        return Write(movies::Movie{tracks}, "in/" + name);
    }
    Json Dump(const std::string& file) {
        const CommandResult dumped = Cliphost("dump --json " + In(file));
        EXPECT_EQ(dumped.status, 0) << dumped.out;
        return Json::parse(dumped.out)["description"];
    }
    static std::vector<Json> MobsOf(const Json& tree, const std::string& kind) {
        std::vector<Json> mobs;
        for (const Json& mob : tree["Mobs"]) {
            if (mob["class"] == kind) {
                mobs.push_back(mob);
            }
        }
        return mobs;
    }
    // The parts of a sequence's track as "clip 10", "gap 5".
    static std::vector<std::string> PartsOf(const Json& slot) {
        std::vector<std::string> parts;
        for (const Json& part : slot["Segment"][0]["Components"]) {
            parts.push_back((part["class"] == "Filler" ? "gap " : "clip ") +
                            part["Length"].get<std::string>());
        }
        return parts;
    }
};

TEST_F(BinFile, HoldsTheMobsOfEachMovieAsTheirOwnFilesDo) {
    Movie("a.mov", 1, 1, 10);
    Movie("b.mov", 1, 0, 20);
    const std::string pinned = " --pin-time 2026-01-31T12:00:00Z ";
    for (const char* const jobs : {"1", "2"}) {
        const std::string call = "describe -q --jobs " + std::string(jobs) + pinned + In("in");
        ASSERT_EQ(RunCliphost(call + " --bin " + In("bin.aaf")).status, 0);
        ASSERT_EQ(RunCliphost(call + " --out-dir " + In("out")).status, 0);
        std::set<std::string> single;
        for (const char* const file : {"out/a.aaf", "out/b.aaf"}) {
            const Json tree = Dump(file);
            for (const Json& mob : tree["Mobs"]) {
                single.insert(mob.dump());
            }
        }
        std::set<std::string> together;
        const Json tree = Dump("bin.aaf");
        for (const Json& mob : tree["Mobs"]) {
            together.insert(mob.dump());
        }
        EXPECT_EQ(together.size(), 6u);
        EXPECT_EQ(together, single);
    }
}

TEST_F(BinFile, HasTheSameBytesFromOneProcessAndFromSeveral) {
    Movie("a.mov", 1, 1, 10);
    Movie("b.mov", 1, 0, 20);
    Movie("c.mov", 0, 2, 5);
    std::vector<movies::Bytes> files;
    for (const char* const jobs : {"1", "3"}) {
        ASSERT_EQ(RunCliphost("describe -q --stringout --pin-time 2026-01-31T12:00:00Z --jobs " +
                              std::string(jobs) + " " + In("in") + " --bin " + In("bin.aaf"))
                      .status,
                  0);
        files.push_back(ReadFile(folder() / "bin.aaf"));
    }
    EXPECT_TRUE(files[0] == files[1]);
}

TEST_F(BinFile, MakesCopiesOneClipWithTwoPlacesAndTellsSo) {
    Copy("a.mov");
    Copy("b.mov");
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult run = RunCliphost("describe -q --jobs " + std::string(jobs) + " " +
                                              In("in") + " --bin " + In("bin.aaf"));
        ExpectSays(run, 0, "b.mov: has the content of " + (folder() / "in/a.mov").string());
        const Json tree = Dump("bin.aaf");
        EXPECT_EQ(tree["Mobs"].size(), 3u);
        for (const Json& mob : MobsOf(tree, "SourceMob")) {
            std::set<std::string> urls;
            Collect(mob, "URLString", urls);
            EXPECT_EQ(urls.size(), 2u) << mob;
        }
    }
    const CommandResult json =
        Cliphost("describe --json " + In("in") + " --bin " + In("bin.aaf") + " 2>/dev/null");
    const Json answer = Json::parse(json.out);
    EXPECT_FALSE(answer[0].contains("copyOf"));
    EXPECT_EQ(answer[1]["copyOf"], (folder() / "in/a.mov").string());
    EXPECT_EQ(answer[1]["aaf"], (folder() / "bin.aaf").string());
}

TEST_F(BinFile, TellsNoCopyOfAMovieThatIsNamedTwice) {
    Copy("a.mov");
    const CommandResult run = RunCliphost("describe -q " + In("in/a.mov") + " " + In("in/a.mov") +
                                          " --bin " + In("bin.aaf"));
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.out.find("has the content of"), std::string::npos) << run.out;
    const Json tree = Dump("bin.aaf");
    std::set<std::string> urls;
    Collect(tree, "URLString", urls);
    EXPECT_EQ(urls.size(), 1u);
}

TEST_F(BinFile, HoldsTheRestWhereAMovieFails) {
    Movie("a.mov", 1, 0, 10);
    std::ofstream(folder() / "in/b.mov") << "no movie at all";
    const CommandResult run = RunCliphost("describe -q " + In("in") + " --bin " + In("bin.aaf"));
    ExpectSays(run, 1, "1 described, 1 not");
    EXPECT_EQ(Dump("bin.aaf")["Mobs"].size(), 3u);
}

TEST_F(BinFile, IsNotWrittenWithoutAClip) {
    fs::create_directories(folder() / "in");
    std::ofstream(folder() / "in/b.mov") << "no movie at all";
    ExpectSays(RunCliphost("describe -q " + In("in/b.mov") + " --bin " + In("bin.aaf")), 1,
               "bin.aaf: not written: no movie was described");
    EXPECT_FALSE(fs::exists(folder() / "bin.aaf"));
    const CommandResult json =
        Cliphost("describe --json " + In("in/b.mov") + " --bin " + In("bin.aaf") + " 2>/dev/null");
    EXPECT_EQ(Json::parse(json.out)[1]["aaf"], (folder() / "bin.aaf").string());
}

TEST_F(BinFile, IsRefusedBeforeAnythingIsReadWhereItCanNotBeWritten) {
    Movie("a.mov", 1, 0, 10);
    const CommandResult run =
        RunCliphost("describe -q " + In("in") + " --bin " + In("no/folder/bin.aaf"));
    EXPECT_EQ(run.status, 2);
    EXPECT_NE(run.out.find("no/folder/bin.aaf: not written"), std::string::npos) << run.out;
    EXPECT_EQ(run.out.find("a.mov"), std::string::npos) << run.out;
}

TEST_F(BinFile, IsNeverWrittenOntoAMovie) {
    Movie("a.mov", 1, 0, 10);
    const movies::Bytes before = ReadFile(folder() / "in/a.mov");
    ExpectSays(RunCliphost("describe -q " + In("in") + " --bin " + In("in/a.mov")), 2,
               "this is the movie itself");
    EXPECT_TRUE(ReadFile(folder() / "in/a.mov") == before);
}

TEST_F(BinFile, TakesThePlaceOfAnOtherPlaceToSave) {
    for (const char* const other : {"--aaf x.aaf", "--out-dir x"}) {
        EXPECT_EQ(RunCliphost("describe x.mov --bin b.aaf " + std::string(other)).status, 2);
    }
    ExpectSays(RunCliphost("describe x.mov --stringout"), 2, "--stringout requires --bin");
    ExpectSays(RunCliphost("describe x.mov --json --bin -"), 2, "standard output takes the JSON");
}

TEST_F(BinFile, GoesToStandardOutput) {
    Movie("a.mov", 1, 0, 10);
    Movie("b.mov", 1, 0, 11);
    ASSERT_EQ(Cliphost("describe " + In("in") + " --bin - > " + In("bin.aaf")).status, 0);
    EXPECT_EQ(Dump("bin.aaf")["Mobs"].size(), 6u);
}

class Stringout : public BinFile {
protected:
    // The tracks of the sequence of all movies in the folder `in`.
    Json SequenceOf(const std::string& before = "") {
        EXPECT_EQ(
            RunCliphost(before + " describe -q " + In("in") + " --stringout --bin " + In("bin.aaf"))
                .status,
            0);
        const std::vector<Json> sequences = MobsOf(Dump("bin.aaf"), "CompositionMob");
        EXPECT_EQ(sequences.size(), 1u);
        return sequences.empty() ? Json() : sequences[0];
    }
};

TEST_F(Stringout, PutsAllClipsEndToEnd) {
    Movie("a.mov", 1, 1, 10);
    Movie("b.mov", 1, 2, 20);
    Movie("c.mov", 0, 1, 5);
    Movie("d.mov", 1, 0, 7);
    const Json sequence = SequenceOf();
    EXPECT_EQ(sequence["Name"], "\"bin\"");
    const Json& slots = sequence["Slots"];
    ASSERT_EQ(slots.size(), 6u) << "a picture, two sounds of two channels, timecode";
    using Parts = std::vector<std::string>;
    EXPECT_EQ(PartsOf(slots[0]), (Parts{"clip 10", "clip 20", "gap 5", "clip 7"}));
    EXPECT_EQ(PartsOf(slots[1]), (Parts{"clip 10", "clip 20", "clip 5", "gap 7"}));
    EXPECT_EQ(PartsOf(slots[2]), PartsOf(slots[1]));
    EXPECT_EQ(PartsOf(slots[3]), (Parts{"gap 10", "clip 20", "gap 12"}));
    EXPECT_EQ(slots[5]["Segment"][0]["Length"], "42");
    EXPECT_EQ(slots[5]["Segment"][0]["Start"], "90000") << "one hour";
    for (const Json& slot : slots) {
        EXPECT_EQ(slot["EditRate"], "25/1");
    }
}

TEST_F(Stringout, CountsInFramesOfTheEditor) {
    Movie("a.mov", 1, 0, 25);
    const Json slots = SequenceOf("--editor-rate 23.976")["Slots"];
    EXPECT_EQ(slots[0]["EditRate"], "24000/1001");
    EXPECT_EQ(PartsOf(slots[0]), std::vector<std::string>{"clip 23"}) << "never beyond the media";
    EXPECT_EQ(slots[1]["Segment"][0]["FPS"], "24");
}

TEST_F(Stringout, NamesAClipOnceThatHasCopies) {
    Copy("a.mov");
    Copy("b.mov");
    EXPECT_EQ(PartsOf(SequenceOf()["Slots"][0]).size(), 1u);
}

TEST_F(Stringout, RefersToTheClipsByTheirIdsAndSlots) {
    Movie("a.mov", 1, 0, 10);
    const Json sequence = SequenceOf();
    const Json master = MobsOf(Dump("bin.aaf"), "MasterMob").at(0);
    const Json& clip = sequence["Slots"][0]["Segment"][0]["Components"][0];
    EXPECT_EQ(clip["SourceID"], master["MobID"]);
    EXPECT_EQ(clip["StartTime"], "0");
    EXPECT_EQ(clip["DataDefinition"], master["Slots"][0]["Segment"][0]["DataDefinition"])
        << "pictures by the same name";
    std::set<std::string> pictures;
    for (const Json& slot : master["Slots"]) {
        if (slot["Segment"][0]["DataDefinition"].get<std::string>().find("Picture") !=
            std::string::npos) {
            pictures.insert(slot["SlotID"].get<std::string>());
        }
    }
    EXPECT_EQ(pictures.count(clip["SourceMobSlotID"]), 1u);
}

}  // namespace
