// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/FileUrl.h"

#include <gtest/gtest.h>

namespace {

using namespace host::text;

std::string Decoded(std::string_view url) {
    std::string path = "unchanged";
    return PathOfFileUrl(url, path) ? path : "refused, " + path;
}

TEST(FileUrl, GoesBothWaysForEveryByteOfAName) {
    std::string path = "/";
    for (int byte = 1; byte < 256; ++byte) {
        path.push_back(static_cast<char>(byte));
    }
    EXPECT_EQ(Decoded(FileUrl(path)), path);
}

TEST(FileUrl, EscapesAllButUnreservedCharactersAndSlashes) {
    EXPECT_EQ(FileUrl("/a b/caf\xE9-1.mov"), "file:///a%20b/caf%E9-1.mov");
    EXPECT_EQ(FileUrl("/a\\b%"), "file:///a%5Cb%25");
}

TEST(FileUrl, IsReadWithSmallDigitsAndPlainCharacters) {
    EXPECT_EQ(Decoded("file:///a b%e9"), "/a b\xE9");
    EXPECT_EQ(Decoded("file://localhost/a"), "/a");
}

TEST(FileUrl, IsRefusedWhereItNamesNoFileOfThisMachine) {
    for (const char* const url :
         {"file://", "file://server/a", "file://localhosts/a", "file:/a", "/a", "", "file:///a%",
          "file:///a%4", "file:///a%4g", "file:///a%g4", "file:///a%00b"}) {
        EXPECT_EQ(Decoded(url), "refused, unchanged") << url;
    }
}

TEST(FileUrl, IsKnownByItsScheme) {
    EXPECT_TRUE(IsFileUrl("file:///a"));
    EXPECT_TRUE(IsFileUrl("file://server/a"));
    EXPECT_FALSE(IsFileUrl("file:a"));
    EXPECT_FALSE(IsFileUrl("files"));
}

}  // namespace

TEST(SplitFileUrl, GivesTheMachineAndThePath) {
    std::string machine = "before", path = "before";
    EXPECT_TRUE(host::text::SplitFileUrl("file://server/a%20b/c", machine, path));
    EXPECT_EQ(machine, "server");
    EXPECT_EQ(path, "/a b/c");
    EXPECT_TRUE(host::text::SplitFileUrl("file://localhost/c", machine, path));
    EXPECT_EQ(machine, "") << "this machine";
    EXPECT_TRUE(host::text::SplitFileUrl("file://Server/c", machine, path));
    EXPECT_EQ(machine, "Server") << "as it is written";
}

TEST(SplitFileUrl, KnowsThisMachineInCapitalsToo) {
    for (const char* const url :
         {"file://LOCALHOST/a", "file://Localhost/a", "file://local%48ost/a"}) {
        std::string machine = "before", path;
        EXPECT_TRUE(host::text::SplitFileUrl(url, machine, path)) << url;
        EXPECT_EQ(machine, "") << url;
        EXPECT_EQ(path, "/a") << url;
    }
}

TEST(SplitFileUrl, LeavesBothAloneWhereItFails) {
    std::string machine = "before", path = "before";
    for (const char* const url :
         {"http://a/b", "file://server", "file://", "file:///%zz", "file://%00/a", "file:///%00",
          "file://a%2Fb/c", "file://%2f/c", "/a"}) {
        EXPECT_FALSE(host::text::SplitFileUrl(url, machine, path)) << url;
        EXPECT_EQ(machine + path, "beforebefore") << url;
    }
}
