// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/InputList.h"

#include <gtest/gtest.h>

#include "reference_host/cliphost/Failure.h"
#include "tests/unit/cliphost/TestFolder.h"

using namespace cliphost;
using namespace cliphost_tests;

namespace {

using Paths = std::vector<std::string>;

Paths PathsOf(const std::string& content, ListForm form = ListForm::Lines) {
    const TestFolder folder;
    WriteFile(folder / "list", content);
    Paths paths;
    for (const auto& path : ReadInputList(folder / "list", form)) {
        paths.push_back(std::filesystem::path(path).u8string());
    }
    return paths;
}

std::string WhyRefused(const std::filesystem::path& list, ListForm form = ListForm::Lines) {
    try {
        ReadInputList(list, form);
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), kExitCaller);
        return failure.what();
    }
    return "it was read";
}

TEST(InputList, TakesAPathFromEachLine) {
    EXPECT_EQ(PathsOf(""), Paths());
    EXPECT_EQ(PathsOf("a.mov\nb c.mov\n"), (Paths{"a.mov", "b c.mov"}));
    EXPECT_EQ(PathsOf("a\n\n\nb"), (Paths{"a", "b"})) << "the last line may have no end";
    EXPECT_EQ(PathsOf(" a \n#b\n-c\n\\d\n"), (Paths{" a ", "#b", "-c", "\\d"}));
    EXPECT_EQ(PathsOf("\xFF.mov\n"), (Paths{"\xFF.mov"}));
}

TEST(InputList, TakesListsOfOtherSystems) {
    EXPECT_EQ(PathsOf("\xEF\xBB\xBF"
                      "a\r\n\r\nb\r\n"),
              (Paths{"a", "b"}));
    EXPECT_EQ(PathsOf("a\rb\r\n"), (Paths{"a\rb"})) << "one at the end of a line alone";
    EXPECT_EQ(PathsOf("a\n\xEF\xBB\xBF"
                      "b\n"),
              (Paths{"a",
                     "\xEF\xBB\xBF"
                     "b"}));
}

// Lists are read in pieces, and a mark of UTF-16 is one at the very start alone.
TEST(InputList, TakesNamesThatBeginAsAMarkWouldWhereverAPieceBegins) {
    for (std::size_t size = 512; size <= std::size_t{1} << 20; size *= 2) {
        const std::string first(size - 1, 'a');
        EXPECT_EQ(PathsOf(first + "\n\xFF\xFE.mov"), (Paths{first, "\xFF\xFE.mov"})) << size;
    }
}

TEST(InputList, LeavesNamesBetweenZerosAsTheyAre) {
    const auto nulls = [](std::string text) {
        std::replace(text.begin(), text.end(), '|', '\0');
        return PathsOf(text, ListForm::Nulls);
    };
    EXPECT_EQ(nulls("a\nb|c\r|\xEF\xBB\xBF|d"), (Paths{"a\nb", "c\r", "\xEF\xBB\xBF", "d"}));
    EXPECT_EQ(nulls("||a||"), (Paths{"a"}));
    EXPECT_EQ(nulls(""), Paths());
}

TEST(InputList, TakesFileUrls) {
    EXPECT_EQ(PathsOf("file:///a%FFb%20c.mov\n"), (Paths{"/a\xFF"
                                                         "b c.mov"}));
    EXPECT_EQ(PathsOf("file://other/a.mov\n"), (Paths{"file://other/a.mov"}));
}

// Paths that lie across the pieces in which a list is read.
TEST(InputList, HasNoLimitOfLength) {
    std::string content;
    Paths paths;
    for (int i = 0; i < 30000; ++i) {
        paths.push_back("folder/" + std::to_string(i) + ".mov");
        content += paths.back() + "\r\n";
    }
    EXPECT_EQ(PathsOf(content), paths);
    const std::string longest(200000, 'x');
    EXPECT_EQ(PathsOf(longest + "\nb\n"), (Paths{longest, "b"}));
}

TEST(InputList, RefusesWhatIsNone) {
    const TestFolder folder;
    const std::filesystem::path file = folder / "list";
    const std::string list = file.u8string();
    EXPECT_EQ(WhyRefused(file), list + ": the list can't be read: No such file or directory");
    EXPECT_EQ(WhyRefused(folder.path()),
              folder.path().u8string() + ": the list can't be read: Is a directory");
    WriteFile(file, std::string("a\0b\0", 4));
    EXPECT_EQ(WhyRefused(file), list +
                                    ": the list has a byte of zero in it; give -0 where its "
                                    "paths end with one");
    WriteFile(file, std::string("\xFF\xFE"
                                "a\0\n\0",
                                6));
    EXPECT_EQ(WhyRefused(file), list + ": the list is in UTF-16; save it as UTF-8");
}

}  // namespace
