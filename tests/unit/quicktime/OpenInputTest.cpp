// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <chrono>
#include <fstream>

#include "reference_host/quicktime/OpenInput.h"
#include "tests/support/TestFiles.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

class OpenInput : public testing::Test {
protected:
    std::filesystem::path Write(const std::string& name, const std::string& text) {
        return folder_.Write(name, text);
    }
    std::filesystem::path Make(const std::string& name, const std::string& arguments,
                               const std::string& ending) {
        const MadeMovie movie(arguments, ending);
        std::filesystem::copy_file(movie.Path(), folder_ / name);
        return folder_ / name;
    }
    static host::InputOwner Open(const std::filesystem::path& path, std::string& reason) {
        return host::OpenInput(path, host::InputView::AsPresented, reason);
    }

    const TestFolder folder_;
};

// Lists open none of the files they name, not even those beside them.
TEST_F(OpenInput, ReachesNoOtherFile) {
    Make("beside.wav", "-f lavfi -i sine=d=0.2", ".wav");
    Make("beside.ts", "-f lavfi -i testsrc2=s=64x48:r=25:d=0.2", ".ts");
    std::string reason;
    EXPECT_FALSE(Open(Write("list.txt", "ffconcat version 1.0\nfile beside.wav\n"), reason));
    EXPECT_FALSE(reason.empty());
    EXPECT_FALSE(Open(Write("list.m3u8",
                            "#EXTM3U\n#EXT-X-TARGETDURATION:1\n#EXTINF:0.2,\nbeside.ts\n"
                            "#EXT-X-ENDLIST\n"),
                      reason));
}

// A name that looks like a pattern for many pictures is the name of one file.
TEST_F(OpenInput, TakesNamesAsTheyAre) {
    for (const char* const name : {"shot%03d.png", "shot*.png", "a:b ?#.png", "http:x.png"}) {
        const auto file = Make(name, "-f lavfi -i testsrc2=s=64x48 -frames:v 1", ".png");
        Make("shot001.png", "-f lavfi -i testsrc2=s=32x32 -frames:v 1", ".png");
        std::string reason;
        const auto input = Open(file, reason);
        ASSERT_TRUE(input) << name << ": " << reason;
        EXPECT_EQ(input->streams[0]->codecpar->width, 64) << name;
        std::filesystem::remove(folder_ / "shot001.png");
    }
}

TEST_F(OpenInput, RefusesWhatIsNoFile) {
    std::string reason;
    EXPECT_FALSE(Open(folder_.path(), reason));
    EXPECT_EQ(reason, "the file can't be read");
    EXPECT_FALSE(Open(folder_ / "absent.mov", reason));
    ASSERT_TRUE(MakePipe(folder_ / "pipe.mov"));
    const auto start = std::chrono::steady_clock::now();
    EXPECT_FALSE(Open(folder_ / "pipe.mov", reason));
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(1));
}

TEST_F(OpenInput, LeavesNothingOpen) {
    const auto opened = [] {
        return std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {});
    };
    const auto before = opened();
    std::string reason;
    EXPECT_FALSE(Open(Write("words.mov", "no movie at all"), reason));
    const auto file = Make("a.wav", "-f lavfi -i sine=d=0.2", ".wav");
    EXPECT_TRUE(Open(file, reason));
    EXPECT_EQ(opened(), before);
    const auto input = Open(file, reason);
    EXPECT_EQ(opened(), before + 1);
}

}  // namespace
