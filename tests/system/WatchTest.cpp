// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// `describe --watch`: movies that arrive, grow, change and fail; folders that come and go; its end.

#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <csignal>
#include <fstream>
#include <nlohmann/json.hpp>
#include <sstream>
#include <thread>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using namespace std::chrono_literals;

class Watch : public SystemTest {
protected:
    ~Watch() override {
        if (process_ > 0) {
            Stop(SIGKILL);
        }
    }

    std::filesystem::path In() { return folder() / below_; }
    std::filesystem::path In(const std::string& name) { return In() / name; }
    std::filesystem::path Out(const std::string& name) { return folder() / "out" / name; }
    void Copy(const std::string& movie, const std::filesystem::path& to) {
        std::filesystem::create_directories(to.parent_path());
        std::filesystem::copy_file(MadeMovie(movie), to);
    }
    void Begin(const std::string& options = "") {
        std::filesystem::create_directories(In());
        const std::string call = "exec " + Quoted(ProgramFolder() / "cliphost") +
                                 " describe -q --watch " + Quoted(In()) +
                                 " --rest 1 --skip-done --out-dir " + Quoted(folder() / "out") +
                                 " " + options + " >>" + Quoted(folder() / "told") + " 2>&1";
        process_ = fork();
        if (process_ == 0) {
            execl("/bin/sh", "sh", "-c", call.c_str(), nullptr);
            _exit(127);
        }
    }
    // The signal that ended it, or -1.
    int Stop(int signal = SIGTERM) {
        kill(process_, signal);
        int status = 0;
        waitpid(process_, &status, 0);
        process_ = 0;
        return WIFSIGNALED(status) ? WTERMSIG(status) : -1;
    }
    // Of one that ends by itself.
    int ExitStatus() {
        int status = 0;
        waitpid(process_, &status, 0);
        process_ = 0;
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }
    std::string Told() {
        std::ostringstream text;
        text << std::ifstream(folder() / "told").rdbuf();
        return text.str();
    }
    template <class Holds>
    bool Within(std::chrono::seconds time, const Holds& holds) {
        for (const auto end = std::chrono::steady_clock::now() + time;
             std::chrono::steady_clock::now() < end; std::this_thread::sleep_for(20ms)) {
            if (holds()) {
                return true;
            }
        }
        return false;
    }
    bool Tells(const std::string& words) {
        return Within(30s, [&] { return Told().find(words) != std::string::npos; });
    }
    bool Makes(const std::string& name) {
        return Within(30s, [&] { return std::filesystem::exists(Out(name)); });
    }

    std::string below_ = "in";
    pid_t process_ = 0;
};

TEST_F(Watch, DescribesWhatIsThereAndWhatArrives) {
    Copy("png.mov", In("first.mov"));
    Begin();
    EXPECT_TRUE(Makes("first.aaf")) << Told();
    Copy("mjpeg.mov", In("second.mov"));
    Copy("mjpeg.mov", In("other.txt"));
    EXPECT_TRUE(Makes("second.aaf")) << Told();
    Copy("png.mov", folder() / "third.mov");
    std::filesystem::rename(folder() / "third.mov", In("third.mov"));
    EXPECT_TRUE(Makes("third.aaf")) << Told();
    EXPECT_EQ(Stop(), SIGTERM);
    EXPECT_TRUE(Tells("the watch ends by signal 15: 3 described, 0 not, 0 done already")) << Told();
    EXPECT_FALSE(std::filesystem::exists(Out("other.aaf")));
    // Nothing is done twice, neither by a second watch.
    Begin();
    Copy("png.mov", In("fourth.mov"));
    EXPECT_TRUE(Makes("fourth.aaf")) << Told();
    EXPECT_EQ(Stop(SIGINT), SIGINT);
    EXPECT_TRUE(Tells("1 described, 0 not, 3 done already")) << Told();
}

TEST_F(Watch, WaitsUntilAMovieIsWhole) {
    Begin();
    const movies::Bytes bytes = ReadFile(MadeMovie("png.mov"));
    {
        std::ofstream slow(In("slow.mov"), std::ios::binary);
        for (int piece = 0; piece < 4; ++piece) {
            const std::size_t from = bytes.size() * piece / 4;
            const std::size_t to = bytes.size() * (piece + 1) / 4;
            slow.write(reinterpret_cast<const char*>(bytes.data()) + from,
                       static_cast<std::streamsize>(to - from))
                .flush();
            std::this_thread::sleep_for(500ms);
            EXPECT_FALSE(std::filesystem::exists(Out("slow.aaf")));
        }
    }
    EXPECT_TRUE(Makes("slow.aaf")) << Told();
    Stop();
    EXPECT_TRUE(Tells("1 described, 0 not")) << Told();
}

