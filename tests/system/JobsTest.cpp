// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// `--jobs` of the verbs that take several movies or ranges of frames: the same results as from one
// process, and what a movie does to the process that reads it costs that movie, or that piece of
// the range, alone.

#include <signal.h>
#include <sys/ioctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cstdlib>
#include <fstream>
#include <map>
#include <nlohmann/json.hpp>
#include <sstream>
#include <thread>

#include "reference_host/cliphost/FrameSink.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using Json = nlohmann::ordered_json;
using namespace std::chrono_literals;

std::string Program() {
    return Quoted(ProgramFolder() / "cliphost");
}

std::size_t CountOf(const std::string& text, const std::string& words) {
    std::size_t count = 0;
    for (auto at = text.find(words); at != std::string::npos; at = text.find(words, at + 1)) {
        ++count;
    }
    return count;
}

std::set<std::string> NamesIn(const std::filesystem::path& folder) {
    std::set<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(folder)) {
        names.insert(entry.path().filename());
    }
    return names;
}

class Jobs : public SystemTest {
protected:
    void SetUp() override {
        SystemTest::SetUp();
        std::filesystem::create_directories(folder() / "in");
        std::filesystem::create_directories(folder() / "tmp");
    }
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    void Copy(const std::string& name) {
        std::filesystem::copy_file(MadeMovie("png.mov"), folder() / "in" / name);
    }
    // A call whose module does harm for movies of certain names, and whose temporary files
    // have a folder of their own.
    CommandResult Harmed(const std::string& arguments) {
        return RunCommand("TMPDIR=" + In("tmp") + " " + Program() + " --plugin " +
                          Quoted(ProgramFolder() / "tests" / "BreakingModule.nvx") + " " +
                          arguments + " 2>&1");
    }
    std::string Line(const std::string& name, const std::string& words) {
        return "cliphost: " + (folder() / "in" / name).string() + ": " + words + "\n";
    }
};

constexpr char kPinned[] = " --pin-time 2026-01-31T12:00:00Z ";

// Movies, files that are none, and a path that is not there.
class EqualJobs : public Jobs {
protected:
    void SetUp() override {
        Jobs::SetUp();
        Write(movies::Bytes(100, 'x'), "in/text.mov");
        Write(movies::Bytes{}, "in/empty.mov");
        Write(movies::Bytes{}, "in/other.mp4");
        Copy("a\xFF.mov");
        Copy("back\\slash.mov");
        rest_ = " " + In("in") + " " + In("absent.mov") + " " + Quoted(MadeMovie("png.mov")) + " " +
                Quoted(MadeMovie("aac.mov"));
    }
    // Movies of every kind, and a few that are enough for the forms of a call.
    std::string All() { return Quoted(MadeMoviesFolder()) + rest_; }
    std::string Few() {
        for (const char* const name : {"dv_pal.mov", "h264_bframes.mov", "h264_with_aac.mov"}) {
            std::filesystem::copy_file(MadeMovie(name), folder() / "in" / name,
                                       std::filesystem::copy_options::overwrite_existing);
        }
        return rest_;
    }
    // Both outputs of one call.
    struct Printed {
        int status;
        std::string out, told;
    };
    Printed Print(const std::string& call) {
        const auto told = folder() / "told";
        const CommandResult ran = RunCommand(Program() + " " + call + " 2>" + Quoted(told));
        const movies::Bytes lines = ReadFile(told);
        return {ran.status, ran.out, std::string(lines.begin(), lines.end())};
    }
    void ExpectTheSame(const std::string& call, const std::vector<std::string>& jobs) {
        SCOPED_TRACE(call);
        const Printed one = Print(call + " --jobs 1");
        EXPECT_EQ(one.status, 2);
        EXPECT_GT(CountOf(one.told, "cliphost: "), 4u);
        for (const std::string& several : jobs) {
            const Printed these = Print(call + several);
            EXPECT_EQ(these.status, one.status) << several;
            EXPECT_TRUE(these.out == one.out) << several;
            EXPECT_EQ(these.told, one.told) << several;
        }
    }

private:
    std::string rest_;
};

TEST_F(EqualJobs, PrintTheSame) {
    ExpectTheSame("-v describe --json" + std::string(kPinned) + All(), {" --jobs 2"});
    for (const char* const form : {"", "--json", "-q"}) {
        ExpectTheSame("-v describe " + std::string(form) + kPinned + Few(),
                      {" --jobs 2", " --jobs 5", "", " --jobs 1 --limit-seconds 100"});
    }
}

TEST_F(EqualJobs, TakeFlagsThatAreTurnedOff) {
    const std::string call =
        "describe --use-alpha=false --quiet=false" + std::string(kPinned) + Few();
    ExpectTheSame(call, {" --jobs 2"});
    EXPECT_GT(Print(call + " --jobs 2").out.size(), 1000u) << "not quiet";
    ExpectTheSame("describe --json=false" + std::string(kPinned) + Few(), {" --jobs 2"});
}

TEST_F(EqualJobs, SaveTheSame) {
    std::set<std::string> names;
    std::string printed;
    for (const char* const jobs : {"1", "3"}) {
        SCOPED_TRACE(jobs);
        const auto out = folder() / "out";
        const CommandResult ran =
            RunCommand("TMPDIR=" + In("tmp") + " " + Program() + " describe --json" + kPinned +
                       All() + " --jobs " + jobs + " --out-dir " + Quoted(out) + " 2>/dev/null");
        EXPECT_EQ(ran.status, 2);
        if (names.empty()) {
            names = NamesIn(out);
            printed = ran.out;
            EXPECT_EQ(names.count("png-2.aaf"), 1u);
            std::filesystem::rename(out, folder() / "first");
            continue;
        }
        EXPECT_TRUE(ran.out == printed);
        EXPECT_EQ(NamesIn(out), names);
        for (const std::string& name : names) {
            EXPECT_EQ(ReadFile(out / name), ReadFile(folder() / "first" / name)) << name;
        }
        EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
        std::filesystem::remove_all(out);
    }
}

