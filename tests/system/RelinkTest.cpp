// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Verbs that compare saved clips with the movies that they name.

#include <sys/stat.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <nlohmann/json.hpp>

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "reference_host/cliphost/AafLocators.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/cliphost/Bin.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/util/text/FileUrl.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

namespace fs = std::filesystem;
using cliphost::As;
using Json = nlohmann::ordered_json;
using Texts = std::vector<std::string>;

// What stands for the URLs of a tree, each replaced.
void TakeUrls(Json& tree, Texts& urls) {
    for (auto& [key, value] : tree.items()) {
        if (value.is_structured()) {
            TakeUrls(value, urls);
        } else if (key == "URLString") {
            urls.push_back(value.get<std::string>());
            value = "";
        }
    }
}

class SavedClips : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    std::string UrlOf(const std::string& name) {
        return host::text::FileUrl((folder() / name).string());
    }

    // A movie with a content of its own: frames of one byte's value.
    void Movie(const std::string& name, int frames, std::uint8_t byte = 1) {
        movies::Track pictures = movies::VideoTrack({}, static_cast<std::uint64_t>(frames), 25, 1);
        pictures.fill = byte;
        fs::create_directories((folder() / name).parent_path());
        Write(movies::Movie{{pictures, movies::SoundTrack({}, frames * 1920u)}}, name);
    }
    void Move(const std::string& from, const std::string& to) {
        fs::create_directories((folder() / to).parent_path());
        fs::rename(folder() / from, folder() / to);
    }
    void Remove(const std::string& name) { fs::remove(folder() / name); }

    // One file with the clips of the folder `in`.
    void Describe(const std::string& options = "") {
        const CommandResult run =
            RunCliphost(options + " describe -q " + In("in") + " --bin " + In("bin.aaf"));
        ASSERT_EQ(run.status, 0) << run.out;
    }
    std::string MapTo(const std::string& there) {
        return " --map " + Quoted((folder() / "in").string() + "=" + there);
    }
    Json AnswerOf(const std::string& arguments, int status) {
        const CommandResult run = RunCommand(Quoted(ProgramFolder() / "cliphost") + " " +
                                             arguments + " --json 2>/dev/null");
        EXPECT_EQ(run.status, status) << run.out;
        return Json::parse(run.out);
    }
    // The states of all clips, by name.
    std::map<std::string, std::string> StatesOf(const Json& answer) {
        std::map<std::string, std::string> states;
        for (const Json& file : answer["files"]) {
            for (const Json& clip : file["clips"]) {
                states[clip["name"]] = clip["state"];
            }
        }
        return states;
    }
    using States = std::map<std::string, std::string>;

    Json TreeOf(const std::string& file) { return AnswerOf("dump " + In(file), 0)["description"]; }
    // The URLs of a file, in the order of its mobs.
    Texts UrlsOf(const std::string& file) {
        Json tree = TreeOf(file);
        Texts urls;
        TakeUrls(tree, urls);
        return urls;
    }

    // A file with the clip of a movie, and with one of another maker that names a URL.
    // Where `isLedTo`, the first leads to the other's media as well.
    void SaveWithForeignClip(const std::string& movie, const std::string& url,
                             bool isLedTo = false) {
        cliphost::Bin bin(session().aaf());
        if (!movie.empty()) {
            const cliphost::Description description =
                cliphost::DescribeMovie(session(), folder() / movie);
            bin.Add(description.file.get(), movie);
        }
        AddForeignClip(bin.file(), url, isLedTo ? bin.clips().at(0).get() : nullptr);
        bin.Save(folder() / "bin.aaf");
    }

    // A file with one more place of each source mob, before its own.
    void AddPlace(const std::string& from, const std::string& to, const std::string& url) {
        session().aaf().SaveEdited(folder() / from, folder() / to, [&](IAAFFile* file) {
            host::Ref<IAAFHeader> header;
            host::Ref<IEnumAAFMobs> mobs;
            host::Ref<IAAFMob> mob;
            ASSERT_GE(file->GetHeader(header.Out()), 0);
            ASSERT_GE(header->GetMobs(nullptr, mobs.Out()), 0);
            while (mobs->NextOne(mob.Out()) >= 0) {
                cliphost::ForEachDescriptorOf(*mob, [&](IAAFEssenceDescriptor& descriptor) {
                    aafUInt32 count = 0;
                    descriptor.CountLocators(&count);
                    host::Ref<IAAFLocator> first;
                    if (count > 0 && descriptor.GetLocatorAt(0, first.Out()) >= 0) {
                        cliphost::AppendLocator(file, descriptor, cliphost::PathOf(*first));
                        cliphost::SetPath(*first, url);
                    }
                });
            }
        });
    }

