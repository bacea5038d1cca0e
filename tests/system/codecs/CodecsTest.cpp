// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Whatever FFmpeg writes into a movie and reads again is described, mapped and
// delivered as FFmpeg's own tools read it.

#include <algorithm>
#include <cctype>
#include <functional>

#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"
#include "tests/system/codecs/Codecs.h"
#include "tests/system/codecs/KnownDifferences.h"
#include "tests/system/codecs/PictureCheck.h"
#include "tests/system/codecs/SampleMapCheck.h"
#include "tests/system/codecs/SoundCheck.h"
#include "tests/system/media/MediaCheck.h"

namespace {

using Differences = std::vector<std::string>;

class Codecs : public SystemTest, public testing::WithParamInterface<CodecCase> {
protected:
    // Makes the movie; fails the test when FFmpeg can't.
    std::filesystem::path Make(const char* map) {
        const CodecCase& each = GetParam();
        const auto made = folder() / ("made." + each.ending);
        const CommandResult result = RunCommand(
            "ffmpeg -nostdin -y -v error -f lavfi -i " + Quoted(each.source) + " -map " + map +
            " " + each.options + " -threads 1 -metadata creation_time=2026-01-31T12:00:00Z " +
            Quoted(made) + " 2>&1");
        EXPECT_EQ(result.status, 0) << result.out;
        if (each.copyBefore.empty() && each.copyBehind.empty()) {
            return made;
        }
        const auto copied = folder() / ("copied." + each.ending);
        const CommandResult copy =
            RunCommand("ffmpeg -nostdin -y -v error " + each.copyBefore + " -i " + Quoted(made) +
                       " -c copy " + each.copyBehind + " " + Quoted(copied) + " 2>&1");
        EXPECT_EQ(copy.status, 0) << copy.out;
        return copied;
    }

    void Hold(const char* aspect, const std::function<Differences()>& compare) {
        Differences differences;
        try {
            differences = compare();
        } catch (const std::exception& failure) {
            differences.push_back(failure.what());
        }
        const char* const why = WhyItDiffers(GetParam().name, aspect);
        if (why) {
            EXPECT_FALSE(differences.empty()) << aspect << ": should differ: " << why;
            return;
        }
        for (const std::string& difference : differences) {
            ADD_FAILURE() << aspect << ": " << difference;
        }
    }

    void HoldDescription(const std::filesystem::path& movie) {
        Hold("description", [&] {
            const MediaVerdict verdict = CheckMedia(session(), movie, folder() / "saved.aaf");
            Differences differences = verdict.differences;
            if (verdict.summary.find("refused") == 0) {
                differences.push_back(verdict.summary);
            }
            return differences;
        });
    }
};

class PictureCodecs : public Codecs {};
class SoundCodecs : public Codecs {};

TEST_P(PictureCodecs, AreReadAsFfmpegReadsThem) {
    const auto movie = Make("0:v");
    ASSERT_FALSE(HasFailure());
    HoldDescription(movie);
    const PlainPictures plain(movie);
    {
        cliphost::Essence essence(session(), movie);
        Hold("map", [&] { return SampleMapDifferences(essence); });
        Hold("pictures", [&] { return PictureDifferences(essence, plain); });
    }
    if (plain.form().hasAlpha) {
        options.host.ignoreAlpha = false;
        Start();
        cliphost::Essence essence(session(), movie);
        Hold("alpha", [&] { return AlphaDifferences(essence, plain); });
    }
}

TEST_P(SoundCodecs, AreReadAsFfmpegReadsThem) {
    const auto movie = Make("0:a");
    ASSERT_FALSE(HasFailure());
    HoldDescription(movie);
    cliphost::Essence essence(session(), movie);
    Hold("map", [&] { return SampleMapDifferences(essence); });
    Hold("sound", [&] { return SoundDifferences(essence, GetParam().reading); });
    if (GetParam().isExactAnywhere) {
        Hold("ranges", [&] { return SoundRangeDifferences(essence); });
    }
}

auto Only(const std::vector<CodecCase>& cases, TestSet set) {
    std::vector<CodecCase> chosen;
    std::copy_if(cases.begin(), cases.end(), std::back_inserter(chosen),
                 [set](const CodecCase& each) { return each.set == set; });
    return testing::ValuesIn(chosen);
}

std::string NameOf(const testing::TestParamInfo<CodecCase>& info) {
    std::string name = info.param.name;
    std::replace_if(
        name.begin(), name.end(), [](unsigned char c) { return !std::isalnum(c); }, '_');
    return name;
}

// The names tell which runs test them.
INSTANTIATE_TEST_SUITE_P(Always, PictureCodecs, Only(PictureCodecCases(), TestSet::kAlways),
                         NameOf);
INSTANTIATE_TEST_SUITE_P(Broad, PictureCodecs, Only(PictureCodecCases(), TestSet::kBroad), NameOf);
INSTANTIATE_TEST_SUITE_P(Thorough, PictureCodecs, Only(PictureCodecCases(), TestSet::kThorough),
                         NameOf);
INSTANTIATE_TEST_SUITE_P(Always, SoundCodecs, Only(SoundCodecCases(), TestSet::kAlways), NameOf);
INSTANTIATE_TEST_SUITE_P(Broad, SoundCodecs, Only(SoundCodecCases(), TestSet::kBroad), NameOf);
INSTANTIATE_TEST_SUITE_P(Thorough, SoundCodecs, Only(SoundCodecCases(), TestSet::kThorough),
                         NameOf);

}  // namespace