// Among the movies are one without pictures, and one that was cut: its sheet has empty cells.
TEST_F(EqualJobs, MakeTheSameSheets) {
    const auto cut =
        Make("-i " + Quoted(MadeMovie("h264_bframes.mov")) + " -c copy -movflags +faststart",
             "in/cut.mov");
    std::filesystem::resize_file(cut, std::filesystem::file_size(cut) * 3 / 4);
    const std::string form =
        " --frames 4 --columns 2 --width 32 --exact --set 'Field Layout=Split' ";
    const std::string paths = In("in") + " " + In("absent.mov") + " " +
                              Quoted(MadeMovie("png.mov")) + " " +
                              Quoted(MadeMovie("rotated_90.mov")) + " " +
                              Quoted(MadeMovie("aac.mov")) + " " + Quoted(MadeMovie("png.mov"));
    std::set<std::string> names;
    std::string told;
    for (const char* const jobs : {"1", "2", "5", "1 --limit-seconds 100"}) {
        SCOPED_TRACE(jobs);
        const auto out = folder() / "out";
        const CommandResult ran =
            RunCommand("TMPDIR=" + In("tmp") + " " + Program() + " -v contact" + form + paths +
                       " --jobs " + jobs + " --out-dir " + Quoted(out) + " 2>" + In("told"));
        EXPECT_EQ(ran.status, 2);
        const movies::Bytes errors = ReadFile(folder() / "told");
        const std::string all = ran.out + std::string(errors.begin(), errors.end());
        EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
        if (names.empty()) {
            names = NamesIn(out);
            told = all;
            EXPECT_EQ(names, (std::set<std::string>{"a\xFF.png", "cut.png", "png-2.png", "png.png",
                                                    "rotated_90.png"}));
            EXPECT_NE(told.find("stays empty"), std::string::npos) << told;
            EXPECT_NE(told.find("it has no picture track"), std::string::npos) << told;
            std::filesystem::rename(out, folder() / "first");
            continue;
        }
        EXPECT_EQ(all, told);
        EXPECT_EQ(NamesIn(out), names);
        for (const std::string& name : names) {
            EXPECT_EQ(ReadFile(out / name), ReadFile(folder() / "first" / name)) << name;
        }
        std::filesystem::remove_all(out);
    }
}

TEST_F(Jobs, LoseOneSheetToACrashOrATooLongWait) {
    for (const char* const name : {"a.mov", "crash.mov", "hang.mov", "z.mov"}) {
        Copy(name);
    }
    const CommandResult ran = Harmed("contact --frames 2 --jobs 2 --limit-seconds 4 " + In("in") +
                                     " --out-dir " + In("out"));
    ExpectSays(ran, 1, Line("crash.mov", "the process that read it was ended by signal 11"));
    ExpectSays(ran, 1, Line("hang.mov", "took longer than 4 seconds"));
    EXPECT_EQ(NamesIn(folder() / "out"), (std::set<std::string>{"a.png", "z.png"}));
    EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
}

TEST_F(Jobs, NeedAPlaceForEachSheet) {
    Copy("a.mov");
    Copy("b.mov");
    ExpectSays(RunCliphost("contact " + In("in/a.mov")), 2, "there is no place for the sheet");
    ExpectSays(RunCliphost("contact " + In("in") + " -o " + In("a.png")), 2, "it takes one movie");
    ExpectSays(
        RunCliphost("contact " + In("in/a.mov") + " " + In("in/b.mov") + " -o " + In("a.png")), 2,
        "it takes one movie");
    EXPECT_FALSE(std::filesystem::exists(folder() / "a.png"));
}

TEST_F(Jobs, SaveOneMovieWhereverItIsWanted) {
    const std::string movie = Quoted(MadeMovie("png.mov"));
    const std::string call = "describe -q" + std::string(kPinned) + movie + " --aaf ";
    ASSERT_EQ(RunCliphost(call + In("here.aaf")).status, 0);
    ASSERT_EQ(RunCliphost(call + In("limited.aaf") + " --limit-seconds 100").status, 0);
    EXPECT_EQ(ReadFile(folder() / "limited.aaf"), ReadFile(folder() / "here.aaf"));
    const CommandResult piped =
        RunCommand(Program() + " " + call + "- --limit-seconds 100 > " + In("piped.aaf"));
    EXPECT_EQ(piped.status, 0);
    EXPECT_EQ(ReadFile(folder() / "piped.aaf"), ReadFile(folder() / "here.aaf"));
}

TEST_F(Jobs, SaveOneMovieWithoutAFolderForTemporaryFiles) {
    const std::string movie = Quoted(MadeMovie("png.mov"));
    const CommandResult ran =
        RunCommand("TMPDIR=/no/such/folder " + Program() + " describe -q " + movie + " --aaf " +
                   In("here.aaf") + " --limit-seconds 100 2>&1");
    EXPECT_EQ(ran.status, 0) << ran.out;
    EXPECT_EQ(NamesIn(folder()), (std::set<std::string>{"here.aaf", "in", "tmp"}));
    const CommandResult piped = RunCommand("TMPDIR=/no/such/folder " + Program() + " describe -q " +
                                           movie + " --aaf - --limit-seconds 100 2>&1 >/dev/null");
    ExpectSays(piped, 2, "/no/such/folder: no folder can be made there");
}

