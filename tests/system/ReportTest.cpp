// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What `report` tells of movies, what it writes, and what becomes of it where it can't.

#include <cmath>
#include <fstream>
#include <functional>
#include <map>
#include <nlohmann/json.hpp>
#include <regex>
#include <set>
#include <sstream>

#include "reference_host/report/PageText.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using Json = nlohmann::ordered_json;

std::string TextOfFile(const std::filesystem::path& file) {
    std::ostringstream text;
    text << std::ifstream(file, std::ios::binary).rdbuf();
    return text.str();
}

class Reports : public SystemTest {
protected:
    void Copy(const std::string& made, const std::string& name) {
        std::filesystem::create_directories((folder() / name).parent_path());
        std::filesystem::copy_file(MadeMovie(made), folder() / name,
                                   std::filesystem::copy_options::overwrite_existing);
    }
    // The program in the test's folder; both streams.
    CommandResult Run(const std::string& arguments) {
        return RunCommand("cd " + Quoted(folder()) + " && " + Quoted(ProgramFolder() / "cliphost") +
                          " report " + arguments + " 2>&1");
    }
    // What is printed as JSON; what is told on standard error goes.
    Json Report(const std::string& arguments) {
        const CommandResult result =
            RunCommand("cd " + Quoted(folder()) + " && " + Quoted(ProgramFolder() / "cliphost") +
                       " report --json " + arguments + " 2>/dev/null");
        status = result.status;
        const Json report = Json::parse(result.out, nullptr, false);
        EXPECT_TRUE(report.is_object() && report.contains("clips")) << result.out.substr(0, 500);
        return report;
    }
    Json ClipOf(const std::filesystem::path& movie, const std::string& options = "") {
        const Json report = Report(Quoted(movie) + " " + options);
        return report["clips"].size() == 1 ? report["clips"][0] : Json::object();
    }
    void MakeCatalog(const std::string& of, const std::string& options = "") {
        const CommandResult made =
            RunCommand("cd " + Quoted(folder()) + " && " + Quoted(ProgramFolder() / "cliphost") +
                       " catalog " + of + " -o c.sqlite " + options + " 2>&1");
        ASSERT_TRUE(std::filesystem::exists(folder() / "c.sqlite")) << made.out;
    }
    std::set<std::string> FilesIn(const std::string& name) {
        std::set<std::string> files;
        for (const auto& entry : std::filesystem::directory_iterator(folder() / name)) {
            files.insert(entry.path().filename().string());
        }
        return files;
    }

    // Of each file of a folder.
    std::map<std::string, std::string> ContentOf(const std::string& name) {
        std::map<std::string, std::string> content;
        for (const std::string& file : FilesIn(name)) {
            content[file] = TextOfFile(folder() / name / file);
        }
        return content;
    }

    int status = -1;
};

// "00001-strip-0f3a52b1c9d4.webp" as "00001-strip.webp".
std::set<std::string> WithoutDigests(const std::set<std::string>& files) {
    std::set<std::string> names;
    for (const std::string& file : files) {
        names.insert(std::regex_replace(file, std::regex("-[0-9a-f]{12}\\."), "."));
    }
    return names;
}

std::set<std::string> PicturesOf(const std::vector<int>& clips) {
    std::set<std::string> names;
    for (const int clip : clips) {
        names.insert("0000" + std::to_string(clip) + "-poster.webp");
        names.insert("0000" + std::to_string(clip) + "-strip.webp");
    }
    return names;
}

std::set<std::string> TraitsOf(const Json& clip) {
    std::set<std::string> ids;
    for (const Json& trait : clip["traits"]) {
        ids.insert(trait["id"].get<std::string>());
    }
    return ids;
}

std::string WordsOf(const Json& clip, const std::string& trait) {
    for (const Json& one : clip["traits"]) {
        if (one["id"] == trait) {
            return one["words"];
        }
    }
    return {};
}

TEST_F(Reports, TellWhatAMovieIs) {
    const Json clip = ClipOf(MadeMovie("h264_with_aac.mov"));
    EXPECT_EQ(status, 0);
    EXPECT_EQ(clip["name"], "h264_with_aac");
    EXPECT_EQ(clip["codecName"], "H.264");
    EXPECT_EQ(clip["rate"], "25/1");
    EXPECT_EQ(clip["length"], 10);
    EXPECT_EQ(clip["seconds"], 0.4);
    EXPECT_EQ(clip["channels"], 2);
    EXPECT_EQ(clip["size"], std::filesystem::file_size(MadeMovie("h264_with_aac.mov")));
    EXPECT_EQ(clip["failed"], false);
    const Json& details = clip["details"];
    EXPECT_EQ(details["tracks"].size(), 2u);
    EXPECT_EQ(details["description"]["Mobs"].size(), 3u);
    EXPECT_EQ(details["strip"]["frames"].size(), 10u);
    EXPECT_EQ(details["waves"].size(), 1u);
    EXPECT_FALSE(details["parameters"].empty());
    EXPECT_FALSE(details["columns"].empty());
}

