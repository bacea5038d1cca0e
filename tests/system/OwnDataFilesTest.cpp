// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A copy of the module with data files of the test's own beside it, for what
// the shipped ones have no record of.

#include <algorithm>
#include <fstream>
#include <sstream>

#include "tests/system/Command.h"
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

std::string TextOf(const std::filesystem::path& file) {
    std::ostringstream text;
    text << std::ifstream(file, std::ios::binary).rdbuf();
    return text.str();
}

// What the page on adding a codec says, done.
class AddedCodec : public OwnDataFiles {
protected:
    void SetUp() override {
        OwnDataFiles::SetUp();
        for (const char* const name : {"FourCharMapper.xml", "AAFInfo.xml"}) {
            std::filesystem::copy_file(ProgramFolder() / "plugins" / name, Place(name));
        }
        const std::string page = TextOf(CLIPHOST_CODEC_PAGE);
        const std::string fence = "```xml\n";
        for (std::size_t at = page.find(fence); at != std::string::npos;
             at = page.find(fence, at)) {
            at += fence.size();
            blocks_.push_back(page.substr(at, page.find("```", at) - at));
        }
        ASSERT_EQ(blocks_.size(), 2u);
    }

    std::filesystem::path Place(const std::string& name) { return folder() / "plugins" / name; }
    // Puts a text before the end of a file, as the page tells.
    void PutBeforeEnd(const std::string& name, const std::string& text) {
        std::string all = TextOf(Place(name));
        all.insert(all.rfind("</"), text);
        std::ofstream(Place(name)) << all;
    }
    void Replace(const std::string& name, const std::string& from, const std::string& to) {
        std::string all = TextOf(Place(name));
        const std::size_t at = all.rfind(from);
        ASSERT_NE(at, std::string::npos);
        std::ofstream(Place(name)) << all.replace(at, from.size(), to);
    }
    void Add() {
        PutBeforeEnd("FourCharMapper.xml", blocks_[0]);
        PutBeforeEnd("AAFInfo.xml", blocks_[1]);
    }
    CommandResult CheckData() { return RunCliphost("check-data " + Quoted(folder() / "plugins")); }
    std::string CliphostWithCopy() {
        return "--plugin " + Quoted(Place("QuickTimePlugin.nvx")) + " ";
    }

    std::vector<std::string> blocks_;
};

TEST_F(AddedCodec, IsFineAndChangesTheDescriptionOfItsMovies) {
    const std::string movie = Quoted(Write(FullFrame("mjp2", 25, 1)));
    const std::string old = Quoted(folder() / "old.aaf");
    ASSERT_EQ(RunCliphost(CliphostWithCopy() + "describe -q " + movie + " --bin " + old).status, 0);
    ExpectSays(CheckData(), 0, "no findings: ");
    Add();
    ExpectSays(CheckData(), 0, "no findings: ");
    const CommandResult told =
        RunCliphost(CliphostWithCopy() + "describe " + movie + " --against " + old);
    ExpectSays(told, 1, "-> {04010202-0301-0100-060E-2B3404010107}\n");
    ExpectSays(told, 1, "file descriptors: compression ");
    ExpectSays(RunCliphost(CliphostWithCopy() + "check-data"), 0, "no findings: ");
}

TEST_F(AddedCodec, IsToldWithItsPlaceWhereItHasAMistake) {
    Add();
    Replace("AAFInfo.xml", "rp210:ColorSiting=\"0\"", "rp210:ColorSiting=\"9\"");
    const std::string text = TextOf(Place("AAFInfo.xml"));
    const std::size_t at = text.find("rp210:ColorSiting=\"9\"");
    const auto line =
        std::count(text.begin(), text.begin() + static_cast<std::ptrdiff_t>(at), '\n') + 1;
    const std::size_t column = at - text.rfind('\n', at);
    ExpectSays(CheckData(), 1,
               "AAFInfo.xml:" + std::to_string(line) + ":" + std::to_string(column) +
                   ": rp210:ColorSiting can't be \"9\"; give 0 to 4, or 255\n1 finding: ");
}

TEST_F(AddedCodec, IsToldWhereItsIdLeadsNowhere) {
    Add();
    Replace("FourCharMapper.xml", "10800", "10801");
    ExpectSays(CheckData(), 1,
               "code \"mjp2\" leads to id 10801, which has no record; add a record");
    ExpectSays(CheckData(), 1, ": no code leads to id 10800; add a row with vcid 10800");
}

TEST_F(AddedCodec, IsToldWhereItBreaksTheFile) {
    PutBeforeEnd("AAFInfo.xml", "<MediaDescriptorSignature>\n");
    ExpectSays(CheckData(), 1, ": this is no well-formed XML: mismatched tag; correct it");
    // What a description says then leads to the same place.
    const std::string movie = Quoted(Write(FullFrame("v210", 25, 1)));
    ExpectSays(RunCliphost(CliphostWithCopy() + "describe " + movie), 2,
               "AAFInfo.xml: this data file");
}

TEST_F(AddedCodec, IsLookedForInAFolderThatHasBothFiles) {
    std::filesystem::remove(Place("AAFInfo.xml"));
    const CommandResult lacks = CheckData();
    ExpectSays(lacks, 2, "AAFInfo.xml: there is no such file or folder; give a folder that has");
    std::filesystem::remove(Place("FourCharMapper.xml"));
    EXPECT_EQ(CheckData().out.find("findings"), std::string::npos) << "nothing was looked at";
    ExpectSays(RunCliphost("check-data " + Quoted(folder() / "none")), 2, "there is no such file");
    ExpectSays(RunCliphost("check-data " + Quoted(Place("QuickTimePlugin.nvx"))), 2, "be listed");
}

}  // namespace