TEST_F(Jobs, LeaveDescriptorsToTheProcessThatHasThem) {
    Copy("b.mov");
    const CommandResult ran = RunCommand(Program() + " describe -q --jobs 2 /dev/stdin " +
                                         In("in/b.mov") + " 2>&1 <" + Quoted(MadeMovie("png.mov")));
    ExpectSays(ran, 0, "2 described, 0 not");
}

TEST_F(Jobs, LeaveNoFolderBehindAReaderThatWentAway) {
    for (const char* const name : {"a.mov", "b.mov", "c.mov"}) {
        Copy(name);
        Write(movies::Bytes(100, 'x'), std::string("in/bad-") + name);
    }
    RunCommand("env --default-signal=PIPE " + Program() + " describe " + In("in") + " --out-dir " +
               In("out") + " --jobs 2 2>&1 | true");
    for (const std::string& name : NamesIn(folder() / "out")) {
        EXPECT_EQ(std::filesystem::path(name).extension(), ".aaf") << name;
    }
}

TEST_F(Jobs, NameSheetsAlikeBehindAMovieThatGivesNone) {
    for (const char* const place : {"a", "b"}) {
        std::filesystem::create_directories(folder() / "in" / place);
    }
    Write(movies::Bytes(100, 'x'), "in/a/clip.mov");
    Copy("b/clip.mov");
    for (const char* const jobs : {"1", "2"}) {
        RunCliphost("contact " + In("in/a/clip.mov") + " " + In("in/b/clip.mov") + " --jobs " +
                    jobs + " --out-dir " + In("out"));
        EXPECT_EQ(NamesIn(folder() / "out"), (std::set<std::string>{"clip.png"})) << jobs;
        std::filesystem::remove_all(folder() / "out");
    }
}

TEST_F(Jobs, TellWhatCantBeWrittenByTheUsersName) {
    Copy("a.mov");
    Copy("b.mov");
    std::filesystem::create_directories(folder() / "out" / "a.aaf");
    const std::string call = "describe -q " + In("in") + " --out-dir " + In("out") + " --jobs ";
    const CommandResult one = RunCliphost(call + "1");
    ExpectSays(one, 2, (folder() / "out" / "a.aaf").string());
    EXPECT_EQ(RunCliphost(call + "2").out, one.out);
    EXPECT_EQ(NamesIn(folder() / "out"), (std::set<std::string>{"a.aaf", "b.aaf"}));
}

TEST_F(Jobs, LoseOneMovieToACrash) {
    for (const char* const name : {"a.mov", "b.mov", "crash.mov", "d.mov", "leave.mov", "z.mov"}) {
        Copy(name);
    }
    for (const char* const jobs : {"2", "5"}) {
        const CommandResult ran = Harmed("describe -q " + In("in") + " --jobs " + jobs);
        ExpectSays(ran, 1, Line("crash.mov", "the process that read it was ended by signal 11"));
        ExpectSays(ran, 1,
                   Line("leave.mov",
                        "the process that read it ended with status 3 and without an answer"));
        ExpectSays(ran, 1, "4 described, 2 not");
    }
    const CommandResult json =
        Harmed("describe --json --jobs 2 " + In("in") + " --out-dir " + In("out"));
    const Json list = Json::parse(json.out.substr(json.out.find('[')));
    ASSERT_EQ(list.size(), 6u);
    EXPECT_EQ(list[2]["reason"], "the process that read it was ended by signal 11");
    EXPECT_EQ(list[2].count("description"), 0u);
    EXPECT_EQ(list[3]["description"]["class"], list[0]["description"]["class"]);
    EXPECT_EQ(NamesIn(folder() / "out"),
              (std::set<std::string>{"a.aaf", "b.aaf", "d.aaf", "z.aaf"}));
    EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
}

TEST_F(Jobs, LoseOneMovieToItsTimeOrMemory) {
    for (const char* const name : {"a.mov", "hang.mov", "hog.mov", "z.mov"}) {
        Copy(name);
    }
    const CommandResult ran =
        Harmed("describe -q " + In("in") + " --jobs 2 --limit-seconds 4 --limit-memory 700");
    ExpectSays(ran, 1, Line("hang.mov", "took longer than 4 seconds"));
    ExpectSays(ran, 1, Line("hog.mov", "needed more than 700 MiB"));
    ExpectSays(ran, 1, "2 described, 2 not");
}

TEST_F(Jobs, ProtectASingleMovieWhereALimitIsGiven) {
    Copy("crash.mov");
    ExpectSays(Harmed("describe " + In("in/crash.mov") + " --limit-seconds 100"), 1,
               Line("crash.mov", "the process that read it was ended by signal 11"));
}

TEST_F(Jobs, TakeNoAnswerThatIsNone) {
    for (const char* const name : {"a.mov", "length.mov", "z.mov"}) {
        Copy(name);
    }
    ExpectSays(Harmed("describe -q --jobs 2 " + In("in")), 1,
               Line("length.mov", "the process that read it gave an answer that is none"));
    std::filesystem::rename(folder() / "in/length.mov", folder() / "in/nonsense.mov");
    const CommandResult ran = Harmed("describe -q --jobs 2 --limit-seconds 4 " + In("in"));
    ExpectSays(ran, 1,
               Line("nonsense.mov", "the process that read it gave an answer that is none"));
    ExpectSays(ran, 1, "2 described, 1 not");
}

TEST_F(Jobs, EscapeWhatAProcessWrites) {
    Copy("a.mov");
    Copy("controls.mov");
    ExpectSays(Harmed("describe -q --jobs 2 " + In("in")), 0, "\\x1B[2Jcleared");
}

