// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The whole tree of one movie of each kind, kept as text in tests/golden. After a
// change that is meant, `./dev golden` writes the files anew and shows the difference.

#include <cstdlib>
#include <fstream>
#include <regex>
#include <sstream>

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "tests/system/SystemTest.h"

namespace {

// What differs from place to place and from FFmpeg to FFmpeg: the movie's
// folder, the number that comes of its bytes, and dates of making.
std::string Normalised(std::string text) {
    const auto replace = [&text](const char* pattern, const char* by) {
        text = std::regex_replace(text, std::regex(pattern), by);
    };
    replace("file:///[^\"]*/", "file:///FOLDER/");
    replace("(umid:060a2b34\\.01010101\\.01010f00\\.13[0-9a-f]{6})\\.[0-9a-f.]{35}", "$1.MATERIAL");
    replace("(CreationTime|LastModified) = [0-9T:.Z-]+", "$1 = DATE");
    return text;
}

std::string ReadText(const std::filesystem::path& file) {
    std::ifstream stream(file);
    std::ostringstream text;
    text << stream.rdbuf();
    return text.str();
}

struct GoldenMovie {
    const char* movie;
    bool useAlpha;
};

void PrintTo(const GoldenMovie& movie, std::ostream* to) {
    *to << movie.movie;
}

class Golden : public SystemTest, public testing::WithParamInterface<GoldenMovie> {};

TEST_P(Golden, TreeIsAsReviewed) {
    options.host.ignoreAlpha = !GetParam().useAlpha;
    Start();
    const std::string text =
        Normalised(cliphost::ToReadableText(Describe(MadeMovie(GetParam().movie))));
    const auto golden = std::filesystem::path(CLIPHOST_GOLDEN_FOLDER) /
                        (std::filesystem::path(GetParam().movie).stem().string() + ".txt");
    if (std::getenv("CLIPHOST_UPDATE_GOLDEN") != nullptr) {
        std::ofstream(golden) << text;
        GTEST_SKIP() << "wrote " << golden;
    }
    ASSERT_TRUE(std::filesystem::exists(golden)) << golden << " is missing";
    EXPECT_EQ(text, ReadText(golden));
}

INSTANTIATE_TEST_SUITE_P(
    Movies, Golden,
    testing::Values(GoldenMovie{"prores_with_pcm.mov", false},
                    GoldenMovie{"prores_hq_1080i.mov", false},
                    GoldenMovie{"prores_4444_alpha.mov", true}, GoldenMovie{"dv_pal.mov", false},
                    GoldenMovie{"imx50_pal.mov", false}, GoldenMovie{"xdcam_ex_1080i50.mov", false},
                    GoldenMovie{"avc_intra100_1080p25.mov", false}, GoldenMovie{"v210.mov", false},
                    GoldenMovie{"h264_with_aac.mov", false}, GoldenMovie{"h264_rec709.mov", false},
                    GoldenMovie{"h264_aspect.mov", false}, GoldenMovie{"png_alpha.mov", true},
                    GoldenMovie{"three_sounds.mov", false}, GoldenMovie{"pcm_s16be.mov", false},
                    GoldenMovie{"timecode_2997_drop.mov", false},
                    GoldenMovie{"rotated_270.mov", false}),
    [](const auto& test) { return std::filesystem::path(test.param.movie).stem().string(); });

// Where a checkout lies must change nothing but the path itself.
class GoldenFolders : public SystemTest {};

TEST_F(GoldenFolders, TreeHasTheSameLinesHoweverLongThePathIs) {
    const auto deep = folder() / std::string(120, 'a') / std::string(120, 'b');
    std::filesystem::create_directories(deep);
    const auto copy = deep / "png.mov";
    std::filesystem::copy_file(MadeMovie("png_alpha.mov"), copy);
    std::filesystem::copy_file(MadeMovie("png_alpha.mov"), folder() / "png.mov");
    const auto textOf = [this](const std::filesystem::path& movie) {
        return Normalised(cliphost::ToReadableText(Describe(movie)));
    };
    EXPECT_EQ(textOf(copy), textOf(folder() / "png.mov"));
}

// A check that can't tell two movies apart would be none.
TEST(GoldenText, KeepsWhatMattersWhenNormalised) {
    EXPECT_EQ(Normalised("URLString = \"file:///a/b c/png.mov\""),
              "URLString = \"file:///FOLDER/png.mov\"");
    EXPECT_EQ(Normalised("urn:smpte:umid:060a2b34.01010101.01010f00.13b10000.b909078d.134e66eb."
                         "d4514720.17efc229"),
              "urn:smpte:umid:060a2b34.01010101.01010f00.13b10000.MATERIAL");
    EXPECT_EQ(Normalised("StoredWidth = 720"), "StoredWidth = 720");
}

}  // namespace