private:
    template <class Interface>
    host::Ref<Interface> Made(IAAFDictionary& dictionary, const aafUID_t& id) {
        host::Ref<Interface> made;
        EXPECT_GE(dictionary.CreateInstance(id, aafIdOf(static_cast<Interface*>(nullptr)),
                                            reinterpret_cast<IUnknown**>(made.Out())),
                  0);
        return made;
    }

    void AddForeignClip(IAAFFile* file, const std::string& url, IAAFMob* leading) {
        host::Ref<IAAFHeader> header;
        host::Ref<IAAFDictionary> dictionary;
        host::Ref<IAAFDataDef> picture;
        ASSERT_GE(file->GetHeader(header.Out()), 0);
        ASSERT_GE(file->GetDictionary(dictionary.Out()), 0);
        ASSERT_GE(dictionary->LookupDataDef(kAAFDataDef_Picture, picture.Out()), 0);
        const auto source = Made<IAAFSourceMob>(*dictionary, AUID_AAFSourceMob);
        const auto master = Made<IAAFMasterMob>(*dictionary, AUID_AAFMasterMob);
        const auto descriptor = Made<IAAFEssenceDescriptor>(*dictionary, AUID_AAFImportDescriptor);
        ASSERT_GE(source->Initialize(), 0);
        ASSERT_GE(master->Initialize(), 0);
        cliphost::AppendLocator(file, *descriptor, url);
        ASSERT_GE(source->SetEssenceDescriptor(descriptor.get()), 0);
        const auto sourceMob = As<IAAFMob>(source.get());
        const auto masterMob = As<IAAFMob>(master.get());
        aafMobID_t id{};
        ASSERT_GE(sourceMob->GetMobID(&id), 0);
        ASSERT_GE(source->AddNilReference(1, 10, picture.get(), {25, 1}), 0);
        ASSERT_GE(master->NewPhysSourceRef({25, 1}, 1, picture.get(), {id, 1, 0}, 10), 0);
        ASSERT_GE(masterMob->SetName(L"foreign"), 0);
        aafCharacter category[] = L"Reel";
        ASSERT_GE(masterMob->AppendComment(category, L"A001"), 0);
        if (leading) {
            ASSERT_GE(As<IAAFMasterMob>(leading)->NewPhysSourceRef({25, 1}, 99, picture.get(),
                                                                   {id, 1, 0}, 10),
                      0);
        }
        ASSERT_GE(header->AddMob(masterMob.get()), 0);
        ASSERT_GE(header->AddMob(sourceMob.get()), 0);
    }
};

class VerifyVerb : public SavedClips {
protected:
    States StatesNow(const std::string& options, int status) {
        return StatesOf(AnswerOf("verify " + In("bin.aaf") + options, status));
    }
};

TEST_F(VerifyVerb, FindsNothingWhereAllIsAsItWas) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 20);
    Describe();
    const CommandResult run = RunCliphost("verify " + In("bin.aaf"));
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.out, "a: same: " + (folder() / "in/a.mov").string() + "\nb: same: " +
                           (folder() / "in/b.mov").string() + "\n2 clips: 2 same\n");
}