TEST_F(Jobs, GiveUpWhatReadingDoesNotNeed) {
    Copy("a.mov");
    Copy("probe.mov");
    const CommandResult ran = Harmed("describe -q --jobs 2 " + In("in"));
    for (const char* const what :
         {"socket", "process", "signal", "new code", "rights of a file", "writing the movie",
          "a file beside it", "removing the movie", "program"}) {
        ExpectSays(ran, 0, std::string(what) + ": refused\n");
    }
    ExpectSays(ran, 0, "thread: done\n");
    ExpectSays(ran, 0, "reading: done\n");
}

TEST_F(Jobs, WriteNothingButTheirOwnFolder) {
    Copy("a.mov");
    Copy("probe.mov");
    const CommandResult ran =
        Harmed("-v describe -q --jobs 2 " + In("in") + " --out-dir " + In("out"));
    if (ran.out.find("Landlock") != std::string::npos) {
        GTEST_SKIP() << "the system has no Landlock";
    }
    for (const char* const what : {"socket", "process", "program", "writing the movie",
                                   "a file beside it", "removing the movie"}) {
        ExpectSays(ran, 0, std::string(what) + ": refused\n");
    }
    EXPECT_EQ(NamesIn(folder() / "in"), (std::set<std::string>{"a.mov", "probe.mov"}));
}

// Processes with these words in their command line.
std::set<std::string> ProcessesOf(const std::string& words) {
    std::set<std::string> found;
    for (const auto& entry : std::filesystem::directory_iterator("/proc")) {
        std::ostringstream line;  // stays empty for a process that ends meanwhile
        line << std::ifstream(entry.path() / "cmdline").rdbuf();
        if (line.str().find(words) != std::string::npos) {
            found.insert(entry.path().filename());
        }
    }
    return found;
}

TEST_F(Jobs, EndWithTheProgram) {
    Copy("hang.mov");
    Copy("hang-not.mov");
    const std::string mark = "--plugin=" + (ProgramFolder() / "tests/BreakingModule.nvx").string();
    for (const int signal : {SIGINT, SIGTERM, SIGKILL}) {
        SCOPED_TRACE(signal);
        const pid_t program = fork();
        ASSERT_GE(program, 0);
        if (program == 0) {
            setenv("TMPDIR", (folder() / "tmp").c_str(), 1);
            execl((ProgramFolder() / "cliphost").c_str(), "cliphost", mark.c_str(), "describe",
                  "-q", "--jobs", "2", (folder() / "in").c_str(), "--out-dir",
                  (folder() / "out").c_str(), nullptr);
            _exit(127);
        }
        // The first movie is saved, the second one hangs.
        const auto saved = folder() / "out" / "hang-not.aaf";
        for (int i = 0; i < 1000 && !std::filesystem::exists(saved); ++i) {
            std::this_thread::sleep_for(20ms);
        }
        EXPECT_EQ(ProcessesOf(folder().string()).size(), 3u);  // each names the folder
        ASSERT_EQ(kill(program, signal), 0);
        int status = 0;
        ASSERT_EQ(waitpid(program, &status, 0), program);
        EXPECT_TRUE(WIFSIGNALED(status));
        EXPECT_EQ(WTERMSIG(status), signal);
        for (int i = 0; i < 100 && !ProcessesOf(folder().string()).empty(); ++i) {
            std::this_thread::sleep_for(20ms);
        }
        EXPECT_TRUE(ProcessesOf(folder().string()).empty());
        if (signal != SIGKILL) {
            // And the record by which another run goes on.
            EXPECT_EQ(NamesIn(folder() / "out"),
                      (std::set<std::string>{".cliphost-done", "hang-not.aaf"}));
        }
        std::filesystem::remove_all(folder() / "out");
    }
}

// A movie of 96 frames, large enough for a range of them to be read in pieces of a dozen or two.
class JobsOfFrames : public EqualJobs {
protected:
    std::filesystem::path Movie(const std::string& name, const std::string& codec) {
        return Make("-f lavfi -i testsrc2=size=480x272:rate=24:duration=4 " + codec, "in/" + name);
    }
    // What a call leaves: what it prints, and all files at the place of its output.
    struct Left {
        Printed printed;
        std::map<std::string, movies::Bytes> files;
    };
    Left Run(const std::string& call, const std::string& name) {
        const auto out = folder() / "out";
        std::filesystem::remove_all(out);
        std::filesystem::create_directories(out);
        setenv("TMPDIR", (folder() / "tmp").c_str(), 1);
        Left left{Print("-v frame " + call + " -o " + Quoted(out / name)), {}};
        unsetenv("TMPDIR");
        for (const auto& entry : std::filesystem::recursive_directory_iterator(out)) {
            if (entry.is_regular_file()) {
                left.files[std::filesystem::relative(entry.path(), out)] = ReadFile(entry.path());
            }
        }
        EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
        EXPECT_LE(NamesIn(out).size(), 1u);
        return left;
    }
    // Gives what one process leaves.
    Left ExpectTheSame(const std::string& call, const std::string& name,
                       const std::vector<std::string>& others) {
        SCOPED_TRACE(call);
        const Left one = Run(call + " --jobs 1", name);
        for (const std::string& other : others) {
            SCOPED_TRACE(other);
            const Left several = Run(call + other, name);
            EXPECT_EQ(several.printed.status, one.printed.status);
            EXPECT_EQ(several.printed.out, one.printed.out);
            EXPECT_EQ(several.printed.told, one.printed.told);
            EXPECT_TRUE(several.files == one.files);
        }
        return one;
    }
};

const std::string kProRes = "-c:v prores_ks -profile:v 0";
const std::vector<std::string> kSeveral = {" --jobs 2", " --jobs 5",
                                           " --jobs 1 --limit-seconds 100"};

