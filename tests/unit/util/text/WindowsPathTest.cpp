// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/WindowsPath.h"

#include <gtest/gtest.h>

namespace {

using namespace host::text;

TEST(WindowsPathProblem, OrdinaryPathsHaveNone) {
    const char* const paths[] = {
        "",
        "a.mov",
        ".",
        "..",
        "..\\a.mov",
        "C:\\Users\\J\xC3\xBCrgen\\\xE6\x98\xA0\xE7\x94\xBB \xF0\x9F\x8E\xAC.mov",
        "C:a.mov",
        "C:/both/kinds\\of slash",
        "\\\\server\\share\\a.mov",
        "\\\\?\\C:\\a.mov",
        "\\\\?\\UNC\\server\\share\\a.mov",
        "CONSOLE.mov",
        "COM10.mov",
        "my NUL.mov",
        ".hidden",
        "a.b.c",
    };
    for (const char* const path : paths) {
        EXPECT_EQ(WindowsPathProblem(path), "") << path;
    }
}

TEST(WindowsPathProblem, NamesOfDevicesAreTold) {
    for (const char* const path :
         {"NUL", "nul", "C:\\folder\\Con.mov", "aux.tar.gz", "COM1", "lpt9.x", "PRN .mov",
          "COM\xC2\xB9", "conin$", "a/NUL/b", "\\\\.\\PhysicalDrive0"}) {
        EXPECT_NE(WindowsPathProblem(path).find("device"), std::string::npos) << path;
    }
}

TEST(WindowsPathProblem, WhatTheSystemLeavesOutAtAnEndIsTold) {
    EXPECT_EQ(WindowsPathProblem("C:\\a.mov."),
              "'a.mov.' ends with a dot, which the system leaves out");
    EXPECT_EQ(WindowsPathProblem("folder \\a.mov"),
              "'folder ' ends with a space, which the system leaves out");
    EXPECT_NE(WindowsPathProblem("..."), "");
}

TEST(WindowsPathProblem, CharactersThatNoNameHasAreTold) {
    EXPECT_EQ(WindowsPathProblem("a?.mov"), "'a?.mov' has ? in it, which no name can have");
    EXPECT_EQ(WindowsPathProblem("a\nb"),
              "'a\nb' has a control character in it, which no name can have");
    for (const char* const path : {"C:\\a<b", "a>b", "a\"b", "a|b", "*.mov", "C:\\a.mov:stream"}) {
        EXPECT_NE(WindowsPathProblem(path), "") << path;
    }
}

TEST(WindowsPathProblem, VerbatimPathsNeedADriveOrAShare) {
    for (const char* const path : {R"(\\?\Volume{1}\a.mov)", R"(\\?\a.mov)", R"(\\?\)"}) {
        EXPECT_EQ(WindowsPathProblem(path), R"(behind \\?\ stands neither a drive nor a share)")
            << path;
    }
}

TEST(WindowsPathProblem, NamesAreMeasuredInUtf16) {
    std::string pairs;
    for (int i = 0; i < 127; ++i) {
        pairs += "\xF0\x9F\x8E\xAC";
    }
    EXPECT_EQ(WindowsPathProblem(std::string(255, 'n')), "");
    EXPECT_NE(WindowsPathProblem(std::string(256, 'n')), "");
    EXPECT_EQ(WindowsPathProblem(pairs + "n"), "");
    EXPECT_NE(WindowsPathProblem(pairs + "nn"), "");
}

TEST(WithoutVerbatimStart, LeavesThePathThatOthersUnderstand) {
    EXPECT_EQ(WithoutVerbatimStart("\\\\?\\C:\\a"), "C:\\a");
    EXPECT_EQ(WithoutVerbatimStart("\\\\?\\unc\\server\\share"), "\\\\server\\share");
    EXPECT_EQ(WithoutVerbatimStart("\\\\?\\Volume{1}\\a"), "\\\\?\\Volume{1}\\a");
    EXPECT_EQ(WithoutVerbatimStart("C:\\a"), "C:\\a");
}

struct Form {
    const char* path;
    const char* url;
};
const Form kForms[] = {
    {"C:\\a b\\c.mov", "file:///C:/a%20b/c.mov"},
    {"\\\\server\\share\\\xC3\xBC.mov", "file://server/share/%C3%BC.mov"},
    {"Z:\\", "file:///Z:/"},
};

TEST(WindowsUrls, ArePathsAgain) {
    for (const Form& form : kForms) {
        std::string path;
        EXPECT_EQ(UrlOfWindowsPath(form.path), form.url);
        EXPECT_TRUE(WindowsPathOfUrl(form.url, path));
        EXPECT_EQ(path, form.path);
    }
}

TEST(WindowsUrls, OfVerbatimPathsAreThoseOfThePlainOnes) {
    EXPECT_EQ(UrlOfWindowsPath("\\\\?\\C:\\a"), "file:///C:/a");
    EXPECT_EQ(UrlOfWindowsPath("\\\\?\\UNC\\s\\h\\a"), "file://s/h/a");
}

TEST(WindowsUrls, WithoutDriveAndMachineNameNothingHere) {
    for (const char* const url :
         {"file:///mnt/a.mov", "http://a/b", "file:///C%00:/a", "file://a%2Fb/c"}) {
        std::string path = "as before";
        EXPECT_FALSE(WindowsPathOfUrl(url, path)) << url;
        EXPECT_EQ(path, "as before");
    }
}

TEST(WindowsUrls, OfThisMachineByItsNameAreItsOwn) {
    std::string path;
    EXPECT_TRUE(WindowsPathOfUrl("file://localhost/C:/a", path));
    EXPECT_EQ(path, "C:\\a");
}

}  // namespace