TEST_F(VerifyVerb, TellsWhatBecameOfEachClip) {
    for (const char* const name : {"a", "b", "c", "d", "e"}) {
        Movie("in/" + std::string(name) + ".mov", 10, static_cast<std::uint8_t>(name[0]));
    }
    Describe();
    Move("in/a.mov", "new/deep/renamed.MOV");
    Remove("in/b.mov");
    // One byte in the middle of the pictures, which is what a movie is known by.
    movies::Bytes bytes = ReadFile(folder() / "in/c.mov");
    const auto frame = std::search_n(bytes.begin(), bytes.end(), 1000, 'c');
    ASSERT_NE(frame, bytes.end());
    frame[500] = 0;
    Write(bytes, "in/c.mov");
    std::ofstream(folder() / "in/d.mov", std::ios::trunc) << "no movie at all";

    const Json answer = AnswerOf("verify " + In("bin.aaf") + " --search " + In("new"), 1);
    EXPECT_EQ(
        StatesOf(answer),
        (States{
            {"a", "moved"}, {"b", "missing"}, {"c", "changed"}, {"d", "unknown"}, {"e", "same"}}));
    const Json& clips = answer["files"][0]["clips"];
    EXPECT_EQ(answer["files"][0]["aaf"], (folder() / "bin.aaf").string());
    EXPECT_EQ(clips[0]["places"][0]["url"], UrlOf("in/a.mov"));
    EXPECT_EQ(clips[0]["places"][0]["path"], (folder() / "in/a.mov").string());
    EXPECT_EQ(clips[0]["places"][0]["state"], "missing");
    EXPECT_EQ(clips[0]["found"], Json({(folder() / "new/deep/renamed.MOV").string()}));
    EXPECT_EQ(clips[1]["places"][0]["reason"], "there is no such file or folder");
    EXPECT_EQ(clips[2]["places"][0]["reason"],
              "another movie is there, or its content has changed");
    EXPECT_NE(clips[3]["places"][0]["reason"].get<std::string>().find("can't be opened"),
              std::string::npos);
    EXPECT_EQ(clips[4]["places"][0]["reason"], Json());
    EXPECT_EQ(answer["counts"].dump(),
              R"({"clips":5,"same":1,"moved":1,"unknown":1,"missing":1,"changed":1,)"
              R"("unreadableFiles":0})");

    // A movie that can't be described is a state, not an error; whichever process reads it.
    std::set<std::string> texts;
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult run =
            RunCliphost("verify " + In("bin.aaf") + " --search " + In("new") + " --jobs " + jobs);
        EXPECT_EQ(run.status, 1);
        EXPECT_EQ(run.out.find("cliphost: "), std::string::npos) << run.out;
        EXPECT_NE(run.out.find("\n5 clips: 1 same, 1 moved, 1 unknown, 1 missing, 1 changed\n"),
                  std::string::npos)
            << run.out;
        EXPECT_NE(run.out.find("a: moved: " + (folder() / "in/a.mov").string() +
                               ": there is no such file or folder -> " +
                               (folder() / "new/deep/renamed.MOV").string() + "\n"),
                  std::string::npos)
            << run.out;
        texts.insert(run.out);
    }
    EXPECT_EQ(texts.size(), 1u);
}

TEST_F(VerifyVerb, LooksForNothingElsewhereUnlessItIsTold) {
    Movie("in/a.mov", 10);
    Describe();
    Move("in/a.mov", "new/a.mov");
    EXPECT_EQ(StatesNow("", 1), (States{{"a", "missing"}}));
}

TEST_F(VerifyVerb, TakesAClipForTheSameWhereAllItsPlacesAre) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 10);
    Describe();
    EXPECT_EQ(StatesNow("", 0), (States{{"a", "same"}}));
    Remove("in/a.mov");
    EXPECT_EQ(StatesNow("", 1), (States{{"a", "moved"}}));
    ExpectSays(RunCliphost("verify " + In("bin.aaf")), 1,
               "; it is at " + (folder() / "in/b.mov").string());
    Remove("in/b.mov");
    EXPECT_EQ(StatesNow("", 1), (States{{"a", "missing"}}));
}

TEST_F(VerifyVerb, TakesNothingAgainstAClipFromAPlaceThatItCanNotCheck) {
    Movie("in/a.mov", 10);
    Describe();
    AddPlace("bin.aaf", "more.aaf", "file://server/share/a.mov");
    ExpectSays(RunCliphost("verify " + In("more.aaf")), 0,
               "a: same: " + (folder() / "in/a.mov").string() +
                   "; file://server/share/a.mov: this is a place of another machine");
}