const std::vector<std::string> kTwo = {" --jobs 2"};

TEST_F(JobsOfFrames, WriteTheSamePicturesAndBytes) {
    const std::string movie = Quoted(Movie("p.mov", kProRes));
    EXPECT_EQ(ExpectTheSame(movie + " --range :40", "pictures", kSeveral).files.size(), 40u);
    const Left raw = ExpectTheSame(movie + " --range 0:", "a.raw", kSeveral);
    EXPECT_EQ(raw.files.at("a.raw").size(), 96u * 480 * 272 * 2);
    EXPECT_NE(raw.printed.told.find("-pixel_format"), std::string::npos);
    EXPECT_NE(raw.printed.out.find("96 raw frames"), std::string::npos);
    EXPECT_EQ(ExpectTheSame(movie + " --range 3:90:3", "pictures", kTwo).files.size(), 29u);
}

// They don't list their sync samples, and need not: all of theirs are.
TEST_F(JobsOfFrames, ReadInPiecesOfTheirOwnWhatIsCodedAlone) {
    const std::pair<const char*, const char*> codecs[] = {
        {"cfhd", "-c:v cfhd"},
        {"dnxhr", "-c:v dnxhd -profile:v dnxhr_lb -pix_fmt yuv422p"},
        {"dv", "-vf scale=720:576 -r 25 -c:v dvvideo -pix_fmt yuv420p"},
        {"hap", "-c:v hap"}};
    for (const auto& [name, codec] : codecs) {
        SCOPED_TRACE(name);
        const auto movie = Movie(std::string(name) + ".mov", codec);
        EXPECT_EQ(ExpectTheSame(Quoted(movie) + " --range :96", "a.raw", kTwo).printed.status, 0);
        // What is lost costs the pieces behind it nothing.
        std::filesystem::create_directories(folder() / "in" / name);
        const std::string crashing = "in/" + std::string(name) + "/crash-at-40.mov";
        std::filesystem::copy_file(movie, folder() / crashing);
        const CommandResult ran =
            Harmed("frame " + In(crashing) + " --range :96 --jobs 2 -o " + In("a.raw"));
        ExpectSays(ran, 1, "frames 39 to 51 are left out: ");
        ExpectSays(ran, 1, ": 83 raw frames\n");
    }
}

// Its pictures lie far from those that stand alone, and are stored in another order than shown.
TEST_F(JobsOfFrames, WriteTheSameOfAMovieOfLongGroups) {
    const std::string movie =
        Quoted(Movie("long.mov", "-c:v libx264 -pix_fmt yuv420p -bf 2 -g 40 -sc_threshold 0"));
    EXPECT_EQ(ExpectTheSame(movie + " --range 5:", "a.raw", kSeveral).files.at("a.raw").size(),
              91u * 480 * 272 * 2);
}

// Such movies claim that every sample stands alone, and most of these samples don't.
TEST_F(JobsOfFrames, WriteTheSameOfAMovieThatDoesNotListItsSyncSamples) {
    const std::pair<const char*, const char*> codecs[] = {
        {"rpza.mov", "-c:v rpza"},
        {"mpeg2.mov", "-c:v mpeg2video -g 40 -bf 0"},
        {"h264.mov", "-c:v libx264 -pix_fmt yuv420p -g 40 -bf 0"},
        {"qtrle.mov", "-c:v qtrle -g 40"}};
    for (const auto& [name, codec] : codecs) {
        const auto movie = Movie(name, codec);
        movies::Bytes bytes = ReadFile(movie);
        const std::string list = "stss";
        const auto at = std::search(bytes.begin(), bytes.end(), list.begin(), list.end());
        std::copy_n("free", at == bytes.end() ? 0 : list.size(), at);
        Write(bytes, "in/" + std::string(name));
        const std::string call = Quoted(movie) + " --range ";
        const Left whole = ExpectTheSame(call + "0:", "a.raw", kTwo);
        EXPECT_EQ(whole.printed.status, 0) << name;
        EXPECT_NE(whole.printed.out.find("96 raw frames"), std::string::npos) << name;
        ExpectTheSame(call + "5::2", "a.raw", kTwo);
    }
}

// Nothing tells which frames those behind a lost piece lean on: all of them are lost with it.
TEST_F(JobsOfFrames, LoseTheRestInOneLineWherePiecesLeanOnEachOther) {
    const auto movie = Movie("whole.mov", "-c:v rpza");
    const std::string rest = " --range 0: --jobs 2 --limit-seconds 4 -o ";
    ASSERT_EQ(RunCliphost("frame " + Quoted(movie) + rest + In("whole")).status, 0);
    const std::pair<const char*, const char*> harms[] = {
        {"crash-at-40", "the process that read it was ended by signal 11"},
        {"hang-at-41", "took longer than 4 seconds"},
        {"throw-at-42", "thrown by the module"},
        {"remove-at-43", "the process that read it left no whole file of frame 39"}};
    for (const auto& [harm, why] : harms) {
        SCOPED_TRACE(harm);
        const std::string name = std::string(harm) + ".mov";
        std::filesystem::copy_file(movie, folder() / "in" / name);
        const CommandResult ran = Harmed("frame " + In("in/" + name) + rest + In(harm));
        ExpectSays(ran, 1,
                   Line(name, std::string("frames 39 to 95 are left out: ") + why) +
                       (folder() / harm).string() + ": 39 pictures\n");
        EXPECT_EQ(CountOf(ran.out, "left out"), 1u) << ran.out;
        for (int i = 0; i < 39; ++i) {
            const std::string frame = (i < 10 ? "_00000" : "_0000") + std::to_string(i) + ".png";
            EXPECT_TRUE(ReadFile(folder() / harm / (harm + frame)) ==
                        ReadFile(folder() / "whole" / ("whole" + frame)))
                << frame;
        }
    }
}

