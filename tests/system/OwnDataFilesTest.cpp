// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A copy of the module with data files of the test's own beside it, for what
// the shipped ones have no record of.

#include <fstream>

#include "tests/system/Facts.h"
#include "tests/system/SystemTest.h"

namespace {

class OwnDataFiles : public SystemTest {
protected:
    void SetUp() override {
        const auto plugins = folder() / "plugins";
        std::filesystem::create_directory(plugins);
        std::filesystem::copy_file(ProgramFolder() / "plugins/QuickTimePlugin.nvx",
                                   plugins / "QuickTimePlugin.nvx");
        options.plugin = plugins / "QuickTimePlugin.nvx";
    }
    void StartWith(const std::string& mapper, const std::string& records) {
        std::ofstream(folder() / "plugins/FourCharMapper.xml") << "<Map>" << mapper << "</Map>";
        std::ofstream(folder() / "plugins/AAFInfo.xml")
            << "<AAFInfo xmlns:groups='g' xmlns:rp210='r' xmlns:types='t'>" << records
            << "</AAFInfo>";
        Start();
    }
    // A whole record of 1920 x 1080, told apart by its black level.
    static std::string Record(const std::string& id, int black) {
        return "<MediaDescriptorSignature><NivoInfo ResolutionID='" + id +
               "'/><groups:CDCIDescriptor"
               " rp210:PictureEssenceCoding='060e2b34-0401010d-04010202-03060100'"
               " rp210:EssenceContainerLabel='060e2b34-0401010d-0d010301-021c0100'"
               " rp210:FrameLayout='0' rp210:StoredWidth='1920' rp210:StoredHeight='1080'"
               " rp210:ComponentDepth='8' rp210:HorizontalSubsampling='2'"
               " rp210:VerticalSubsampling='1' rp210:ColorSiting='0' rp210:ColorRange='225'"
               " rp210:BlackRefLevel='" +
               std::to_string(black) +
               "' rp210:WhiteReflevel='235'>"
               "<rp210:AspectRatio types:Numerator='16' types:Denominator='9'/>"
               "<rp210:VideoLineMap><rp210:Element>42</rp210:Element></rp210:VideoLineMap>"
               "</groups:CDCIDescriptor></MediaDescriptorSignature>";
    }
    static movies::Movie FullFrame(const char* code, std::uint32_t timeScale,
                                   std::uint32_t frameDuration) {
        movies::VideoFormat format;
        format.codec = code;
        movies::Movie movie;
        movie.timeScale = timeScale;
        movie.tracks.push_back(movies::VideoTrack(format, 5, timeScale, frameDuration, 64));
        return movie;
    }
};

// One raster of a code leads to several records, by the movie's rate.
TEST_F(OwnDataFiles, AreAskedWithTheRateOfTheMovie) {
    StartWith("<FourCharMapping FourChar='NVj2'/><FourCharMapping FourChar='NVj2'/>",
              Record("551", 11) + Record("558", 12) + Record("559", 13) + Record("560", 14));
    struct {
        std::uint32_t timeScale;
        std::uint32_t frameDuration;
        const char* black;
    } const kRates[] = {{24000, 1001, "11"}, {30000, 1001, "12"}, {25, 1, "13"}, {24, 1, "14"}};
    for (const auto& rate : kRates) {
        const auto pictures =
            Pictures(Describe(FullFrame("NVj2", rate.timeScale, rate.frameDuration)));
        ASSERT_EQ(pictures.size(), 1u) << rate.timeScale;
        EXPECT_EQ(Fact(pictures[0], "BlackReferenceLevel"), rate.black) << rate.timeScale;
    }
}

}  // namespace