TEST_F(VerifyVerb, TellsTheReasonBesideThePlaceThatItIsAbout) {
    Movie("in/a.mov", 10);
    Describe();
    fs::copy_file(folder() / "in/a.mov", folder() / "b.mov");
    AddPlace("bin.aaf", "more.aaf", UrlOf("gone.mov"));
    const std::string gone =
        "a: moved: " + (folder() / "gone.mov").string() + ": there is no such file or folder";
    ExpectSays(RunCliphost("verify " + In("more.aaf")), 1,
               gone + "; it is at " + (folder() / "in/a.mov").string() + "\n");
    fs::remove(folder() / "in/a.mov");
    ExpectSays(RunCliphost("verify " + In("more.aaf") + " --search " + In("")), 1,
               " -> " + (folder() / "b.mov").string() + "\n");
}

TEST_F(VerifyVerb, TellsWhichFactsAreOthers) {
    fs::create_directory(folder() / "in");
    Write(movies::Movie{{movies::SoundTrack({}, 48000)}}, "in/a.mov");
    Describe("--editor-rate 50");
    const Json answer = AnswerOf("verify " + In("bin.aaf"), 1);
    EXPECT_EQ(StatesOf(answer), (States{{"a", "changed"}}));
    EXPECT_EQ(answer["files"][0]["clips"][0]["places"][0]["reason"],
              "rate 50/1 -> 25/1 in slots 3, 4; length 50 -> 25 in slots 3, 4");
    EXPECT_EQ(StatesOf(AnswerOf("--editor-rate 50 verify " + In("bin.aaf"), 0)),
              (States{{"a", "same"}}))
        << "with the settings of the description";
    // Its content is where the file says.
    ExpectSays(
        RunCliphost("relink " + In("bin.aaf") + " --search " + In("in") + " -o " + In("out.aaf")),
        0, "a: in its place, but described otherwise now: rate 50/1 -> 25/1");
}

TEST_F(VerifyVerb, SeesThePlacesOfAnotherMachineThroughMaps) {
    Movie("in/a b.mov", 10);
    for (const char* const there : {"//server/media", "M:", "/Volumes/x"}) {
        ASSERT_EQ(RunCliphost("describe -q " + In("in/a b.mov") + MapTo(there) + " --aaf " +
                              In("bin.aaf"))
                      .status,
                  0);
        EXPECT_EQ(StatesNow(MapTo(there), 0), (States{{"a b", "same"}})) << there;
        const bool isPathHere = there[0] == '/' && there[1] != '/';
        EXPECT_EQ(StatesNow("", 1), (States{{"a b", isPathHere ? "missing" : "unknown"}})) << there;
    }
    const CommandResult unused =
        RunCliphost("verify " + In("bin.aaf") + MapTo("/Volumes/x") + MapTo("Z:"));
    ExpectSays(unused, 2, "=Z:: nothing was mapped by it");
    ExpectSays(unused, 2, "1 clip: 1 same");
}

TEST_F(VerifyVerb, TellsNothingOfTheContentOfOtherMakersClips) {
    Movie("in/a.mov", 10);
    SaveWithForeignClip("in/a.mov", UrlOf("in/a.mov"));
    EXPECT_EQ(StatesNow("", 0), (States{{"a", "same"}, {"foreign", "unknown"}}));
    ExpectSays(RunCliphost("verify " + In("bin.aaf")), 0, "2 clips: 1 same, 1 unknown");
    Remove("in/a.mov");
    EXPECT_EQ(StatesNow("", 1), (States{{"a", "missing"}, {"foreign", "missing"}}));
}

TEST_F(VerifyVerb, DoesNotGuessWhatIsNoFileOfThisMachine) {
    for (const char* const url : {"http://server/a.mov", "", "/plain/a.mov", "file://s/m/a.mov",
                                  "file:////s/m/a.mov", "file:///C:/a.mov", "file:///a%zz.mov"}) {
        SaveWithForeignClip("", url);
        const Json answer = AnswerOf("verify " + In("bin.aaf"), 0);
        EXPECT_EQ(StatesOf(answer), (States{{"foreign", "unknown"}})) << url;
        const Json& place = answer["files"][0]["clips"][0]["places"][0];
        EXPECT_EQ(place["path"], Json()) << url;
        EXPECT_NE(place["reason"], Json()) << url;
    }
}