// All memory of the process is this movie's. Each further process would take frame 0 again, which
// tells of itself.
TEST_F(JobsOfFrames, KeepTheirProcessWherePiecesLeanOnEachOther) {
    const auto movie = Movie("hog-at-0.mov", "-c:v rpza");
    const std::string call = "frame " + Quoted(movie) + " --range 0: --jobs 2 -o ";
    ASSERT_EQ(RunCliphost(call + In("whole.raw")).status, 0);
    const CommandResult ran = Harmed(call + In("a.raw") + " --limit-memory 2000");
    ExpectSays(ran, 0, ": 96 raw frames\n");
    EXPECT_EQ(CountOf("\n" + ran.out, "\n1\n"), 1u) << ran.out;
    EXPECT_TRUE(ReadFile(folder() / "a.raw") == ReadFile(folder() / "whole.raw"));
}

TEST_F(JobsOfFrames, TellFramesThatCantBeReadInOrder) {
    const auto cut = Movie("cut.mov", kProRes + " -movflags +faststart");
    std::filesystem::resize_file(cut, std::filesystem::file_size(cut) * 2 / 3);
    for (const char* const name : {"pictures", "a.raw"}) {
        const Left left = ExpectTheSame(Quoted(cut) + " --range 40:", name, kTwo);
        EXPECT_EQ(left.printed.status, 1);
        EXPECT_NE(left.printed.told.find("frame 95 is left out: "), std::string::npos);
        EXPECT_FALSE(left.files.empty());
    }
}

TEST_F(JobsOfFrames, RefuseTheSame) {
    const std::string movie = Quoted(Movie("p.mov", kProRes));
    for (const char* const rest :
         {" --range 96:200", " --range 0: --format odd", " --range 0: --track 7"}) {
        const Left left = ExpectTheSame(movie + rest, "pictures", kTwo);
        EXPECT_EQ(left.printed.status, 2);
        EXPECT_TRUE(left.files.empty());
    }
    EXPECT_EQ(ExpectTheSame(In("absent.mov") + " --range 0:", "a.raw", kTwo).printed.status, 2);
    EXPECT_EQ(ExpectTheSame(movie + " --range 0:", "a.png", kTwo).printed.status, 2);
    EXPECT_EQ(ExpectTheSame(movie + " --range 0:", "no/a.raw", kSeveral).printed.status, 2);
}

TEST_F(JobsOfFrames, ProtectASingleFrameWhereALimitIsGiven) {
    const std::string turned = Quoted(MadeMovie("rotated_90.mov")) + " --frame 2";
    const Left left = ExpectTheSame(turned, "a.png", {" --limit-seconds 100"});
    EXPECT_EQ(left.files.size(), 1u);
    EXPECT_NE(left.printed.out.find("frame 2, "), std::string::npos);
}

TEST_F(JobsOfFrames, ComeInOrderThroughAPipe) {
    const std::string call =
        Program() + " frame " + Quoted(Movie("p.mov", kProRes)) + " --range 0:60 -o - 2>/dev/null";
    ASSERT_EQ(RunCommand(call + " --jobs 1 >" + In("one")).status, 0);
    for (const char* const several : {" --jobs 2", " --jobs 2 --limit-seconds 100"}) {
        ASSERT_EQ(RunCommand(call + several + " | cat >" + In("piped")).status, 0);
        EXPECT_TRUE(ReadFile(folder() / "piped") == ReadFile(folder() / "one")) << several;
    }
    EXPECT_EQ(ReadFile(folder() / "one").size(), 60u * 480 * 272 * 2);
}

TEST_F(JobsOfFrames, EndWhenTheReaderOfTheirOutputHasEnough) {
    const std::string call = Program() + " frame " + Quoted(Movie("p.mov", kProRes)) +
                             " --range 0: --limit-seconds 100 -o - 2>" + In("told");
    RunCommand("TMPDIR=" + In("tmp") + "; export TMPDIR; { " + call + "; echo $? >" + In("status") +
               "; } | head -c 100 >" + In("some"));
    EXPECT_EQ(ReadFile(folder() / "status"), (movies::Bytes{'0', '\n'}));
    EXPECT_EQ(CountOf(RunCommand("cat " + In("told")).out, "cliphost: "), 0u);
    EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
}

TEST_F(JobsOfFrames, StopAtAPictureThatCantBeWritten) {
    const std::string movie = Quoted(Movie("p.mov", kProRes));
    for (const char* const jobs : {"1", "2"}) {
        const auto out = folder() / jobs;
        std::filesystem::create_directories(out / "p_000030.png");
        ExpectSays(
            RunCliphost("frame " + movie + " --range 0: -o " + Quoted(out) + " --jobs " + jobs), 2,
            (out / "p_000030.png").string() + ": not written: Is a directory");
        EXPECT_EQ(NamesIn(out).size(), 31u) << jobs;
    }
}