TEST_F(Reports, AreThoseOfOneProcessWhateverTheNumberOfProcesses) {
    for (const char* const name : {"h264_with_aac", "rotated_270", "pcm_u8"}) {
        Copy(std::string(name) + ".mov", std::string("in/") + name + ".mov");
    }
    std::ofstream(folder() / "in/none.mov") << std::string(1000, 'x');
    Json one = Report("in --jobs 1");
    Json two = Report("in --jobs 2");
    for (Json* const report : {&one, &two}) {
        report->erase("made");
        for (Json& clip : (*report)["clips"]) {
            for (Json& mob : clip["details"]["description"]["Mobs"]) {
                mob.erase("CreationTime");
                mob.erase("LastModified");
            }
        }
    }
    EXPECT_TRUE(one == two);
    EXPECT_EQ(one["clips"].size(), 4u);
}

TEST_F(Reports, NumberFramesAsTheMovieDoes) {
    const Json frames = ClipOf(MadeMovie("timecode_2997_drop.mov"))["details"]["strip"]["frames"];
    ASSERT_FALSE(frames.empty());
    EXPECT_EQ(frames[0]["frame"], 0);
    EXPECT_EQ(frames[0]["timecode"], "01:00:00;00");
}

TEST_F(Reports, TurnPicturesAsTheMovieIsShown) {
    const auto turned =
        Make("-f lavfi -i testsrc2=size=320x180:rate=25:duration=0.2 -c:v mpeg4", "flat.mov");
    ASSERT_EQ(RunCommand("ffmpeg -nostdin -v error -display_rotation 90 -i " + Quoted(turned) +
                         " -c copy " + Quoted(folder() / "turned.mov") +
                         " 2>&1; ffmpeg -nostdin "
                         "-v error -y -i " +
                         Quoted(turned) + " -c copy -metadata:s:v rotate=90 " +
                         Quoted(folder() / "turned.mov"))
                  .status,
              0);
    const Json poster = ClipOf(folder() / "turned.mov")["poster"];
    EXPECT_LT(poster["width"].get<int>(), poster["height"].get<int>());
    const Json flat = ClipOf(turned)["poster"];
    EXPECT_GT(flat["width"].get<int>(), flat["height"].get<int>());
    EXPECT_EQ(WordsOf(ClipOf(folder() / "turned.mov"), "rotated").substr(0, 10), "rotated by");
}

TEST_F(Reports, TellGroupsOfPicturesAndTheirSizes) {
    const Json clip =
        ClipOf(Make("-f lavfi -i testsrc2=size=64x64:rate=25:duration=0.8 -c:v mpeg4 "
                    "-g 5 -bf 0 -sc_threshold 1000000000",
                    "groups.mov"));
    const Json track = clip["details"]["samples"]["tracks"][0];
    EXPECT_EQ(track["samples"], 20);
    EXPECT_EQ(track["groups"].dump(), R"({"count":4,"shortest":5,"longest":5,"mean":5.0})");
    std::uint64_t sum = 0;
    for (const Json& size : track["sizes"]) {
        sum += size.get<std::uint64_t>();
    }
    EXPECT_EQ(sum, track["bytes"].get<std::uint64_t>());  // as many columns as samples
}

// FFmpeg's sine has an eighth of the most.
TEST_F(Reports, TellHowLoudSoundIs) {
    const Json wave =
        ClipOf(Make("-f lavfi -i sine=frequency=440:sample_rate=48000:duration=1 -c:a "
                    "pcm_s24be",
                    "sine.mov"))["details"]["waves"][0];
    EXPECT_NEAR(wave["highest"].get<double>(), -18.06, 0.02);
    EXPECT_EQ(wave["peaks"].size(), 240u);
    EXPECT_NEAR(wave["peaks"][100].get<int>(), 255 * std::sqrt(1 / 8.0), 1);
    // A column holds no whole number of waves.
    EXPECT_NEAR(wave["means"][100].get<int>(), 255 * std::sqrt(std::sqrt(0.5) / 8), 3);
    EXPECT_NEAR(wave["seconds"].get<double>(), 1.0, 0.05);
}