TEST_F(VerifyVerb, OpensNothingButFiles) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 11);
    Describe();
    Remove("in/a.mov");
    Remove("in/b.mov");
    fs::create_directory(folder() / "in/a.mov");
    ASSERT_EQ(mkfifo((folder() / "in/b.mov").c_str(), 0600), 0);
    const Json answer = AnswerOf("verify " + In("bin.aaf"), 1);
    EXPECT_EQ(StatesOf(answer), (States{{"a", "unknown"}, {"b", "unknown"}}));
    EXPECT_EQ(answer["files"][0]["clips"][0]["places"][0]["reason"], "this is a folder");
    EXPECT_EQ(answer["files"][0]["clips"][1]["places"][0]["reason"],
              "this is not a file but a pipe");
}

TEST_F(VerifyVerb, TellsTheFaultsOfFilesApart) {
    Movie("in/a.mov", 10);
    Describe();
    movies::Bytes bytes = ReadFile(folder() / "bin.aaf");
    bytes.resize(bytes.size() / 2);
    Write(bytes, "short.aaf");
    const CommandResult run = RunCliphost("verify " + In("short.aaf") + " " + In("bin.aaf"));
    ExpectSays(run, 1, "short.aaf: can't be read as AAF");
    ExpectSays(run, 1, "\n1 clip: 1 same; 1 AAF file can't be read\n");
    ExpectSays(RunCliphost("verify " + In("none.aaf") + " " + In("bin.aaf")), 2,
               "none.aaf: there is no such file");
    ExpectSays(RunCliphost("verify " + In("in")), 2, "this is a folder; give an AAF file in it");
    const Json answer = AnswerOf("verify " + In("short.aaf") + " " + In("bin.aaf"), 1);
    EXPECT_NE(answer["files"][0]["reason"], Json());
    EXPECT_EQ(answer["files"][0]["clips"], Json::array());
    EXPECT_FALSE(answer["files"][1].contains("reason"));
    EXPECT_EQ(answer["counts"]["unreadableFiles"], 1);
    ExpectSays(RunCliphost("verify " + In("bin.aaf") + " --search " + In("none")), 2,
               "none: there is no such file or folder");
}

class RelinkVerb : public SavedClips {
protected:
    std::string Call(const std::string& options = "", const std::string& output = "out.aaf") {
        return "relink " + In("bin.aaf") + " --search " + In("new") + " -o " + In(output) + " " +
               options;
    }
    Texts Twice(const Texts& urls) {
        Texts quoted;
        for (int i = 0; i < 2; ++i) {
            for (const std::string& url : urls) {
                quoted.push_back("\"" + url + "\"");
            }
        }
        return quoted;
    }
};

TEST_F(RelinkVerb, FindsAFolderThatWasMoved) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 20);
    Describe();
    Move("in", "new/place");
    ExpectSays(RunCliphost("verify " + In("bin.aaf")), 1, "2 clips: 2 missing");
    const CommandResult run = RunCliphost(Call());
    ExpectSays(run, 0, "a -> " + (folder() / "new/place/a.mov").string() + "\n");
    ExpectSays(run, 0, "out.aaf: 2 clips relinked, 0 not matched, 0 in place\n");
    ExpectSays(RunCliphost("verify " + In("out.aaf")), 0, "2 clips: 2 same");
    EXPECT_EQ(UrlsOf("out.aaf"), Twice({UrlOf("new/place/a.mov"), UrlOf("new/place/b.mov")}));
}

TEST_F(RelinkVerb, SearchesFoldersBehindLinksOnce) {
    Movie("in/a.mov", 10);
    Describe();
    Move("in/a.mov", "elsewhere/a.mov");
    fs::create_directories(folder() / "new");
    fs::create_directory_symlink(folder() / "elsewhere", folder() / "new/link");
    fs::create_directory_symlink(folder() / "new", folder() / "elsewhere/round");
    const CommandResult ran = RunCliphost(Call());
    ExpectSays(ran, 0, "a -> " + (folder() / "new/link/a.mov").string() + "\n");
}