// One of four pieces is lost, whole.
TEST_F(JobsOfFrames, LoseOnePieceToACrashOrATooLongWait) {
    const auto movie = Movie("p.mov", kProRes);
    const std::string call = " --range 0:48 --jobs 2 --limit-seconds 4 -o ";
    const std::pair<const char*, const char*> harms[] = {
        {"crash-at-13.mov", "the process that read it was ended by signal 11"},
        {"leave-at-23.mov", "the process that read it ended with status 3 and without an answer"},
        {"nonsense-at-14.mov", "the process that read it gave an answer that is none"},
        {"hang-at-12.mov", "took longer than 4 seconds"}};
    for (const auto& [name, why] : harms) {
        SCOPED_TRACE(name);
        const std::string stem = std::filesystem::path(name).stem();
        std::filesystem::copy_file(movie, folder() / "in" / name);
        ExpectSays(Harmed("frame " + In("in/" + std::string(name)) + call + In(stem)), 1,
                   Line(name, std::string("frames 12 to 23 are left out: ") + why) +
                       (folder() / stem).string() + ": 36 pictures\n");
        const auto pictures = NamesIn(folder() / stem);
        EXPECT_EQ(pictures.size(), 36u);
        EXPECT_EQ(pictures.count(stem + "_000011.png"), 1u);
        EXPECT_EQ(pictures.count(stem + "_000012.png"), 0u);
        EXPECT_EQ(pictures.count(stem + "_000024.png"), 1u);
        EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
    }
}

// Otherwise the pictures before them would be decoded twice.
TEST_F(JobsOfFrames, AreInPiecesThatBeginWithAPictureThatStandsAlone) {
    const auto movie =
        Movie("crash-at-50.mov", "-c:v libx264 -pix_fmt yuv420p -bf 2 -g 40 -sc_threshold 0");
    ExpectSays(
        Harmed("frame " + Quoted(movie) + " --range 0: --jobs 2 -o " + In("a.raw")), 1,
        Line("crash-at-50.mov",
             "frames 40 to 79 are left out: the process that read it was ended by signal 11"));
}

// The last frame is read when frames are counted.
TEST_F(JobsOfFrames, LoseTheLastPieceAloneToHarmInTheLastFrame) {
    const auto movie = Movie("p.mov", kProRes);
    const std::pair<const char*, const char*> harms[] = {
        {"crash-at-95.mov", "the process that read it was ended by signal 11"},
        {"hang-at-95.mov", "took longer than 4 seconds"}};
    for (const auto& [name, why] : harms) {
        SCOPED_TRACE(name);
        std::filesystem::copy_file(movie, folder() / "in" / name);
        const std::string call = "frame " + In("in/" + std::string(name)) +
                                 " --jobs 2 --limit-seconds 4 -o " + In("a.raw");
        ExpectSays(Harmed(call + " --range 60:"), 1,
                   Line(name, std::string("frames 84 to 95 are left out: ") + why) +
                       (folder() / "a.raw").string() + ": 24 raw frames\n");
        ExpectSays(Harmed(call + " --range :30"), 0, ": 30 raw frames\n");
    }
}

// What it left of the piece is not taken, and the next process reads on.
TEST_F(JobsOfFrames, LoseOnePieceToAProcessThatDoesNotLeaveWhatItAnswers) {
    const auto movie = Movie("p.mov", kProRes);
    const std::string unwhole = "the process that read it left no whole file of frame 12";
    const std::tuple<const char*, const char*, std::string> harms[] = {
        {"remove-at-13", "pictures", unwhole},
        {"remove-at-13", "a.raw", unwhole},
        {"shorten-at-13", "a.raw", unwhole},
        {"throw-at-13", "a.raw", "thrown by the module"}};
    for (const auto& [harm, output, why] : harms) {
        SCOPED_TRACE(harm);
        const std::string name = std::string(harm) + ".mov";
        std::filesystem::copy_file(movie, folder() / "in" / name,
                                   std::filesystem::copy_options::overwrite_existing);
        ExpectSays(Harmed("frame " + In("in/" + name) + " --range 0:48 --jobs 2 -o " + In(output)),
                   1, Line(name, "frames 12 to 23 are left out: " + why));
    }
    EXPECT_EQ(NamesIn(folder() / "pictures").size(), 36u);
    EXPECT_EQ(std::filesystem::file_size(folder() / "a.raw"), 36u * 480 * 272 * 2);
}

TEST_F(JobsOfFrames, EndBySignalWhereNobodyReadsTheirOutput) {
    const auto movie = Movie("p.mov", kProRes);
    int ends[2];
    ASSERT_EQ(pipe(ends), 0);
    const pid_t program = fork();
    ASSERT_GE(program, 0);
    if (program == 0) {
        setenv("TMPDIR", (folder() / "tmp").c_str(), 1);
        dup2(ends[1], STDOUT_FILENO);
        close(ends[0]);
        close(ends[1]);
        execl((ProgramFolder() / "cliphost").c_str(), "cliphost", "frame", movie.c_str(), "--range",
              "0:", "--limit-seconds", "100", "-o", "-", nullptr);
        _exit(127);
    }
    close(ends[1]);
    int filled = 0;
    for (int i = 0; i < 1000 && filled < 65536; ++i) {
        std::this_thread::sleep_for(20ms);
        ASSERT_EQ(ioctl(ends[0], FIONREAD, &filled), 0);
    }
    EXPECT_EQ(filled, 65536) << "what the pipe holds";
    std::this_thread::sleep_for(200ms);
    ASSERT_EQ(kill(program, SIGTERM), 0);
    int status = 0;
    pid_t ended = 0;
    for (int i = 0; i < 500 && ended == 0; ++i) {
        std::this_thread::sleep_for(20ms);
        ended = waitpid(program, &status, WNOHANG);
    }
    EXPECT_EQ(ended, program) << "it goes on";
    if (ended == 0) {
        kill(program, SIGKILL);
        waitpid(program, &status, 0);
    }
    close(ends[0]);
    EXPECT_TRUE(WIFSIGNALED(status) && WTERMSIG(status) == SIGTERM) << status;
    EXPECT_TRUE(NamesIn(folder() / "tmp").empty());
}