TEST_F(Reports, TellSilence) {
    const Json silent =
        ClipOf(Make("-f lavfi -i anullsrc=r=48000:cl=mono -t 1 -c:a pcm_s16be", "s.mov"));
    EXPECT_EQ(TraitsOf(silent).count("silent"), 1u);
    EXPECT_FALSE(silent["details"]["waves"][0].contains("highest"));
    EXPECT_EQ(TraitsOf(ClipOf(MadeMovie("h264_with_aac.mov"))).count("silent"), 0u);
}

// Sound of half an hour and a bit, which is silent but for a moment. Its bytes are holes, mostly.
movies::Movie LongSound(std::uint64_t loudSample) {
    constexpr std::uint64_t kSamples = 96'000'000;  // 240 columns of 400,000
    movies::SoundFormat format;
    format.channels = 1;
    movies::Movie movie;
    movie.tracks = {movies::SoundTrack(format, kSamples)};
    movie.largeMedia = true;
    movies::Track& track = movie.tracks[0];
    track.data.assign(static_cast<std::size_t>(loudSample + 1) * 2, 0);
    track.data.back() = 0x40;
    return movie;
}

TEST_F(Reports, LookAtLongSoundInPieces) {
    const Json wave = ClipOf(Write(LongSound(16'383), "piece.mov"))["details"]["waves"][0];
    EXPECT_EQ(wave["isWhole"], false);
    EXPECT_EQ(wave["lacksSamples"], false);
    EXPECT_NEAR(wave["seconds"].get<double>(), 2000, 1);
    ASSERT_EQ(wave["peaks"].size(), 240u);
    EXPECT_EQ(wave["peaks"][0], std::lround(255 * std::sqrt(0.5)));
    EXPECT_EQ(wave["peaks"][1], 0);
}

TEST_F(Reports, CallNoSoundSilentThatWasLookedAtInPieces) {
    const Json clip = ClipOf(Write(LongSound(16'384), "between.mov"));
    const Json& wave = clip["details"]["waves"][0];
    EXPECT_EQ(wave["isWhole"], false);
    EXPECT_FALSE(wave.contains("highest"));
    EXPECT_EQ(TraitsOf(clip).count("silent"), 0u);
}

TEST_F(Reports, CallNoSoundSilenceThatWasNotLookedAt) {
    const std::string silence = "-f lavfi -t 0.2 -i anullsrc=r=48000:cl=mono ";
    const std::string sine = "-f lavfi -i sine=sample_rate=48000:duration=0.2 ";
    std::string sixteen;
    for (int track = 0; track < 16; ++track) {
        sixteen += "-map 0 ";
    }
    const Json many = ClipOf(Make(silence + sine + sixteen + "-map 1 -c:a pcm_s16be", "many.mov"));
    EXPECT_EQ(many["details"]["waves"].size(), 16u);
    EXPECT_EQ(TraitsOf(many).count("silent"), 0u);

    const auto made =
        Make(silence + sine + "-map 0 -map 1 -c:a:0 pcm_s16be -c:a:1 adpcm_ima_qt", "two.mov");
    std::string movie = TextOfFile(made);
    const std::string code = "ima4";
    for (std::size_t at = movie.find(code); at != std::string::npos; at = movie.find(code, at)) {
        movie.replace(at, code.size(), "xyz1");
    }
    std::ofstream(made, std::ios::binary) << movie;
    const Json unread = ClipOf(made);
    EXPECT_EQ(unread["details"]["waves"].size(), 1u);
    EXPECT_EQ(TraitsOf(unread).count("silent"), 0u);
}

TEST_F(Reports, TellWhyTheModuleServesMedia) {
    EXPECT_EQ(WordsOf(ClipOf(MadeMovie("pcm_u8.mov")), "provider"),
              "audio track 1: An audio bit rate of 8 was found but only bit rates of 16 and 24 are "
              "natively supported.");
    EXPECT_EQ(WordsOf(ClipOf(MadeMovie("prores_hq_1080i.mov")), "provider"), "");
}

TEST_F(Reports, TellWhatIsOddTogether) {
    Copy("timecode_25.mov", "in/a.mov");
    Copy("timecode_25.mov", "in/b.mov");
    Copy("timecode_2997_drop.mov", "in/c.mov");
    Copy("timecode_2997_nondrop.mov", "in/d.mov");
    std::set<std::string> ids;
    const Json report = Report("in");
    for (const Json& finding : report["odd"]) {
        ids.insert(finding["id"].get<std::string>());
        if (finding["id"] == "copies") {
            EXPECT_EQ(finding["groups"][0]["clips"].dump(), "[0,1]");
        }
        if (finding["id"] == "drop") {
            EXPECT_EQ(finding["groups"][0]["clips"].dump(), "[2]");
            EXPECT_EQ(finding["groups"][1]["clips"].dump(), "[3]");
        }
    }
    for (const char* const id : {"copies", "rates", "drop"}) {
        EXPECT_EQ(ids.count(id), 1u) << id;
    }
}

// A movie that is odd in nothing: two seconds of pictures, sound and timecode.
movies::Movie PlainMovie(std::uint32_t timeScale = 25, std::uint32_t frameDuration = 1,
                         unsigned flags = movies::kTimecode24Hours) {
    const std::uint32_t frames = 2 * timeScale / frameDuration;
    movies::VideoFormat picture;
    picture.codec = "apcn";
    picture.fields = {1u, 0u};
    picture.nclc = {1u, 1u, 1u};
    movies::TimecodeFormat timecode;
    timecode.timeScale = timeScale;
    timecode.frameDuration = frameDuration;
    timecode.numFrames = (timeScale + frameDuration - 1) / frameDuration;
    timecode.flags = flags;
    movies::Movie movie;
    movie.tracks = {movies::VideoTrack(picture, frames, timeScale, frameDuration, 64),
                    movies::SoundTrack(movies::SoundFormat(), 96000),
                    movies::TimecodeTrack(timecode, 90000, frames)};
    movie.tracks[1].fill = 1;  // so that it is heard
    return movie;
}

movies::Movie With(const std::function<void(movies::VideoFormat& format)>& change) {
    movies::Movie movie = PlainMovie();
    movies::VideoFormat format;
    format.codec = "apcn";
    format.fields = {1u, 0u};
    format.nclc = {1u, 1u, 1u};
    change(format);
    movie.tracks[0].descriptions = {format.ToBox()};
    return movie;
}

movies::Movie With(const std::function<void(movies::Movie& movie)>& change) {
    movies::Movie movie = PlainMovie();
    change(movie);
    return movie;
}

movies::Movie WithEdits(std::vector<movies::Edit> edits) {
    return With([&](movies::Movie& movie) { movie.tracks[0].edits = std::move(edits); });
}

struct OddMovie {
    const char* trait;  // what is odd about it; empty: nothing
    const char* words;
    movies::Movie movie;
};

std::vector<OddMovie> OddMovies() {
    const auto first = [](movies::Movie& movie) -> movies::Track& { return movie.tracks[0]; };
    return {
        {"", "", PlainMovie()},
        {"variableRate", "pictures last from 40 to 120 ms", With([&](movies::Movie& movie) {
             first(movie).samples = {{20, 64, 1}, {10, 64, 3}};
         })},
        // Such as a rate that the time scale does not divide.
        {"", "", With([&](movies::Movie& movie) {
             first(movie).mediaTimeScale = 2500;
             first(movie).samples = {{20, 64, 100}, {30, 64, 101}};
         })},
        {"pixelAspect", "pixels are 16:15", With([](movies::VideoFormat& format) {
             format.pixelAspect = {16, 15};
         })},
        {"", "", With([](movies::VideoFormat& format) {
             format.pixelAspect = {1, 1};
         })},
        {"provider", "video: The FOURCC video code of xyz1 is not natively supported.",
         With([](movies::VideoFormat& format) { format.codec = "xyz1"; })},
        {"rotated", "rotated by 90 degrees",
         With([&](movies::Movie& movie) { first(movie).matrix = movies::kRotated90; })},
        {"rotated", "rotated by 180 degrees",
         With([&](movies::Movie& movie) { first(movie).matrix = movies::kRotated180; })},
        {"rotated", "rotated by 270 degrees",
         With([&](movies::Movie& movie) { first(movie).matrix = movies::kRotated270; })},
        {"noTimecode", "no timecode track",
         With([](movies::Movie& movie) { movie.tracks.pop_back(); })},
        {"noSound", "no sound track",
         With([](movies::Movie& movie) { movie.tracks.erase(movie.tracks.begin() + 1); })},
        {"silent", "all of its sound is silence",
         With([](movies::Movie& movie) { movie.tracks[1].fill = 0; })},
        {"edits", "picture: the first 0.2 s of the media are left out",
         WithEdits({{1080, 5, 1.0}})},
        {"edits", "picture: begins with a pause", WithEdits({{120, -1, 1.0}, {1200, 0, 1.0}})},
        {"edits", "picture: several edits, or another speed",
         WithEdits({{600, 0, 1.0}, {300, 30, 1.0}})},
        {"edits", "picture: several edits, or another speed", WithEdits({{600, 0, 2.0}})},
        {"", "", WithEdits({{1200, 0, 1.0}})},
    };
}

TEST_F(Reports, TellWhatIsOddAboutAMovieAndNothingElse) {
    std::filesystem::create_directory(folder() / "in");
    const std::vector<OddMovie> movies = OddMovies();
    for (std::size_t i = 0; i < movies.size(); ++i) {
        Write(movies[i].movie, "in/" + std::to_string(100 + i) + ".mov");
    }
    const Json clips = Report("in")["clips"];
    ASSERT_EQ(clips.size(), movies.size());
    for (std::size_t i = 0; i < movies.size(); ++i) {
        SCOPED_TRACE(std::to_string(i) + " " + movies[i].words);
        std::set<std::string> wanted;
        if (*movies[i].trait != '\0') {
            wanted.insert(movies[i].trait);
        }
        EXPECT_EQ(TraitsOf(clips[i]), wanted);
        EXPECT_EQ(WordsOf(clips[i], movies[i].trait), movies[i].words);
    }
}

// "colors: Rec. 2020, HLG (9-18-9) 1, Rec. 709 (1-1-1) 0" of a finding.
std::string Groups(const Json& report, const std::string& finding) {
    std::string text;
    for (const Json& one : report["odd"]) {
        for (const Json& group : one["id"] == finding ? one["groups"] : Json::array()) {
            text += (text.empty() ? "" : ", ") + group["label"].get<std::string>();
            for (const Json& clip : group["clips"]) {
                text += " " + std::to_string(clip.get<int>());
            }
        }
    }
    return text;
}

TEST_F(Reports, TellWhatMoviesMix) {
    std::filesystem::create_directory(folder() / "in");
    Write(PlainMovie(), "in/0.mov");
    Write(PlainMovie(), "in/1.mov");
    Write(With([](movies::VideoFormat& format) { format.nclc = {9u, 18u, 9u}; }), "in/2.mov");
    Write(With([](movies::VideoFormat& format) { format.nclc.reset(); }), "in/3.mov");
    Write(PlainMovie(30000, 1001), "in/4.mov");
    Write(PlainMovie(30000, 1001, movies::kTimecode24Hours | movies::kTimecodeDrop), "in/5.mov");
    const Json report = Report("in");
    EXPECT_EQ(Groups(report, "colors"),
              "Rec. 2020, HLG (9-18-9) 2, Rec. 709 (1-1-1) 0 1 4 5, not told 3");
    EXPECT_EQ(Groups(report, "drop"), "drop-frame 5, non-drop 4");
    EXPECT_EQ(Groups(report, "rates"), "25/1 0 1 2 3, 30000/1001 4 5");
    EXPECT_EQ(Groups(report, "copies"), report["clips"][0]["id"].get<std::string>() + " 0 1");
}

TEST_F(Reports, CallNoMovieACopyOfItself) {
    Copy("pcm_u8.mov", "in/a.mov");
    const Json report = Report("in in/a.mov");
    EXPECT_EQ(report["clips"].size(), 2u);
    for (const Json& finding : report["odd"]) {
        EXPECT_NE(finding["id"], "copies");
    }
}

TEST_F(Reports, HoldMoviesThatCanNotBeDescribedWithTheReason) {
    Copy("pcm_u8.mov", "in/a.mov");
    std::ofstream(folder() / "in/none.mov") << std::string(1000, 'x');
    const Json report = Report("in absent.mov");
    EXPECT_EQ(status, 2);
    ASSERT_EQ(report["clips"].size(), 3u);
    EXPECT_EQ(report["clips"][1]["failed"], true);
    EXPECT_EQ(report["clips"][1]["name"], "none");
    EXPECT_FALSE(report["clips"][1]["warnings"][0]["reason"].get<std::string>().empty());
    EXPECT_EQ(report["clips"][1]["warnings"][0]["code"].get<std::string>().substr(0, 4), "NMA_");
    EXPECT_FALSE(report["clips"][2].contains("size"));
    EXPECT_EQ(report["odd"][0]["id"], "failed");
}

TEST_F(Reports, ShowWhatACatalogKnowsOfMoviesThatAreGone) {
    Copy("h264_with_aac.mov", "in/a.mov");
    Copy("pcm_u8.mov", "in/b.mov");
    MakeCatalog("in", "--thumbnails");
    std::filesystem::remove(folder() / "in/a.mov");
    const Json report = Report("c.sqlite");
    EXPECT_EQ(status, 2);
    ASSERT_EQ(report["clips"].size(), 2u);
    const Json& gone = report["clips"][0];
    EXPECT_EQ(gone["failed"], true);
    EXPECT_EQ(gone["codecName"], "H.264");
    EXPECT_EQ(gone["poster"]["type"], "image/png");
    EXPECT_EQ(gone["warnings"][0]["kind"], "failure");
    EXPECT_EQ(gone["details"]["tracks"].size(), 2u);
    EXPECT_EQ(report["clips"][1]["failed"], false);
    EXPECT_EQ(report["clips"][1]["details"]["waves"].size(), 1u);
}

TEST_F(Reports, RefuseADatabaseThatIsNoCatalog) {
    std::ofstream(folder() / "x.sqlite")
        << std::string("SQLite format 3\0", 16) << std::string(84, '\0');
    ExpectSays(Run("x.sqlite -o r.html"), 2, "x.sqlite: ");
    EXPECT_FALSE(std::filesystem::exists(folder() / "r.html"));
}

TEST_F(Reports, TellThatACatalogHoldsNoMovie) {
    Copy("pcm_u8.mov", "in/a.mov");
    std::filesystem::create_directory(folder() / "empty");
    MakeCatalog("empty");
    const CommandResult alone = Run("c.sqlite -o r.html");
    ExpectSays(alone, 1, "c.sqlite: the catalog holds no movie; `cliphost catalog");
    ExpectSays(alone, 1, "r.html: not written: there is no movie to show");
    EXPECT_FALSE(std::filesystem::exists(folder() / "r.html"));
    const CommandResult beside = Run("c.sqlite in/a.mov -o r.html");
    ExpectSays(beside, 1, "c.sqlite: the catalog holds no movie");
    ExpectSays(beside, 1, "r.html: 1 clip,");
}

TEST_F(Reports, TakeNoCatalogOutOfAList) {
    Copy("pcm_u8.mov", "in/a.mov");
    MakeCatalog("in");
    std::ofstream(folder() / "l.txt") << "in/a.mov\nc.sqlite\n";
    const Json report = Report("--files-from l.txt");
    EXPECT_EQ(status, 2);
    ASSERT_EQ(report["clips"].size(), 2u);
    EXPECT_EQ(report["clips"][0]["failed"], false);
    EXPECT_EQ(report["clips"][1]["failed"], true);
    EXPECT_EQ(report["clips"][1]["warnings"][0].value("hint", ""),
              "name a catalog on the command line, not in a list");
}

TEST_F(Reports, TellPlacesAsAnotherMachineSeesThem) {
    Copy("pcm_u8.mov", "in/a.mov");
    const Json clip =
        ClipOf(folder() / "in/a.mov", "--map " + Quoted(folder() / "in") + "=//server/media");
    EXPECT_EQ(status, 0);
    EXPECT_EQ(clip["place"], "file://server/media/a.mov");
    EXPECT_NE(clip["details"]["description"].dump().find("file://server/media/a.mov"),
              std::string::npos);
    ExpectSays(Run("in -o r.html --map /elsewhere=/x"), 2, "nothing was mapped by it");
}

TEST_F(Reports, MakeNoMarkupOfNames) {
    const std::string evil = "<script>alert(1)<!-- \"'& \x1b[31m\n\xE2\x80\xA8.mov";
    Copy("pcm_u8.mov", "in/" + evil);
    Copy("pcm_u8.mov", "in/no utf-8 \xff.mov");
    ExpectSays(Run("in -o r.html --title '</title><script>alert(2)</script>'"), 0,
               "r.html: 2 clips");
    const std::string page = TextOfFile(folder() / "r.html");
    EXPECT_EQ(page.find("<script>alert"), std::string::npos);
    EXPECT_EQ(page.find("<!--"), std::string::npos);
    EXPECT_EQ(page.find("\xE2\x80\xA8"), std::string::npos);
    EXPECT_EQ(page.find('\xff'), std::string::npos);
    EXPECT_NE(page.find("\\u003cscript\\u003ealert(1)"), std::string::npos);
    ExpectSays(Run("in -o r.html --title 'a\xff'"), 0, "r.html: 2 clips");
    EXPECT_EQ(TextOfFile(folder() / "r.html").find('\xff'), std::string::npos);
    const Json clips = Report("in")["clips"];
    EXPECT_EQ(clips[0]["path"], (folder() / "in" / evil).string());
    EXPECT_EQ(clips[1]["path"].get<std::string>().substr(0, 7), "file://");
}

TEST_F(Reports, PutPicturesIntoAFolderBesideThePage) {
    Copy("h264_with_aac.mov", "in/a.mov");
    Copy("rotated_270.mov", "in/b.mov");
    ExpectSays(Run("in -o 'my report.html' --split"), 0, "2 clips");
    const std::set<std::string> files = FilesIn("my report_files");
    EXPECT_EQ(WithoutDigests(files), PicturesOf({0, 1}));
    const std::string page = TextOfFile(folder() / "my report.html");
    EXPECT_EQ(page.find("\"data\":\""), std::string::npos);
    for (const std::string& file : files) {
        EXPECT_EQ(TextOfFile(folder() / "my report_files" / file).substr(8, 4), "WEBP");
        EXPECT_NE(page.find("my%20report_files/" + file), std::string::npos) << file;
    }
}

// As a page of 1,000 clips has to stay below 60 MB.
TEST_F(Reports, TakeNoMoreThanSixtyThousandBytesForAClip) {
    std::filesystem::create_directory(folder() / "in");
    Make(
        "-f lavfi -i 'nullsrc=size=640x360:rate=25:duration=1,geq=random(1)*255:random(2)*255:"
        "random(3)*255' -f lavfi -i anoisesrc=duration=1:sample_rate=48000 -c:v mjpeg -q:v 2 "
        "-c:a pcm_s16le",
        "in/a.mov");
    ExpectSays(Run("in -o one.html"), 0, "1 clip");
    std::filesystem::copy_file(folder() / "in/a.mov", folder() / "in/b.mov");
    ExpectSays(Run("in -o two.html"), 0, "2 clips");
    const auto size = [&](const char* page) { return std::filesystem::file_size(folder() / page); };
    EXPECT_GT(size("two.html") - size("one.html"), 20'000u);
    EXPECT_LE(size("two.html") - size("one.html"), 60'000u);
}

TEST_F(Reports, RemoveThePicturesOfAnEarlierPageAndNoOtherFile) {
    Copy("h264_with_aac.mov", "in/a.mov");
    Copy("pcm_u8.mov", "in/b.mov");  // has none
    Copy("rotated_270.mov", "in/c.mov");
    ExpectSays(Run("in -o r.html --split"), 0, "3 clips");
    EXPECT_EQ(WithoutDigests(FilesIn("r_files")), PicturesOf({0, 2}));
    const std::set<std::string> others = {"00009-poster.txt",  "notes.webp",
                                          "9-strip.webp",      "00009-poster-12.webp",
                                          "00009-stripe.webp", "00009-poster-0123456789xy.webp"};
    for (const std::string& other : others) {
        std::ofstream(folder() / "r_files" / other) << "mine";
    }
    std::ofstream(folder() / "r_files/00009-poster.webp") << "of an earlier version's page";
    ExpectSays(Run("in/b.mov -o r.html --split"), 0, "1 clip");
    EXPECT_EQ(FilesIn("r_files"), others);
}

// The page's last step is to take the place of the earlier one.
TEST_F(Reports, LeaveTheEarlierPageAndItsPicturesWhereTheNewOneCanNotTakeItsPlace) {
    Copy("h264_with_aac.mov", "in/a.mov");
    Copy("h264_with_aac.mov", "in/b.mov");
    ExpectSays(Run("in -o r.html --split"), 0, "2 clips");
    const auto before = ContentOf("r_files");
    Copy("rotated_270.mov", "in/a.mov");  // b.mov's pictures stay the same
    std::ofstream(folder() / "other") << "other";
    const std::string page = Quoted(folder() / "r.html");
    if (RunCommand("mount --bind " + Quoted(folder() / "other") + " " + page + " 2>&1").status) {
        GTEST_SKIP() << "no file can be mounted here";
    }
    const CommandResult failed = Run("in -o r.html --split");
    EXPECT_EQ(RunCommand("umount " + page).status, 0);
    ExpectSays(failed, 2, "r.html: not written: ");
    EXPECT_EQ(ContentOf("r_files"), before);
    ExpectSays(Run("in -o r.html --split"), 0, "2 clips");
    EXPECT_NE(ContentOf("r_files"), before);
    EXPECT_EQ(WithoutDigests(FilesIn("r_files")), PicturesOf({0, 1}));
}

TEST_F(Reports, GoToStandardOutputWhole) {
    const CommandResult result = RunCommand(Quoted(ProgramFolder() / "cliphost") + " report " +
                                            Quoted(MadeMovie("pcm_u8.mov")) + " -o - 2>/dev/null");
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.out.substr(0, 15), "<!doctype html>");
    EXPECT_EQ(result.out.substr(result.out.size() - 8), "</html>\n");
}

TEST_F(Reports, AreNotWrittenWhereThereIsNoMovie) {
    std::filesystem::create_directory(folder() / "empty");
    const CommandResult result = Run("empty -o r.html");
    EXPECT_NE(result.status, 0);
    EXPECT_NE(result.out.find("r.html: not written"), std::string::npos) << result.out;
    EXPECT_FALSE(std::filesystem::exists(folder() / "r.html"));
}

TEST_F(Reports, RefuseCallsThatCanNotBeMeant) {
    Copy("pcm_u8.mov", "a.mov");
    ExpectSays(Run("a.mov"), 2, "give -o FILE.html, or --json");
    ExpectSays(Run("-o r.html"), 2, "--files-from");
    ExpectSays(Run("a.mov -o - --split"), 2, "give -o FILE.html");
    ExpectSays(Run("a.mov -o a.mov"), 2, "a.mov");
    EXPECT_EQ(ReadFile(folder() / "a.mov"), ReadFile(MadeMovie("pcm_u8.mov")));
    ExpectSays(Run("a.mov -o absent/r.html"), 2, "absent");
    std::ofstream(folder() / "r_files") << "a file";
    ExpectSays(Run("a.mov -o r.html --split"), 2, "r_files");
    EXPECT_FALSE(std::filesystem::exists(folder() / "r.html"));
}

// The page's beginning is shorter than that, and the first clip is not.
TEST_F(Reports, EndWithTheFirstClipThatCanNotBeWritten) {
    Copy("h264_with_aac.mov", "in/a.mov");
    Copy("h264_with_aac.mov", "in/b.mov");
    for (const char* const options : {"", " --split", " --jobs 2", " --split --jobs 2"}) {
        SCOPED_TRACE(options);
        const CommandResult ran = RunCommand("ulimit -f 40; cd " + Quoted(folder()) + " && " +
                                             Quoted(ProgramFolder() / "cliphost") +
                                             " report in -o r.html" + options + " 2>&1");
        ExpectSays(ran, 2, "not written: File too large");
        EXPECT_EQ(ran.out.find("not written"), ran.out.rfind("not written")) << ran.out;
        EXPECT_EQ(FilesIn("."), std::set<std::string>{"in"});
    }
}

TEST_F(Reports, TakeThePlaceOfNoMovieThatIsRead) {
    Copy("pcm_u8.mov", "in/a.mov");
    Copy("pcm_u8.mov", "in/b.mov");
    for (const char* const call :
         {"in/b.mov -o in/b.mov", "in -o in/b.mov", "in/a.mov in/b.mov -o in/b.mov --jobs 2"}) {
        ExpectSays(Run(call), 2, "b.mov: this is the movie itself");
        EXPECT_EQ(ReadFile(folder() / "in/b.mov"), ReadFile(MadeMovie("pcm_u8.mov"))) << call;
    }
    const std::set<std::string> both = {"a.mov", "b.mov"};
    EXPECT_EQ(FilesIn("in"), both);
}

TEST_F(Reports, TakeThePlaceOfNoListOrCatalogThatIsRead) {
    Copy("pcm_u8.mov", "in/a.mov");
    std::ofstream(folder() / "l.txt") << "in/a.mov\n";
    MakeCatalog("in");
    const std::string catalog = TextOfFile(folder() / "c.sqlite");
    ExpectSays(Run("c.sqlite -o c.sqlite"), 2,
               "c.sqlite: this is a catalog that the page is made from");
    ExpectSays(Run("--files-from l.txt -o l.txt"), 2, "l.txt: this is the list of movies");
    EXPECT_TRUE(TextOfFile(folder() / "c.sqlite") == catalog);
    EXPECT_EQ(TextOfFile(folder() / "l.txt"), "in/a.mov\n");
}

TEST_F(Reports, TellWhichPartOfAMovieCanNotBeRead) {
    std::string movie = TextOfFile(MadeMovie("png.mov"));
    const std::string code = "png ";
    for (std::size_t at = movie.find(code); at != std::string::npos; at = movie.find(code, at)) {
        movie.replace(at, code.size(), "xyz1");
    }
    std::ofstream(folder() / "a.mov", std::ios::binary) << movie;
    const Json clip = ClipOf(folder() / "a.mov");
    EXPECT_EQ(clip["failed"], false);
    EXPECT_FALSE(clip.contains("poster"));
    ASSERT_EQ(clip["warnings"].size(), 1u);
    EXPECT_EQ(clip["warnings"][0]["kind"], "pictures");
    EXPECT_NE(clip["warnings"][0]["reason"].get<std::string>().find("xyz1"), std::string::npos);
}

// The multimedia library reads it, which tells neither timecode, colours nor places in the file.
TEST_F(Reports, BlameNoMovieForWhatTheLibraryDoesNotTell) {
    const Json clip = ClipOf(Make(
        "-i " + Quoted(MadeMovie("h264_with_aac.mov")) + " -map 0:v -map 0:a -c copy", "a.mkv"));
    EXPECT_EQ(clip["route"], "library");
    EXPECT_EQ(clip["warnings"].dump(), "[]");
    EXPECT_FALSE(clip.contains("hasTimecode"));
    EXPECT_FALSE(clip["details"].contains("samples"));
    EXPECT_EQ(clip["details"]["waves"].size(), 1u);
}

}  // namespace