TEST_F(RelinkVerb, LeavesAllElseAsItIs) {
    Movie("in/a.mov", 10);
    Movie("new/other.mov", 20);
    SaveWithForeignClip("in/a.mov", UrlOf("in/foreign.mov"));
    Movie("new/foreign.mov", 30);
    Move("in/a.mov", "new/a.mov");
    ExpectSays(RunCliphost(Call()), 0,
               "1 clip relinked, 0 not matched, 0 in place, 1 clip of "
               "other makers untouched");
    Json before = TreeOf("bin.aaf");
    Json after = TreeOf("out.aaf");
    Texts urlsBefore;
    Texts urlsAfter;
    TakeUrls(before, urlsBefore);
    TakeUrls(after, urlsAfter);
    EXPECT_EQ(before, after);
    ASSERT_EQ(urlsBefore.size(), 3u);
    std::replace(urlsBefore.begin(), urlsBefore.end(), "\"" + UrlOf("in/a.mov") + "\"",
                 "\"" + UrlOf("new/a.mov") + "\"");
    EXPECT_EQ(urlsBefore, urlsAfter);
}

TEST_F(RelinkVerb, LeavesOtherMakersMediaOfAClipOfOursAsItIs) {
    Movie("in/a.mov", 10);
    SaveWithForeignClip("in/a.mov", UrlOf("in/foreign.mov"), true);
    Move("in/a.mov", "new/a.mov");
    ExpectSays(RunCliphost(Call()), 0, "1 clip relinked");
    Texts urls = UrlsOf("out.aaf");
    std::sort(urls.begin(), urls.end());
    Texts expected = Twice({UrlOf("new/a.mov")});
    expected.insert(expected.begin(), "\"" + UrlOf("in/foreign.mov") + "\"");
    EXPECT_EQ(urls, expected);
}

TEST_F(RelinkVerb, KeepsWhatItCanNotCheckBesideWhatItCan) {
    Movie("in/a.mov", 10);
    Describe();
    fs::copy_file(folder() / "bin.aaf", folder() / "first.aaf");
    AddPlace("first.aaf", "bin.aaf", "file://server/media/a.mov");
    Move("in/a.mov", "new/a.mov");
    EXPECT_EQ(RunCliphost(Call()).status, 0);
    EXPECT_EQ(UrlsOf("out.aaf"), Twice({"file://server/media/a.mov", UrlOf("new/a.mov")}));
}

TEST_F(RelinkVerb, MayWriteTheFileItself) {
    Movie("in/a.mov", 10);
    Describe();
    Move("in", "new");
    EXPECT_EQ(RunCliphost(Call("", "bin.aaf")).status, 0);
    EXPECT_EQ(RunCliphost("verify " + In("bin.aaf")).status, 0);
    std::set<std::string> names;
    for (const auto& entry : fs::directory_iterator(folder())) {
        names.insert(entry.path().filename().string());
    }
    EXPECT_EQ(names, (std::set<std::string>{"bin.aaf", "new"}));
}

TEST_F(RelinkVerb, WritesPlacesAsTheOtherMachineSeesThem) {
    Movie("in/a b.mov", 10);
    const struct {
        const char* there;
        const char* url;
    } maps[] = {{"//server/media", "file://server/media/new/a%20b.mov"},
                {"M:", "file:///M:/new/a%20b.mov"}};
    for (const auto& map : maps) {
        const std::string option =
            " --map " + Quoted(folder().string() + "=" + std::string(map.there));
        ASSERT_EQ(
            RunCliphost("describe -q " + In("in/a b.mov") + option + " --aaf " + In("bin.aaf"))
                .status,
            0);
        Move("in/a b.mov", "new/a b.mov");
        ExpectSays(RunCliphost(Call(option)), 0, ", written as " + std::string(map.url));
        EXPECT_EQ(UrlsOf("out.aaf"), Twice({map.url}));
        EXPECT_EQ(RunCliphost("verify " + In("out.aaf") + option).status, 0);
        Move("new/a b.mov", "in/a b.mov");
    }
}

TEST_F(RelinkVerb, TakesTheFirstOfSeveralCopiesAndTellsTheRest) {
    Movie("in/a.mov", 10);
    Describe();
    Move("in/a.mov", "new/2/a.mov");
    fs::create_directories(folder() / "new/1");
    fs::copy_file(folder() / "new/2/a.mov", folder() / "new/1/z.mov");
    ExpectSays(RunCliphost(Call()), 0,
               "a -> " + (folder() / "new/1/z.mov").string() + "; the same content is in " +
                   (folder() / "new/2/a.mov").string() + "\n");
    EXPECT_EQ(UrlsOf("out.aaf"), Twice({UrlOf("new/1/z.mov")}));
}