TEST_F(JobsOfFrames, NameTheFolderForTemporaryFilesThatIsFull) {
    const std::string movie = Quoted(Movie("p.mov", kProRes));
    const CommandResult ran =
        RunCommand("ulimit -f 100; TMPDIR=" + In("tmp") + " " + Program() + " frame " + movie +
                   " --range 0: --limit-seconds 100 -o - 2>&1 >/dev/null | cat");
    EXPECT_NE(ran.out.find("cliphost: " + (folder() / "tmp").string() +
                           ": not written: File too large; name another folder in TMPDIR\n"),
              std::string::npos)
        << ran.out;
}

TEST_F(JobsOfFrames, RefuseLimitsForADescriptor) {
    const std::string movie = Quoted(MadeMovie("png.mov"));
    for (const char* const verb : {"describe -q", "frame --range 0: -o a.raw"}) {
        ExpectSays(
            RunCommand(Program() + " " + verb + " /dev/stdin --limit-seconds 9 2>&1 <" + movie), 2,
            "cliphost: /dev/stdin: limits can't be kept for a descriptor; name the file\n");
    }
}

TEST_F(JobsOfFrames, TellTheSameOfAModuleThatIsNot) {
    const std::string movie = Quoted(MadeMovie("png.mov"));
    EXPECT_EQ(ExpectTheSame(movie + " --range 0:30 --plugin /no/such", "pictures", kSeveral)
                  .printed.status,
              2);
}

TEST_F(JobsOfFrames, TakeAFolderForAFolderWhateverItsName) {
    std::filesystem::create_directories(folder() / "d.raw");
    EXPECT_FALSE(cliphost::IsRawFile(folder() / "d.raw"));
    EXPECT_TRUE(cliphost::IsRawFile(folder() / "e.raw"));
}

TEST_F(Jobs, EndAlikeWhereTheReaderOfWhatIsPrintedHasGone) {
    Copy("a.mov");
    Copy("b.mov");
    for (const char* const rest : {" --jobs 1", " --jobs 2", " --jobs 2 --out-dir "}) {
        const std::string out = rest[std::string(rest).size() - 1] == ' ' ? In("out") : "";
        RunCommand("{ env --default-signal=PIPE " + Program() + " describe " + In("in") + rest +
                   out + " 2>/dev/null; echo $? >" + In("status") + "; } | true");
        EXPECT_EQ(ReadFile(folder() / "status"), (movies::Bytes{'0', '\n'})) << rest;
    }
}

TEST_F(JobsOfFrames, LeaveALostPieceOutOfRawFrames) {
    const auto movie = Movie("crash-at-13.mov", kProRes);
    const std::string call = "frame " + Quoted(movie) + " --range 0:48 --jobs 2 -o ";
    ASSERT_EQ(RunCliphost(call + In("whole.raw")).status, 0);
    movies::Bytes rest = ReadFile(folder() / "whole.raw");
    const std::ptrdiff_t piece = 12 * 480 * 272 * 2;
    rest.erase(rest.begin() + piece, rest.begin() + 2 * piece);
    ExpectSays(Harmed(call + In("a.raw")), 1, "frames 12 to 23 are left out: ");
    EXPECT_TRUE(ReadFile(folder() / "a.raw") == rest);
}

TEST_F(JobsOfFrames, TellWhatIsToldOfTheOpeningOnce) {
    const auto movie = Movie("crash-at-setup.mov", kProRes);
    const CommandResult ran =
        Harmed("-v frame " + Quoted(movie) + " --range 0:48 --jobs 2 -o " + In("pictures"));
    ExpectSays(ran, 1, "frames 36 to 47 are left out: ");
    EXPECT_EQ(CountOf(ran.out, "Player negotiated"), 1u) << ran.out;
}

TEST_F(JobsOfFrames, LoseAMovieThatBreaksItsFirstReader) {
    std::filesystem::copy_file(Movie("p.mov", kProRes), folder() / "in/crash.mov");
    ExpectSays(Harmed("frame " + In("in/crash.mov") + " --range 0: --jobs 2 -o " + In("a.raw")), 1,
               Line("crash.mov", "the process that read it was ended by signal 11"));
    EXPECT_FALSE(std::filesystem::exists(folder() / "a.raw"));
}

TEST_F(JobsOfFrames, WriteNothingButTheirOwnFolder) {
    std::filesystem::copy_file(Movie("p.mov", kProRes), folder() / "in/probe-at-30.mov");
    const CommandResult ran = Harmed("-v frame " + In("in/probe-at-30.mov") +
                                     " --range 0: --jobs 2 -o " + In("pictures"));
    if (ran.out.find("Landlock") != std::string::npos) {
        GTEST_SKIP() << "the system has no Landlock";
    }
    for (const char* const what : {"socket", "process", "program", "writing the movie",
                                   "a file beside it", "removing the movie"}) {
        ExpectSays(ran, 0, std::string(what) + ": refused\n");
    }
    EXPECT_EQ(NamesIn(folder() / "pictures").size(), 96u);
}

TEST_F(Jobs, RefuseOddNumbers) {
    for (const char* const option :
         {"--jobs 0", "--jobs x", "--jobs 1.5", "--limit-seconds 0", "--limit-memory 10"}) {
        ExpectSays(RunCliphost("describe a.mov " + std::string(option)), 2,
                   "is not a whole number");
    }
    for (const std::string verb : {"describe", "contact", "frame"}) {
        ExpectSays(RunCliphost(verb + "-for-parent"), 2, "use `cliphost " + verb + "`");
    }
    EXPECT_EQ(RunCliphost("--help").out.find("-for-parent"), std::string::npos);
}

}  // namespace