TEST_F(Watch, TellsOfBadMoviesAndGoesOn) {
    Begin();
    std::ofstream(In("bad.mov")) << "bad";
    EXPECT_TRUE(Tells("bad.mov: the file holds 3 bytes")) << Told();
    Copy("png.mov", In("good.mov"));
    EXPECT_TRUE(Makes("good.aaf")) << Told();
    // Mended, it counts again.
    std::filesystem::remove(In("bad.mov"));
    Copy("mjpeg.mov", In("bad.mov"));
    EXPECT_TRUE(Makes("bad.aaf")) << Told();
    Stop();
    EXPECT_TRUE(Tells("2 described, 1 not")) << Told();
}

TEST_F(Watch, SeesNewFoldersAndKeepsNamesApart) {
    Copy("png.mov", In("a/clip.mov"));
    Begin("--recursive");
    EXPECT_TRUE(Makes("clip.aaf")) << Told();
    Copy("mjpeg.mov", folder() / "b/c/clip.mov");
    std::filesystem::rename(folder() / "b", In("b"));
    EXPECT_TRUE(Makes("clip-2.aaf")) << Told();
    Copy("png.mov", In("b/c/d/last.mov"));
    EXPECT_TRUE(Makes("last.aaf")) << Told();
    // Written anew, a movie keeps the name of its output.
    std::filesystem::last_write_time(In("a/clip.mov"),
                                     std::filesystem::file_time_type::clock::now());
    Copy("png.mov", In("z.mov"));
    EXPECT_TRUE(Makes("z.aaf")) << Told();
    Stop();
    EXPECT_FALSE(std::filesystem::exists(Out("clip-3.aaf")));
}

// A link upwards leads to folders that are known.
TEST_F(Watch, TakesNoMovieAgainByAnotherPath) {
    Copy("png.mov", In("a/first.mov"));
    Begin("--recursive");
    EXPECT_TRUE(Makes("first.aaf")) << Told();
    Copy("mjpeg.mov", folder() / "b/second.mov");
    std::filesystem::create_directory_symlink(In(), folder() / "b/up");
    std::filesystem::rename(folder() / "b", In("b"));
    EXPECT_TRUE(Makes("second.aaf")) << Told();
    Copy("png.mov", In("a/third.mov"));
    EXPECT_TRUE(Makes("third.aaf")) << Told();
    Stop();
    EXPECT_TRUE(Tells("3 described, 0 not, 0 done already")) << Told();
    EXPECT_EQ(Told().find("b/up"), std::string::npos) << Told();
}

TEST_F(Watch, FollowsLinksToFolders) {
    Copy("png.mov", folder() / "other/deep/first.mov");
    Begin("--recursive");
    Copy("mjpeg.mov", In("here.mov"));
    EXPECT_TRUE(Makes("here.aaf")) << Told();
    std::filesystem::create_directory_symlink(folder() / "other", In("link"));
    EXPECT_TRUE(Makes("first.aaf")) << Told();
    Copy("mjpeg.mov", folder() / "other/deep/second.mov");
    EXPECT_TRUE(Makes("second.aaf")) << Told();
    Stop();
    EXPECT_TRUE(Tells("3 described, 0 not, 0 done already")) << Told();
}

TEST_F(Watch, EndsWithoutTheFolderForOutputs) {
    Begin();
    Copy("png.mov", In("first.mov"));
    EXPECT_TRUE(Tells("first.aaf")) << Told();
    std::filesystem::remove_all(folder() / "out");
    Copy("png.mov", In("second.mov"));
    EXPECT_TRUE(Tells("out: the folder for outputs went away")) << Told();
    EXPECT_EQ(ExitStatus(), 2);
    EXPECT_FALSE(std::filesystem::exists(folder() / "out"));
}

TEST_F(Watch, EndsWhenNobodyReadsWhatItPrints) {
    Copy("png.mov", In("first.mov"));
    for (const std::string form : {"-q", "--jsonl"}) {
        const std::string told = Quoted(folder() / "told");
        RunCommand("{ timeout 60 " + Quoted(ProgramFolder() / "cliphost") + " describe " + form +
                   " --watch " + Quoted(In()) + " --rest 1 --out-dir " + Quoted(folder() / "out") +
                   " 2>" + told + "; echo status $? >>" + told + "; } | true");
        EXPECT_NE(Told().find("standard output: not written: Broken pipe"), std::string::npos)
            << Told();
        EXPECT_NE(Told().find("status 2"), std::string::npos) << Told();
    }
}

TEST_F(Watch, TellsOfMoviesOfOneRowAndGoesOn) {
    std::ofstream(folder() / "in.csv") << "name,Scene\nclip,1\nlast,2\n";
    Copy("png.mov", In("a/clip.mov"));
    Copy("mjpeg.mov", In("b/clip.mov"));
    Begin("--recursive --columns " + Quoted(folder() / "in.csv"));
    EXPECT_TRUE(Tells("row 2: clip may be ")) << Told();
    Copy("png.mov", In("first.mov"));
    Copy("png.mov", In("a/last.mov"));
    EXPECT_TRUE(Makes("first.aaf")) << Told();
    EXPECT_TRUE(Makes("last.aaf")) << Told();
    // The row is that of the movie which came first.
    Copy("mjpeg.mov", In("b/last.mov"));
    EXPECT_TRUE(Tells("row 3: last may be ")) << Told();
    Stop();
    EXPECT_TRUE(Tells("the watch ends by signal 15")) << Told();
}