TEST_F(RelinkVerb, FindsTheCopyThatMovedWhereAnotherStays) {
    Movie("in/a.mov", 10);
    fs::copy_file(folder() / "in/a.mov", folder() / "in/b.mov");
    Describe();
    Move("in/a.mov", "new/c.mov");
    const CommandResult run = RunCliphost(Call());
    ExpectSays(run, 0, "a -> " + (folder() / "new/c.mov").string());
    EXPECT_EQ(run.out.find("removed"), std::string::npos) << run.out;
    const Texts urls = UrlsOf("out.aaf");
    for (const char* const name : {"new/c.mov", "in/b.mov"}) {
        EXPECT_EQ(std::count(urls.begin(), urls.end(), '"' + UrlOf(name) + '"'), 2) << name;
    }
    EXPECT_EQ(urls.size(), 4u);
}

TEST_F(RelinkVerb, IsNeverWrittenOntoWhatIsNoAafFile) {
    Movie("in/a.mov", 10);
    Describe();
    Movie("new/z.mov", 30);
    Write(movies::Bytes{'n', 'o'}, "new/notes.txt");
    for (const char* const file : {"new/z.mov", "new/notes.txt"}) {
        const movies::Bytes before = ReadFile(folder() / file);
        ExpectSays(RunCliphost(Call("", file)), 2, "there is a file that is no AAF file");
        EXPECT_TRUE(ReadFile(folder() / file) == before) << file;
    }
    Write(movies::Bytes{}, "empty.aaf");
    EXPECT_EQ(RunCliphost(Call("", "empty.aaf")).status, 0) << "as mktemp leaves it";
}

TEST_F(RelinkVerb, RemovesPlacesThatLeadNowhere) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 10);
    Describe();
    EXPECT_EQ(UrlsOf("bin.aaf").size(), 4u);
    Remove("in/a.mov");
    fs::create_directory(folder() / "new");
    ExpectSays(RunCliphost(Call()), 0, "a: 1 place removed that does not lead to it");
    EXPECT_EQ(UrlsOf("out.aaf"), Twice({UrlOf("in/b.mov")}));
    // Where none of two leads there, one of them is left.
    Move("in/b.mov", "new/c.mov");
    EXPECT_EQ(RunCliphost(Call()).status, 0);
    EXPECT_EQ(UrlsOf("out.aaf"), Twice({UrlOf("new/c.mov")}));
}

TEST_F(RelinkVerb, PutsMoviesRightThatChangedPlaces) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 20);
    Describe();
    Move("in/a.mov", "in/x.mov");
    Move("in/b.mov", "in/a.mov");
    Move("in/x.mov", "in/b.mov");
    const CommandResult run =
        RunCliphost("relink " + In("bin.aaf") + " --search " + In("in") + " -o " + In("out.aaf"));
    ExpectSays(run, 0, "2 clips relinked");
    EXPECT_EQ(UrlsOf("out.aaf"), Twice({UrlOf("in/b.mov"), UrlOf("in/a.mov")}));
}

TEST_F(RelinkVerb, TellsWhatItCouldNotMatch) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 20);
    Movie("in/c.mov", 30);
    Describe();
    Move("in/a.mov", "new/a.mov");
    Remove("in/b.mov");
    Movie("new/b.mov", 21);
    std::ofstream(folder() / "new/d.mov") << "no movie at all";
    const CommandResult run = RunCliphost(Call());
    ExpectSays(run, 1,
               "b: not matched: no movie in the folders has its content; " + UrlOf("in/b.mov") +
                   ": there is no such file");
    ExpectSays(run, 1,
               "1 clip relinked, 1 not matched, 1 in place; 1 file in the folders could "
               "not be described");
    EXPECT_EQ(UrlsOf("out.aaf"), Twice({UrlOf("new/a.mov"), UrlOf("in/b.mov"), UrlOf("in/c.mov")}));
    const Json answer = AnswerOf(Call(), 1);
    EXPECT_EQ(answer["aaf"], (folder() / "bin.aaf").string());
    EXPECT_EQ(answer["output"], (folder() / "out.aaf").string());
    EXPECT_EQ(answer["clips"][0]["state"], "relinked");
    EXPECT_EQ(answer["clips"][0]["url"], UrlOf("new/a.mov"));
    EXPECT_EQ(answer["clips"][0]["found"], Json({(folder() / "new/a.mov").string()}));
    EXPECT_EQ(answer["clips"][0]["strays"], Json({UrlOf("in/a.mov")}));
    EXPECT_EQ(answer["clips"][1]["state"], "not matched");
    EXPECT_EQ(answer["clips"][1]["url"], Json());
    EXPECT_EQ(answer["clips"][2]["state"], "in place");
    EXPECT_EQ(answer["counts"]["clips"], 3);
    EXPECT_EQ(answer["counts"]["not matched"], 1);
}

