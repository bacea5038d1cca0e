// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/OptionChecks.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/Failure.h"
#include "tests/support/TestFiles.h"
#include "tests/unit/cliphost/TestFolder.h"

using namespace cliphost_tests;

namespace {

std::string Problem(const CLI::Validator& check, std::string text) {
    return check(text);
}

}  // namespace

TEST(OptionChecks, TakeWholeNumbersAlone) {
    const CLI::Validator check = cliphost::WholeNumber();
    EXPECT_EQ(Problem(check, "0"), "");
    EXPECT_EQ(Problem(check, "18446744073709551615"), "");
    for (const char* const text :
         {"-1", "18446744073709551616", "1.5", "nan", "abc", "", " 1", "1 ", "0x10", "+1"}) {
        EXPECT_NE(Problem(check, text).find("is not a whole number from 0 to"), std::string::npos)
            << text;
    }
    EXPECT_NE(Problem(cliphost::WholeNumber(1), "0"), "");
    EXPECT_EQ(Problem(cliphost::SmallWholeNumber(), "4294967295"), "");
    EXPECT_NE(Problem(cliphost::SmallWholeNumber(), "4294967296"), "");
}

TEST(OptionChecks, TakeFrameRatesThatAMovieCanHave) {
    for (const char* const text : {"25", "23.976", "0.01", "10000", "1e2"}) {
        EXPECT_EQ(Problem(cliphost::FrameRate(), text), "") << text;
    }
    for (const char* const text : {"nan", "inf", "-inf", "0", "-25", "1e-300", "1e300", "1e400",
                                   "25fps", "", "30000/1001"}) {
        EXPECT_NE(Problem(cliphost::FrameRate(), text).find("write it such as 25"),
                  std::string::npos)
            << text;
    }
}

TEST(OptionChecks, TakeAFileUrlAsThePathThatItNames) {
    CLI::App app;
    std::filesystem::path path;
    std::vector<std::string> texts;
    bool flag = false;
    app.add_option("path", path);
    app.add_option("--text", texts)->check([](const std::string& text) {
        return text == "/b" || text == "plain" ? "" : "the check comes first";
    });
    app.add_flag("--flag", flag);
    cliphost::TakeFileUrls(app);
    app.parse("file:///a%20b/caf%E9.mov --flag --text file:///b --text plain");
    EXPECT_EQ(path.u8string(), "/a b/caf\xE9.mov");
    EXPECT_EQ(texts, (std::vector<std::string>{"/b", "plain"}));
    EXPECT_THROW(app.parse("file://server/a.mov"), CLI::ValidationError);
    EXPECT_THROW(app.parse("file:///a%zz.mov"), CLI::ValidationError);
}

TEST(OptionChecks, RefuseAnOutputThatIsTheMovieByAnyName) {
    const TestFolder folder;
    WriteFile(folder / "a.mov", "movie");
    std::filesystem::create_hard_link(folder / "a.mov", folder / "hard.mov");
    std::vector<const char*> names = {"a.mov", "hard.mov", "./a.mov"};
    if (MakeLink(folder / "a.mov", folder / "soft.mov")) {
        names.push_back("soft.mov");
    }
    for (const char* const name : names) {
        EXPECT_THROW(cliphost::RefuseOutputOntoMovie(folder / name, folder / "a.mov"),
                     cliphost::Failure)
            << name;
    }
    EXPECT_NO_THROW(cliphost::RefuseOutputOntoMovie(folder / "b.mov", folder / "a.mov"));
    EXPECT_NO_THROW(cliphost::RefuseOutputOntoMovie("-", folder / "a.mov"));
}