TEST_F(Watch, LooksWithoutBeingTold) {
    Copy("png.mov", In("first.mov"));
    Begin("--poll 1 --extensions MOV,mp4");
    EXPECT_TRUE(Makes("first.aaf")) << Told();
    Copy("h264_mp4_header_last.mp4", In("second.mp4"));
    EXPECT_TRUE(Makes("second.aaf")) << Told();
    std::filesystem::rename(In(), folder() / "away");
    EXPECT_TRUE(Tells("is not watched")) << Told();
    std::filesystem::rename(folder() / "away", In());
    EXPECT_TRUE(Tells("is there again")) << Told();
    Stop();
}

TEST_F(Watch, TellsOfFoldersThatGoAndComeBack) {
    Begin();
    Copy("png.mov", In("first.mov"));
    EXPECT_TRUE(Makes("first.aaf")) << Told();
    std::filesystem::rename(In(), folder() / "away");
    EXPECT_TRUE(Tells("in: is not watched: it went away")) << Told();
    Copy("mjpeg.mov", folder() / "away/second.mov");
    std::filesystem::rename(folder() / "away", In());
    EXPECT_TRUE(Tells("in: is there again")) << Told();
    EXPECT_TRUE(Makes("second.aaf")) << Told();
    Stop();
    EXPECT_TRUE(Tells("2 described, 0 not, 0 done already")) << Told();
}

TEST_F(Watch, TellsOfFoldersAboveThatGoAndComeBack) {
    below_ = "above/below";
    Begin();
    Copy("png.mov", In("first.mov"));
    EXPECT_TRUE(Makes("first.aaf")) << Told();
    std::filesystem::rename(folder() / "above", folder() / "away");
    EXPECT_TRUE(Tells("below: is not watched: ")) << Told();
    Copy("mjpeg.mov", In("second.mov"));
    EXPECT_TRUE(Tells("below: is there again")) << Told();
    EXPECT_TRUE(Makes("second.aaf")) << Told();
    Stop();
}

// What happens while the system keeps no more is found by looking at all again.
TEST_F(Watch, FindsWhatItMissed) {
    std::size_t most = 0;
    std::ifstream("/proc/sys/fs/inotify/max_queued_events") >> most;
    if (most == 0 || most > 100'000) {
        GTEST_SKIP() << "so many changes take too long to make: " << most;
    }
    Begin();
    Copy("png.mov", In("first.mov"));
    EXPECT_TRUE(Makes("first.aaf")) << Told();
    kill(process_, SIGSTOP);
    for (std::size_t i = 0; i < most; ++i) {
        std::ofstream(In(std::to_string(i)));
    }
    Copy("mjpeg.mov", In("second.mov"));
    kill(process_, SIGCONT);
    EXPECT_TRUE(Makes("second.aaf")) << Told();
    EXPECT_TRUE(Tells("looks at all again")) << Told();
    Stop();
}

TEST_F(Watch, PrintsALineForEachMovie) {
    Copy("png.mov", In("first.mov"));
    Begin("--jsonl");
    EXPECT_TRUE(Tells("\"route\"")) << Told();
    const std::string told = Told();
    EXPECT_EQ(nlohmann::json::parse(told.substr(0, told.find('\n')))["aaf"],
              Out("first.aaf").string());
    Stop();
}

TEST_F(Watch, RefusesWhatItCannotWatch) {
    const std::string out = " --out-dir " + Quoted(folder() / "out") + " ";
    ExpectSays(RunCliphost("describe --watch" + out + Quoted(folder() / "none")), 2, "none");
    ExpectSays(RunCliphost("describe --watch" + out + Quoted(MadeMovie("png.mov"))), 2, "png.mov");
    ExpectSays(RunCliphost("describe --watch" + out), 2, "paths");
    ExpectSays(RunCliphost("describe --watch " + Quoted(folder())), 2, "--out-dir");
    ExpectSays(RunCliphost("describe --watch --json" + out + Quoted(folder())), 2, "excludes");
    ExpectSays(RunCliphost("describe --watch --rest 0" + out + Quoted(folder())), 2, "--rest");
    ExpectSays(RunCliphost("describe --rest 2" + out + Quoted(folder())), 2, "--watch");
    ExpectSays(RunCliphost("describe --watch --out-dir " + Quoted(MadeMovie("png.mov")) + " " +
                           Quoted(folder())),
               2, "png.mov");
}

}  // namespace