TEST_F(RelinkVerb, WritesTheFileAsItWasWhereNothingIsToDo) {
    Movie("in/a.mov", 10);
    Describe();
    fs::create_directory(folder() / "new");
    ExpectSays(RunCliphost(Call()), 0, "nothing to relink, written as it was");
    EXPECT_TRUE(ReadFile(folder() / "out.aaf") == ReadFile(folder() / "bin.aaf"));
}

TEST_F(RelinkVerb, DoesTheSameInOneProcessAndInSeveral) {
    for (int i = 0; i < 4; ++i) {
        Movie("in/" + std::to_string(i) + ".mov", 10 + i);
    }
    Describe();
    Move("in", "new");
    std::vector<movies::Bytes> files;
    std::set<std::string> texts;
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult run =
            RunCliphost(Call("--pin-time 2026-01-31T12:00:00Z --jobs " + std::string(jobs)));
        EXPECT_EQ(run.status, 0) << run.out;
        texts.insert(run.out);
        files.push_back(ReadFile(folder() / "out.aaf"));
    }
    EXPECT_TRUE(files[0] == files[1]);
    EXPECT_EQ(texts.size(), 1u);
}

TEST_F(RelinkVerb, IsNeverWrittenOntoAMovie) {
    Movie("in/a.mov", 10);
    Movie("in/b.mov", 20);
    Describe();
    Move("in/a.mov", "new/a.mov");
    Movie("new/c.mov", 30);
    for (const char* const movie : {"new/a.mov", "in/b.mov", "new/c.mov"}) {
        const movies::Bytes before = ReadFile(folder() / movie);
        ExpectSays(RunCliphost(Call("", movie)), 2, "this is the movie itself");
        EXPECT_TRUE(ReadFile(folder() / movie) == before) << movie;
    }
}

TEST_F(RelinkVerb, WritesNothingWhereItCanNotBegin) {
    Movie("in/a.mov", 10);
    Describe();
    fs::create_directory(folder() / "new");
    movies::Bytes bytes = ReadFile(folder() / "bin.aaf");
    bytes.resize(bytes.size() / 2);
    Write(bytes, "short.aaf");
    const std::string search = " --search " + In("new");
    const std::string output = " -o " + In("out.aaf");
    ExpectSays(RunCliphost("relink " + In("short.aaf") + search + output), 1,
               "short.aaf: can't be read as AAF");
    ExpectSays(RunCliphost("relink " + In("none.aaf") + search + output), 2,
               "none.aaf: there is no such file");
    Move("in/a.mov", "b.mov");
    ExpectSays(RunCliphost("relink " + In("bin.aaf") + output + " --search " + In("none")), 2,
               "none: there is no such file or folder");
    EXPECT_FALSE(fs::exists(folder() / "out.aaf"));
    ExpectSays(RunCliphost("relink " + In("bin.aaf") + output), 2, "--search is required");
    ExpectSays(RunCliphost(Call("", "no/folder/out.aaf")), 2, "no/folder/out.aaf: not written");
}

TEST_F(RelinkVerb, GoesToStandardOutput) {
    Movie("in/a.mov", 10);
    Describe();
    Move("in", "new");
    ASSERT_EQ(RunCommand(Quoted(ProgramFolder() / "cliphost") + " relink " + In("bin.aaf") +
                         " --search " + In("new") + " -o - 2>/dev/null > " + In("out.aaf"))
                  .status,
              0);
    EXPECT_EQ(UrlsOf("out.aaf"), Twice({UrlOf("new/a.mov")}));
    ExpectSays(RunCliphost("relink " + In("bin.aaf") + " --search " + In("new") + " --json -o -"),
               2, "standard output takes the JSON");
}

}  // namespace
