// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/HelpWords.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>

#include "tests/support/Quoted.h"
#include "tests/support/TestFolder.h"

using namespace cliphost;

namespace {

// A command line with every kind of word.
class HelpWords : public testing::Test {
protected:
    HelpWords() {
        app_.footer("Exit status: 0.");
        app_.add_flag("-v", "Say more; -vv says all");
        app_.add_option("--module", module_, "Another module");
        CLI::App* const show = app_.add_subcommand("show", "Show what's there");
        show->footer(
            "Examples:\n  cliphost show x\n\nFields:\n  a\\b\n.hidden\n\nMore.\n\n"
            "Exit status: 0, shown; 1,\nnot.");
        show->add_option("files", files_, "Files")->required();
        show->add_option("-o,--output", output_, "Where to; - for standard output")
            ->group("Output: places");
        show->add_flag("--all-of-it", "It's all");
        app_.add_subcommand("list", "List");
        app_.add_subcommand("secret", "Not for users")->group("");
        app_.get_subcommand("list")->add_flag("--internal", "Not for users")->group("");
    }

    std::vector<HelpVerb> Help() { return HelpOf(app_); }

    // What bash offers for a line whose last word is being typed.
    std::string BashOffers(const std::string& words) {
        const TestFolder folder;
        std::ofstream(folder.path() / "c.bash") << BashCompletion(Help());
        std::ofstream(folder.path() / "try.bash")
            << "set -u; complete() { :; }; . " << Quoted(folder.path() / "c.bash")
            << "\nCOMP_WORDS=(" << words << "); COMP_CWORD=$((${#COMP_WORDS[@]} - 1)); _cliphost; "
            << "echo \"${COMPREPLY[*]}\"\n";
        FILE* const pipe = popen(("bash " + Quoted(folder.path() / "try.bash")).c_str(), "r");
        char line[1024] = "";
        const bool isRead = std::fgets(line, sizeof line, pipe) != nullptr;
        EXPECT_EQ(pclose(pipe), 0);
        std::string offers = isRead ? line : "";
        offers.erase(offers.find_last_not_of('\n') + 1);
        return offers;
    }

private:
    std::vector<std::string> files_;
    std::string output_;
    std::string module_;
    CLI::App app_{"Does things", "cliphost"};
};

bool Holds(const std::string& text, const std::string& words) {
    return text.find(words) != std::string::npos;
}

}  // namespace

TEST_F(HelpWords, NameTheProgramAndItsVerbsButNotThoseThatAreHidden) {
    const std::vector<HelpVerb> help = Help();
    ASSERT_EQ(help.size(), 3u);
    EXPECT_EQ(help[0].name, "");
    EXPECT_EQ(help[1].name, "show");
    EXPECT_EQ(help[2].name, "list");
    EXPECT_EQ(help[2].options.size(), 1u) << "help alone";
}

TEST_F(HelpWords, TellWhatOptionsTake) {
    const HelpVerb show = Help()[1];
    for (const HelpOption& option : show.options) {
        const bool isFiles = option.names[0] == "files";
        const bool isOutput = option.names[0] == "-o";
        EXPECT_EQ(option.isArgument, isFiles);
        EXPECT_EQ(option.isRequired, isFiles);
        EXPECT_EQ(option.mayRepeat, isFiles);
        EXPECT_EQ(option.takesValue, isFiles || isOutput);
        EXPECT_EQ(option.names.size(), isOutput || option.names[0] == "-h" ? 2u : 1u);
    }
}

TEST_F(HelpWords, GiveAManualPage) {
    const std::string page = ManPage(Help(), 1);
    EXPECT_EQ(page.rfind(".TH CLIPHOST\\-SHOW 1 ", 0), 0u) << page;
    EXPECT_TRUE(Holds(page, "cliphost\\-show \\- Show what's there\n"));
    EXPECT_TRUE(Holds(page, ".B cliphost show\n[\\fIoptions\\fR] \\fIfiles\\fR ...\n")) << page;
    EXPECT_TRUE(Holds(page, "\\fB\\-o, \\-\\-output\\fR \\fIvalue\\fR\n")) << page;
    EXPECT_TRUE(Holds(page, ".SH OUTPUT: PLACES\n"));
    EXPECT_TRUE(Holds(page, ".SH SEE ALSO\n.BR cliphost (1)\n"));
    EXPECT_TRUE(Holds(page, "a\\eb\n\\&.hidden\n")) << "no line is a request: " << page;
}

TEST_F(HelpWords, GiveAManualPageItsUsualSections) {
    EXPECT_TRUE(Holds(ManPage(Help(), 1),
                      ".SH EXIT STATUS\n.nf\n0, shown; 1,\nnot.\n.fi\n"
                      ".SH NOTES\n.nf\nFields:\n  a\\eb\n\\&.hidden\n\nMore.\n.fi\n"
                      ".SH EXAMPLES\n.nf\n  cliphost show x\n.fi\n.SH SEE ALSO\n"))
        << ManPage(Help(), 1);
    EXPECT_TRUE(Holds(ManPage(Help(), 0), ".SH EXIT STATUS\n.nf\n0.\n.fi\n.SH SEE ALSO\n"));
    std::vector<HelpVerb> help = Help();
    help[2].footer.clear();
    EXPECT_FALSE(Holds(ManPage(help, 2), ".nf")) << "it has none of them";
}

TEST_F(HelpWords, ListTheVerbsOnTheProgramsPage) {
    const std::string page = ManPage(Help(), 0);
    EXPECT_TRUE(Holds(page, ".BR cliphost\\-show (1)\nShow what's there\n")) << page;
    EXPECT_FALSE(Holds(page, "secret"));
}

TEST_F(HelpWords, CompleteVerbsAndOptionsInBash) {
    EXPECT_EQ(BashOffers("cliphost s"), "show");
    EXPECT_EQ(BashOffers("cliphost ''"), "show list");
    EXPECT_EQ(BashOffers("cliphost -v l"), "list");
    EXPECT_EQ(BashOffers("cliphost show --a"), "--all-of-it");
    EXPECT_EQ(BashOffers("cliphost list --a"), "");
    EXPECT_EQ(BashOffers("cliphost show -v"), "-v") << "the program's own, too";
    EXPECT_EQ(BashOffers("cliphost show x"), "") << "files are the shell's affair";
    EXPECT_EQ(BashOffers("cliphost --module show l"), "list") << "that is a file's name";
    EXPECT_EQ(BashOffers("cliphost --module show list --a"), "");
}

TEST_F(HelpWords, AreQuotedForZshAndFish) {
    const std::string zsh = ZshCompletion(Help());
    EXPECT_TRUE(Holds(zsh, "'show:Show what'\\''s there'")) << zsh;
    EXPECT_TRUE(Holds(zsh, "'--output:Where to'")) << zsh;
    const std::string fish = FishCompletion(Help());
    EXPECT_TRUE(Holds(fish, "-n __fish_use_subcommand -f -a show -d 'Show what\\'s there'"))
        << fish;
    EXPECT_TRUE(
        Holds(fish, "-n '__fish_seen_subcommand_from show' -s o -l output -r -d 'Where to'"))
        << fish;
    EXPECT_FALSE(Holds(zsh + fish, "secret"));
}
