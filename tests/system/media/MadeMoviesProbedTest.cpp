// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What FFmpeg makes, compared with what ffprobe says of it.

#include "tests/system/SystemTest.h"
#include "tests/system/media/Defects.h"
#include "tests/system/media/MediaCheck.h"

namespace {

class ProbedMovies : public SystemTest {};

TEST_F(ProbedMovies, AreDescribedAsTheProbeReadsThem) {
    int checked = 0;
    for (const auto& entry : std::filesystem::directory_iterator(MadeMoviesFolder())) {
        if (entry.path().filename().string()[0] == '.') {
            continue;
        }
        SCOPED_TRACE(entry.path());
        const MediaVerdict verdict = CheckMedia(session(), entry.path(), folder() / "saved.aaf");
        for (const std::string& difference : verdict.differences) {
            ADD_FAILURE() << difference;
        }
        EXPECT_TRUE(verdict.isRight) << verdict.summary;
        EXPECT_EQ(verdict.summary.find("refused"), std::string::npos);
        ++checked;
    }
    EXPECT_GT(checked, 100);
}

class Defects : public SystemTest {
protected:
    std::vector<std::string> Of(const std::filesystem::path& file) {
        return DefectsOf(file, ProbeFile(file), 25);
    }
};

// A check that lets everything pass would be none.
TEST_F(Defects, AreNotFoundInSoundMovies) {
    for (const char* const name :
         {"png.mov", "h264_with_aac.mov", "pcm_s16be.mov", "h264_mp4_header_last.mp4", "aac.m4a"}) {
        EXPECT_TRUE(Of(MadeMovie(name)).empty()) << name;
    }
}

TEST_F(Defects, AreNamed) {
    EXPECT_EQ(Of(Write(movies::Bytes{}, "a.mov")), std::vector<std::string>{"empty"});
    EXPECT_EQ(Of(Write(movies::Bytes(100, 'x'), "b.mov")),
              std::vector<std::string>{"no movie of the family"});
    movies::Bytes cut = ReadFile(MadeMovie("h264_header_first.mov"));
    cut.resize(300);
    EXPECT_EQ(Of(Write(cut, "c.mov")), std::vector<std::string>{"cut in the movie header"});
    movies::Movie clock;
    clock.tracks.push_back(movies::TimecodeTrack(movies::TimecodeFormat(), 90000, 100));
    EXPECT_EQ(Of(Write(clock)), std::vector<std::string>{"no picture and no sound"});
    movies::Movie brief;
    brief.timeScale = 48000;
    brief.tracks.push_back(movies::SoundTrack(movies::SoundFormat(), 480));
    EXPECT_EQ(Of(Write(brief)), std::vector<std::string>{"sound shorter than a frame"});
}

}  // namespace
