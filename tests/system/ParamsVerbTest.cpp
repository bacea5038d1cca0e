// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Parameters on the command line: what the program prints of them, and what
// their options change in what it lists and writes.

#include <fstream>
#include <iterator>

#include "tests/system/Command.h"
#include "tests/system/ParameterDocuments.h"
#include "tests/system/SystemTest.h"

namespace {

using namespace parameter_documents;

// Interlaced, upper field first, decoded to 8-bit and deeper formats.
constexpr char kInterlaced[] = "prores_4444_1080i.mov";

CommandResult Params(const std::string& arguments) {
    return RunCliphost("params " + arguments);
}

class ParamsVerb : public SystemTest {
protected:
    std::filesystem::path WriteText(const std::string& text, const std::string& name) {
        return Write(movies::Bytes(text.begin(), text.end()), name);
    }
    const std::string movie = Quoted(MadeMovie(kInterlaced));
};

TEST_F(ParamsVerb, PrintsChoicesWithAStarAtTheOneInUse) {
    const CommandResult ran = Params(movie + " --set 'Level Remapping=Expand'");
    EXPECT_EQ(ran.status, 0);
    EXPECT_EQ(ran.out, MadeMovie(kInterlaced).string() +
                           ": Custom\n"
                           "  Field Ordering (\"Field Ordering In File\")\n"
                           "      Progressive\n"
                           "      Interlaced - Odd (upper field first) ordered (default)\n"
                           "      Interlaced - Even (lower field first) ordered\n"
                           "    * as the file says: top field first\n"
                           "  Field Layout (\"Field Layout\")\n"
                           "      Merged\n"
                           "      Split\n"
                           "    * as the file says: merged (default)\n"
                           "  GFX-Video Level (\"Level Remapping\")\n"
                           "      Do not modify levels (default)\n"
                           "    * Expand video levels to graphic levels\n"
                           "      Compress graphic levels to video levels\n");
}

// The words of a parameter's present value, which has the star.
std::string Used(const std::string& out, const std::string& parameter) {
    const std::size_t from = out.find("(\"" + parameter + "\")");
    const std::size_t star = out.find("    * ", from);
    return star == std::string::npos ? "" : out.substr(star + 6, out.find('\n', star) - star - 6);
}

TEST_F(ParamsVerb, SaysWhatTheFileSaysWhereTheUserChoseNothing) {
    struct Case {
        const char* movie;
        const char* order;
    };
    for (const Case& each : {Case{kInterlaced, "as the file says: top field first"},
                             Case{"prores_hq_480i.mov", "as the file says: bottom field first"},
                             Case{"h264_bframes.mov", "as the file says: progressive"},
                             Case{"pcm_u8.mov", "as the file says (default)"}}) {
        SCOPED_TRACE(each.movie);
        const CommandResult ran = Params(Quoted(MadeMovie(each.movie)));
        EXPECT_EQ(ran.status, 0);
        EXPECT_EQ(Used(ran.out, "Field Ordering In File"), each.order) << ran.out;
        EXPECT_EQ(ran.out.find("none of these"), std::string::npos) << ran.out;
    }
}

TEST_F(ParamsVerb, SaysWhatTheFileSaysBesideWhatTheUserChose) {
    const CommandResult chosen =
        Params(movie + " --set 'Field Layout=Split' --set 'Field Ordering=Progressive'");
    EXPECT_EQ(Used(chosen.out, "Field Ordering In File"), "Progressive");
    EXPECT_EQ(Used(chosen.out, "Field Layout"), "Split");
    EXPECT_NE(chosen.out.find("      as the file says: merged (default)\n"), std::string::npos)
        << chosen.out;
    // A number that is no choice leaves the file's order in force, but not the
    // levels as they are.
    const CommandResult odd =
        Params(movie + " --set 'Field Ordering=99' --set 'Level Remapping=7'");
    EXPECT_EQ(Used(odd.out, "Field Ordering In File"), "99, so as the file says: top field first");
    EXPECT_EQ(Used(odd.out, "Level Remapping"), "none of these: 7");
}

TEST_F(ParamsVerb, PrintsTheNameOfASetOnOneLineWithoutCommandsToTheTerminal) {
    const auto file =
        WriteText(DocumentXml(SetXml(kSet, "", 1, "One&#10;two&#x9B;2J")), "name.xml");
    const CommandResult ran = Params(movie + " --set-xml " + Quoted(file));
    EXPECT_EQ(ran.status, 0);
    EXPECT_NE(ran.out.find(": One two 2J\n"), std::string::npos) << ran.out;
}

TEST_F(ParamsVerb, PrintsDocumentsThatItTakesBack) {
    const CommandResult values = Params(movie + " --set 'Field Layout=Split' --xml values");
    EXPECT_EQ(values.status, 0);
    const auto file = WriteText(values.out, "values.xml");
    const CommandResult again = Params(movie + " --set-xml " + Quoted(file) + " --xml values");
    EXPECT_EQ(again.status, 0);
    EXPECT_EQ(again.out, values.out);
    const CommandResult reset =
        Params(movie + " --set 'Level Remapping=1' --reset --set-xml " + Quoted(file) + " --json");
    EXPECT_EQ(reset.status, 0) << reset.out;
    EXPECT_NE(reset.out.find("\"value\": 512,"), std::string::npos) << "reset after the file";
    EXPECT_NE(reset.out.find("\"value\": 1,\n      \"default\": 16,"), std::string::npos)
        << "and before the values";
    EXPECT_NE(Params(movie + " --xml description").out.find("<parameterInfos>"), std::string::npos);
    EXPECT_NE(Params(movie + " --xml defaults").out.find("<valueUInt32>512<"), std::string::npos);
}

TEST_F(ParamsVerb, TellsTheCallerWhatWasWrong) {
    const auto broken = WriteText("<ncfComponents>", "broken.xml");
    const auto other = WriteText(DocumentXml(SetXml(kSet, "", 1), kSet), "other.xml");
    const struct {
        std::string arguments;
        int status;
        const char* words;
    } kCalls[] = {
        {"--set 'Volume=11'", 2, "no such parameter; it has these:\n    Field Ordering In File"},
        {"--set 'Level Remapping=Louder'", 2, "no such choice; write one of these"},
        {"--set 'Level Remapping='", 2, "no such choice"},
        {"--set 'Field Ordering=Interlaced'", 2, "several choices begin with this"},
        {"--set 'Field Ordering'", 2, "name=value"},
        {"--set-xml /no/such/file.xml", 2, "there is no such file"},
        {"--set-xml " + Quoted(broken), 2, "1:16: no element found"},
        {"--set-xml " + Quoted(other), 0, "so no value was changed"},
        {"--xml everything", 2, "--xml"},
        {"--xml values --json", 2, "--json"},
    };
    for (const auto& call : kCalls) {
        const CommandResult ran = Params(movie + " " + call.arguments);
        EXPECT_EQ(ran.status, call.status) << call.arguments << "\n" << ran.out;
        EXPECT_NE(ran.out.find(call.words), std::string::npos) << call.arguments << "\n" << ran.out;
    }
    EXPECT_EQ(Params("/no/such/movie.mov").status, 2);
    const auto text = WriteText("hello", "text.mov");
    const CommandResult ran = Params(Quoted(text));
    EXPECT_EQ(ran.status, 1);
    EXPECT_NE(ran.out.find("text.mov: the file holds 5 bytes and no atom"), std::string::npos)
        << ran.out;
}

// --- the same options of the verbs that show what follows -------------------------------------

TEST_F(ParamsVerb, OptionsChangeTheFormatsThatAreListed) {
    const auto document =
        WriteText(DocumentXml(std::string("<parameterSet id='") + kSet +
                              "'><parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'>"
                              "<valueUInt32>4096</valueUInt32></parameter></parameterSet>"),
                  "bottom.xml");
    const std::string fromFile = "--set-xml " + Quoted(document);
    const struct {
        std::string options;
        const char* height;
        const char* words;
    } kCalls[] = {
        {"", "field 1920 x 540", "interlaced, top field first, both fields in one frame"},
        {"--set 'Field Ordering=progressive'", "frame 1920 x 1080", "progressive"},
        {"--set 'Field Layout=Split'", "field 1920 x 540",
         "interlaced, top field first, each field by itself"},
        {fromFile, "field 1920 x 540", "interlaced, bottom field first, both fields in one frame"},
        {fromFile + " --reset", "field 1920 x 540", "top field first"},
    };
    for (const auto& call : kCalls) {
        const CommandResult ran = RunCliphost("formats " + movie + " " + call.options);
        EXPECT_EQ(ran.status, 0) << call.options << "\n" << ran.out;
        EXPECT_NE(ran.out.find(call.height), std::string::npos) << ran.out;
        EXPECT_NE(ran.out.find(call.words), std::string::npos) << ran.out;
    }
    EXPECT_EQ(RunCliphost("formats " + movie + " --set 'Volume=11'").status, 2);
}

TEST_F(ParamsVerb, OptionsChangeTheFrameThatIsWritten) {
    const std::string picture = Quoted(MadeMovie("png.mov"));
    const auto frame = [&](const std::string& arguments) {
        const std::filesystem::path file = folder() / "frame.raw";
        const CommandResult ran =
            RunCliphost("frame " + picture + " " + arguments + " -o " + Quoted(file));
        EXPECT_EQ(ran.status, 0) << ran.out;
        std::ifstream stream(file, std::ios::binary);
        return std::string((std::istreambuf_iterator<char>(stream)),
                           std::istreambuf_iterator<char>());
    };
    const std::string plain = frame("");
    const std::string expanded = frame("--set 'Level Remapping=Expand'");
    ASSERT_FALSE(plain.empty());
    EXPECT_EQ(expanded.size(), plain.size());
    EXPECT_NE(expanded, plain);
    EXPECT_EQ(frame("--set-xml " + Quoted(WriteText(DocumentXml(SetXml(kSet, "", 1)), "up.xml"))),
              expanded);
    EXPECT_EQ(frame("--reset"), plain);
}

}  // namespace
